#!/usr/bin/env bash
# Checks that stored pictures are those that would be made now, byte for byte:
#
#   check_pictures.sh art            those that art/make.py makes of its sources
#   check_pictures.sh game STYLUS    the album and those of the help, played with that program
#
# All is made anew in a copy, so that a picture which nothing makes any more is found as well. What was
# found right is not made again until something that it rests on changes: the sources, what is stored,
# the program or the library of pictures.
set -u
kind=$1
stylus=$(readlink -f "${2:-/dev/null}")
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh

case $kind in
  art)
    sources=(art)
    results=(art/contact_sheet.png shell/res editions)
    ;;
  game)
    sources=(tools shell/res)
    results=(docs help/pictures)
    ;;
  *) fail "no such pictures: $kind" ;;
esac

# all_that_it_rests_on: a mark that changes with each of it. The program's libraries lie beside it.
all_that_it_rests_on() {
  {
    cat "$stylus" "$(dirname "$stylus")"/*.so tools/check_pictures.sh 2>/dev/null
    find "${sources[@]}" "${results[@]}" -name __pycache__ -prune -o -type f -print0 | sort -z |
      xargs -0 sha256sum
    system_python -c 'import PIL, sys; print(sys.version, PIL.__version__)'
  } | sha256sum
}

make_pictures() {
  case $kind in
    art) system_python art/make.py ;;
    game)
      system_python tools/make_album.py --stylus "$stylus" &&
        system_python tools/make_help_pictures.py "$stylus"
      ;;
  esac >"$copy/log" 2>&1 || {
    cat "$copy/log"
    return 1
  }
}

mark_file=build/check/pictures_$kind.mark
mark=$(all_that_it_rests_on) || exit 1
if [ -f "$mark_file" ] && [ "$(cat "$mark_file")" = "$mark" ]; then
  say 'unchanged since they were found right'
  exit 0
fi

copy=$(mktemp -d) || exit 1
trap 'rm -rf "$copy"' EXIT
tar -c --exclude=__pycache__ "${sources[@]}" "${results[@]}" | tar -x -C "$copy"
# Those of a browser are as its version draws them.
find "${results[@]/#/$copy/}" -name '*.png' ! -path '*/album/browser/*' -delete
(cd "$copy" && make_pictures) || fail 'they cannot be made'
faults=0
for result in "${results[@]}"; do
  diff -rq -x __pycache__ "$result" "$copy/$result" || faults=1
done
[ $faults = 0 ] || fail 'these are not what would be made now'
echo "$mark" >"$mark_file"
