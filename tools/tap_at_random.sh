#!/usr/bin/env bash
# Works the real window at random, on an X display of its own:
#
#   tools/tap_at_random.sh [EVENTS [SEED [BUILD_FOLDER]]]
#
# EVENTS taps, drags, moves, turns of the wheel and keys (10000), the same for the same SEED (1), go to
# the game of BUILD_FOLDER (build/check, which has the sanitizers). One that is left is started again.
# Ends with 1 where the game ended in another way; what it said then is printed.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. bench/display.sh

events=${1:-10000}
seed=${2:-1}
game=$(readlink -f "${3:-build/check}")/feltside
batch=200
patience=30 # seconds until there must be a window

[ -x "$game" ] || fail "there is no $game: build it first"
for needed in Xvfb xdotool; do
  command -v $needed >/dev/null || fail "$needed is not installed"
done

# random_events SEED: a batch of them, as words of xdotool.
random_events() {
  awk -v seed="$1" -v count=$batch '
    function within(size) { return int(rand() * size) }
    function place() { return "mousemove " within(740) " " within(900) }
    BEGIN {
      srand(seed)
      keys = split("h s d p Return Return space i n plus minus b 1 2 3 4 5 alt+b F10 Up Down Left " \
                   "Right Escape Escape Tab shift+Tab F1 F11 ctrl+n a M eacute ctrl+a ctrl+c ctrl+v " \
                   "BackSpace Delete Home End Prior Next", key, " ")
      while (count-- > 0) {
        kind = rand()
        if (kind < 0.45) print place() " click 1"
        else if (kind < 0.55) print place() " mousedown 1 " place() " mouseup 1"
        else if (kind < 0.60) print place() " click " 2 + within(4)
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

# The help would bring up a browser.
mkdir "$work/bin"
printf '#!/bin/sh\n' >"$work/bin/xdg-open"
chmod +x "$work/bin/xdg-open"
# What the libraries of a desktop keep until the end is no fault of the game.
export ASAN_OPTIONS=detect_leaks=0 PATH=$work/bin:$PATH XDG_CONFIG_HOME=$work/settings
start_display
start_game
sent=0
starts=1
while [ $sent -lt "$events" ]; do
  random_events $((seed + sent)) | xdotool - >/dev/null 2>&1
  sent=$((sent + batch))
  kill -0 "$program_pid" 2>/dev/null && continue
  wait "$program_pid" || fail "the game ended with $? after $sent events: $(cat "$work/said")"
  start_game
  starts=$((starts + 1))
done
xdotool key Escape key Escape
kill -0 "$program_pid" 2>/dev/null || fail "the game is gone: $(cat "$work/said")"
say "$sent events by the seed $seed, $starts starts; the game stands"
