# What `play` and `check` have in common. Sourced by bash at the top folder of the project.

say() { printf '%s: %s\n' "${0##*/}" "$*"; }
fail() {
  say "$*" >&2
  exit 1
}

# is_there KIND NAME: whether what a line of tools/packages.sh describes is on this machine.
is_there() {
  case $1 in
    command) command -v "$2" ;;
    module) pkg-config --exists "$2" ;;
    header) c++ -fsyntax-only -x c++ -include "$2" /dev/null ;;
    font) ls /usr/share/fonts/truetype/liberation/"$2" || ls /usr/share/fonts/liberation/"$2" ;;
    python) python3 -c "import $2" ;;
    helper) true ;;
  esac >/dev/null 2>&1
}

# absent_packages LIST: the packages of the list that dpkg does not have, asked once for all.
absent_packages() {
  local names installed
  names=$(awk 'NF { print $1 }' <<<"$1")
  # shellcheck disable=SC2086  # the names are words
  installed=$(dpkg-query -W -f '${db:Status-Status} ${Package}\n' $names 2>/dev/null |
    awk '$1 == "installed" { print $2 }')
  grep -vxF -e "$installed" <<<"$names"
}

# absent_things LIST: the packages of the list that bring something that is not there, however it
# may have been installed.
absent_things() {
  local package kind name
  while read -r package kind name; do
    [ -z "$package" ] || is_there "$kind" "$name" || echo "$package"
  done <<<"$1"
}

# install_packages LOG PACKAGE...: as root, or through sudo, which may ask for a password.
install_packages() {
  local log=$1 as_root=()
  shift
  [ "$(id -u)" = 0 ] || as_root=(sudo)
  say "installing $* (log: $log)"
  # Lists that cannot be renewed may still do.
  "${as_root[@]}" apt-get update >"$log" 2>&1
  "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y --no-install-recommends \
    -o DPkg::Lock::Timeout=120 "$@" >>"$log" 2>&1
}

# require_packages LIST LOG: has all that the list names, or ends with the names of what is missing.
require_packages() {
  local list=$1 log=$2 absent why
  if ! command -v dpkg-query >/dev/null || ! command -v apt-get >/dev/null; then
    why='this system has no apt-get'
  else
    absent=$(absent_packages "$list")
    [ -n "$absent" ] || return 0
    # shellcheck disable=SC2086
    if [ "$(id -u)" != 0 ] && ! command -v sudo >/dev/null; then
      why='installing takes root or sudo'
    elif install_packages "$log" $absent; then
      return 0
    else
      why="installing failed (see $log)"
    fi
  fi
  absent=$(absent_things "$list" | tr '\n' ' ')
  say "$why; needed are, by their Debian names: $(awk 'NF { printf "%s ", $1 }' <<<"$list")"
  [ -z "$absent" ] || fail "missing here: $absent"
  say 'all that they bring is here: going on'
}

# build PRESET LOG [OPTION...]: brings build/PRESET up to date, with options for ninja; configures only
# where that has not been done.
build() {
  local preset=$1 log=$2 folder=build/$1
  shift 2
  if ! [ -f "$folder/build.ninja" ] ||
    ! grep -qxF "CMAKE_HOME_DIRECTORY:INTERNAL=$PWD" "$folder/CMakeCache.txt"; then
    cmake --fresh --preset "$preset" >"$log" 2>&1 || return
  fi
  cmake --build --preset "$preset" -- "$@" >>"$log" 2>&1
}
