#!/usr/bin/env bash
# Works the real window at random, on an X display of its own:
#
#   tools/tap_at_random.sh [EVENTS [SEED [BUILD_FOLDER]]]
#
# EVENTS taps, drags, moves, turns of the wheel and keys (10000), the same for the same SEED (1), go to
# the game of BUILD_FOLDER (build/play; build/check has the sanitizers, which take their time). One that
# is left is started again, and it is ended and started now and then. Ends with 1 where the game hangs or
# ended in another way; what it said then is printed.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. bench/display.sh

events=${1:-10000}
seed=${2:-1}
game=$(readlink -f "${3:-build/play}")/feltside
batch=100
batches_a_start=50
ticks=$(getconf CLK_TCK) # in a second of a processor
patience=60 # seconds until there must be a window, or an end

[ -x "$game" ] || fail "there is no $game: build it first"
for needed in Xvfb xdotool; do
  command -v $needed >/dev/null || fail "$needed is not installed"
done

# random_events SEED: a batch of them, as words of xdotool, most of them on the window, which stands in
# the middle of the display. xdotool would wait between the halves of a click.
random_events() {
  awk -v seed="$1" -v count=$batch -v left=270 -v top=60 '
    function within(size) { return int(rand() * size) }
    function place() { return "mousemove " left + within(740) " " top + within(900) }
    function button(number, before_up) { return "mousedown " number before_up " mouseup " number }
    BEGIN {
      srand(seed)
      keys = split("h s d p Return Return space i n plus minus b 1 2 3 4 5 alt+b F10 Up Down Left " \
                   "Right Escape Escape Tab shift+Tab F1 F11 ctrl+n a M y ctrl+a ctrl+c ctrl+v " \
                   "BackSpace Delete Home End Prior Next", key, " ")
      while (count-- > 0) {
        kind = rand()
        if (kind < 0.45) print place() " " button(1)
        else if (kind < 0.55) print place() " " button(1, " " place())
        else if (kind < 0.60) print place() " " button(2 + within(4))
        else if (kind < 0.65) print place()
        else print "key --delay 0 " key[1 + within(keys)]
      }
    }'
}

start_game() {
  "$game" 2>"$work/said" &
  program_pid=$!
  local end=$((SECONDS + patience))
  until xdotool search --onlyvisible --name . >/dev/null 2>&1; do
    kill -0 "$program_pid" 2>/dev/null || fail "the game does not start: $(cat "$work/said")"
    [ $SECONDS -lt $end ] || fail 'no window comes up'
    sleep 0.1
  done
}

# catch_up: gives the game the time to work off what it was sent, until it sleeps or is left. What counts
# is its own time, as others may keep it from the processor.
catch_up() {
  local asleep=0 began='' fields spent
  while [ $asleep -lt 3 ]; do
    { read -r -a fields <"/proc/$program_pid/stat"; } 2>/dev/null || return
    spent=$((fields[13] + fields[14]))
    began=${began:-$spent}
    [ $((spent - began)) -lt $((patience * ticks)) ] ||
      fail "the game finds no end of $batch events after $sent"
    case ${fields[2]} in
      S) asleep=$((asleep + 1)) ;;
      R | D) asleep=0 ;;
      *) return ;;
    esac
    sleep 0.005
  done
}

# end_game: has it leave its dialogs and end, as a person would. One that hangs does not.
end_game() {
  local end=$((SECONDS + patience))
  while kill -0 "$program_pid" 2>/dev/null; do
    [ $SECONDS -lt $end ] || fail "the game does not answer any more after $sent events"
    xdotool mousemove 300 300 key --delay 0 Escape Escape ctrl+q
    sleep 0.1
  done
}

# take_leave: of a game that has ended.
take_leave() {
  wait "$program_pid" || fail "the game ended with $? after $sent events: $(cat "$work/said")"
}

# The help would bring up a browser.
mkdir "$work/bin"
printf '#!/bin/sh\n' >"$work/bin/xdg-open"
chmod +x "$work/bin/xdg-open"
# What the libraries of a desktop keep until the end is no fault of the game.
export ASAN_OPTIONS=detect_leaks=0 PATH=$work/bin:$PATH XDG_CONFIG_HOME=$work/settings
start_display
sent=0
starts=0
batches=0
while [ $sent -lt "$events" ]; do
  start_game
  starts=$((starts + 1))
  # A batch in which the game was left does not count, as a part of it went nowhere.
  for ((turn = 0; turn < batches_a_start; turn++)); do
    batches=$((batches + 1))
    random_events $((seed + batches * batch)) | xdotool - >/dev/null 2>"$work/xdotool" ||
      fail "xdotool cannot send: $(cat "$work/xdotool")"
    catch_up
    kill -0 "$program_pid" 2>/dev/null || break
    sent=$((sent + batch))
  done
  end_game
  take_leave
done
program_pid=
say "$sent events by the seed $seed, $starts starts; the game stands"
