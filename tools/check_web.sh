#!/usr/bin/env bash
# Checks the game as a page of a browser: tools/check_web.sh. The scripts and random play go through
# feltside-stylus in the machine of browsers; then browsers play the page.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. tools/packages.sh

most_bytes=260000

mkdir -p build/node build/check build/web || fail "cannot write into $PWD"
require_packages build/web/install.log pkg.feltside.web
./web --no-serve || exit 1
tools/library_sources.sh freetype png zlib || exit 1
for preset in node check; do
  targets=(feltside-stylus)
  [ $preset = node ] || targets+=(play-tests)
  : >build/$preset/build.log
  build $preset build/$preset/build.log "${targets[@]}" || {
    say_faults build/$preset/build.log
    fail 'the build failed'
  }
done

bytes=0
for file in build/web/site/feltside.{js,wasm}; do
  bytes=$((bytes + $(brotli --quality=11 --lgwin=24 --stdout "$file" | wc -c)))
done
say "script and program take $bytes bytes on the way to a browser"
[ $bytes -lt $most_bytes ] || fail "that is more than $most_bytes"

system_python tools/check_tidy.py build/web web_ || fail 'clang-tidy has findings'
FELTSIDE_STYLUS=$PWD/build/node/feltside-stylus build/check/tests/play-tests --gtest_brief=1 \
  '--gtest_filter=*Scripts*:Seeds/RandomPlay.*/0' || fail 'the game fails in the machine of browsers'
system_python tests/web/web_test.py
