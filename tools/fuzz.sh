#!/usr/bin/env bash
# Makes up inputs for the fuzz targets, on all processors:
#
#   tools/fuzz.sh [TARGET [SECONDS]]
#
# TARGET is a source of fuzz/ (all of them, one after another), SECONDS how long each is run (60).
# Builds with clang's sanitizers and the standard library's assertions in build/fuzz/. What is found
# new goes to build/fuzz/corpus/TARGET, what breaks something to build/fuzz/found/: put it into
# fuzz/corpus/TARGET under a name that says what it is, and ./check tries it from then on.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh

targets=(profile pictures text names settings commands)
[ -z "${1:-}" ] || targets=("$1")
seconds=${2:-60}
folder=$PWD/build/fuzz

mkdir -p "$folder/found"
build fuzz "$folder/build.log" || {
  say_faults "$folder/build.log"
  exit 1
}
# Thousands of settings' files a minute need no disk.
[ ! -d /dev/shm ] || export TMPDIR=/dev/shm
faults=0
for target in "${targets[@]}"; do
  program=$folder/fuzz/fuzz-$target
  [ -x "$program" ] || fail "no such target: $target (${targets[*]})"
  mkdir -p "$folder/corpus/$target"
  log=$folder/$target.log
  "$program" -fork="$(nproc)" -max_total_time="$seconds" -max_len=2000 -rss_limit_mb=4096 \
    -timeout=60 -ignore_ooms=0 -ignore_timeouts=0 -artifact_prefix="$folder/found/$target-" \
    "$folder/corpus/$target" "fuzz/corpus/$target" >"$log" 2>&1 || faults=1
  say "$target: $(grep -a -o '^#[0-9]*' "$log" | tail -1) inputs in ${seconds} s; log: $log"
done
[ $faults = 0 ] || fail "found something: see $folder/found"
