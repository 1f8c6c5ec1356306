#!/usr/bin/env bash
# Builds the game and its tests for Windows and runs the tests by wine, with a small drive that can be
# full.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. tools/packages.sh

folder=$PWD/build/windows
log=$folder/tests.log
largest=$((4 * 1024 * 1024))

mkdir -p "$folder" || fail "cannot write into $PWD"
require_packages "$folder/install.log" pkg.feltside.windows
./windows || exit 1
for archive in "$folder"/Feltside-*-windows.zip; do
  [ "$(stat -c %s "$archive")" -le $largest ] || fail "$archive is larger than $largest bytes"
done

say 'building the tests'
if ! cmake --preset windows -DFELTSIDE_TESTS=ON >"$log" 2>&1 ||
  ! cmake --build --preset windows >>"$log" 2>&1; then
  say_faults "$log"
  fail 'the build failed'
fi

system_python tools/check_tidy.py build/windows windows_ || fail 'clang-tidy has findings'

# A Windows of its own, that asks for nothing and shows nothing.
export WINEPREFIX=$folder/wine WINEDEBUG=-all WINEDLLOVERRIDES=mscoree,mshtml= LC_ALL=C.UTF-8
unset DISPLAY
stop_wine() { wineserver -k 2>/dev/null; }
trap stop_wine EXIT

# The program itself begins, with nothing but what Windows has.
wanted=$(sed -n 's/^project(.*VERSION \([0-9.]*\).*/Feltside \1/p' CMakeLists.txt)
version=$(wine "$folder/feltside.exe" --version | tr -d '\r')
[ "$version" = "$wanted" ] || fail "the program says \"$version\", not \"$wanted\""
stop_wine

# with_small_drive COMMAND...: runs it in a name space of its own, where the drive is.
with_small_drive() {
  local small=$folder/small as_root=()
  mkdir -p "$small"
  [ "$(id -u)" = 0 ] || as_root=(--map-root-user)
  # shellcheck disable=SC2016 # for the inner shell
  unshare --mount "${as_root[@]}" sh -c \
    'mount -t tmpfs -o size=64k none "$0" && FELTSIDE_SMALL_DRIVE=Z:$0 "$@"' "$small" "$@"
}

with_small_drive true || {
  say 'no small drive can be made here; what happens when it is full is not tried'
  with_small_drive() { "$@"; }
}
with_small_drive ctest --preset windows
