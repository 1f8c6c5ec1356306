#!/usr/bin/env bash
# Measures the game's start, size and sleep on an X display of its own:
#
#   bench/start.sh [RUNS] [BUILD_FOLDER]
#
# Start is from the launch until the first frame has reached the display, size is what is resident
# once the program sleeps: medians of RUNS runs (11), by turns with a bare SDL program that has the
# same hints and window. Then it plays 20 deals by keyboard and looks at how the game sleeps, at
# the title and in the middle of a hand. Ends with 1 where a bound is not held.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. bench/display.sh

runs=${1:-11}
folder=$(readlink -f "${2:-build/play}")
multiple=3 # of the picture's pixels: what the game chooses on a display of this size
most_start_percent=130
most_kilobytes=$((15 * 1024))
deals=20
idle_seconds=10

game=$folder/feltside
held=0

# launch PROGRAM...: starts it and gives it the time to fall asleep.
launch() {
  "$@" &
  program_pid=$!
  sleep 0.7
}
processor_ticks() { awk '{ print $14 + $15 }' "/proc/$program_pid/stat"; }
switches() { echo $(($(status voluntary_ctxt_switches) + $(status nonvoluntary_ctxt_switches))); }

# measure NAME PROGRAM...: one start, noted in NAME.start (microseconds), and one size, noted in
# NAME.size (kilobytes).
measure() {
  local name=$1 begin
  shift
  begin=${EPOCHREALTIME/[.,]/}
  LD_PRELOAD=$folder/bench/libfirst-frame.so FIRST_FRAME_FILE=$work/frame launch "$@"
  until [ -s "$work/frame" ]; do
    kill -0 "$program_pid" 2>/dev/null || fail "$1 ended before its first frame"
    sleep 0.1
  done
  end_program
  echo $(($(cat "$work/frame") - begin)) >>"$work/$name.start"
  rm "$work/frame"
  launch "$@"
  status VmRSS >>"$work/$name.size"
  end_program
}
median() { sort -n "$work/$1" | awk '{ value[NR] = $1 } END { print value[int((NR + 1) / 2)] }'; }

# bound WHAT VALUE MOST
bound() {
  local verdict=held
  if [ "$2" -gt "$3" ]; then
    verdict='NOT HELD'
    held=1
  fi
  printf '%-46s %8s   at most %6s   %s\n' "$1" "$2" "$3" "$verdict"
}

compare() {
  local turn percent
  for ((turn = 0; turn < runs; turn++)); do
    measure bare "$folder/bench/bare-sdl" $multiple
    measure game "$game"
  done
  percent=$((100 * $(median game.start) / $(median bare.start)))
  say "medians of $runs runs: bare $(median bare.start) us and $(median bare.size) kB," \
    "game $(median game.start) us and $(median game.size) kB"
  bound 'start in percent of the bare one' $percent $most_start_percent
  bound 'resident at the title (kB)' "$(median game.size)" $most_kilobytes
}

# sleeps WHERE: bounds what the game does while nobody asks it for anything.
sleeps() {
  local ticks woken
  ticks=$(processor_ticks)
  woken=$(switches)
  sleep $idle_seconds
  bound "processor ticks in $idle_seconds s, $1" $(($(processor_ticks) - ticks)) 0
  bound "wake-ups in $idle_seconds s, $1" $(($(switches) - woken)) 0
}

# Every key that the moment does not allow does nothing, so that these do for any hand.
play() {
  local deal
  for ((deal = 0; deal < deals; deal++)); do
    xdotool key --delay 60 Return n h s s
    sleep 1.2
  done
}

use() {
  launch "$game"
  sleeps 'at the title'
  xdotool mousemove 640 600
  play
  xdotool key Return
  sleep 0.5
  sleeps 'in a hand'
  bound "resident after $deals deals (kB)" "$(status VmRSS)" $most_kilobytes
  bound threads "$(status Threads)" 1
  end_program
}

for needed in Xvfb xdotool; do
  command -v $needed >/dev/null || fail "$needed is needed"
done
cmake --build "$folder" --target feltside bare-sdl first-frame >"$work/build.log" 2>&1 ||
  fail "the build failed: $(cat "$work/build.log")"
start_display
export XDG_CONFIG_HOME=$work/settings
mkdir -p "$XDG_CONFIG_HOME/Quillworks"
printf '[Settings]\nPLAYSPEED = 2\n' >"$XDG_CONFIG_HOME/Quillworks/Feltside.toml"
compare
use
exit $held
