# shellcheck shell=bash
# What the commands at the top folder have in common. Sourced by bash there.

say() { printf '%s: %s\n' "${0##*/}" "$*"; }
fail() {
  say "$*" >&2
  exit 1
}

# build PRESET LOG [OPTION...]: brings build/PRESET up to date, with options for ninja; configures only
# where that has not been done, or for another preset than is there now.
build() {
  local preset=$1 log=$2 folder=build/$1
  shift 2
  if ! [ -f "$folder/build.ninja" ] || [ CMakePresets.json -nt "$folder/CMakeCache.txt" ] ||
    ! grep -qxF "CMAKE_HOME_DIRECTORY:INTERNAL=$PWD" "$folder/CMakeCache.txt"; then
    cmake --fresh --preset "$preset" >"$log" 2>&1 || return
  fi
  cmake --build --preset "$preset" -- "$@" >>"$log" 2>&1
}

# say_faults LOG: the first things that went wrong, by the log of a build.
say_faults() {
  grep -E -A 3 -m 8 'error:|Error|FAILED|not found' "$1" >&2
  say "all that was said is in $1" >&2
}

# system_python WORD...: the Python that the system's packages are for, which need not be the first in
# the path.
system_python() {
  local python=/usr/bin/python3
  [ -x $python ] || python=python3
  $python "$@"
}
