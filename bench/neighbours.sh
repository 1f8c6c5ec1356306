#!/usr/bin/env bash
# Sets the game beside a bare SDL program and other card games, on an X display of its own:
#
#   bench/neighbours.sh [RUNS] [BUILD_FOLDER]
#
# Prints medians of RUNS runs (5): the time until a window is on the display, what is resident once
# the program sleeps, its threads, and how often it woke in ten idle seconds. The others are Debian's
# sgt-puzzles, aisleriot, kpat and ace-of-penguins; one that is not installed is left out.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh
. bench/display.sh

runs=${1:-5}
folder=$(readlink -f "${2:-build/play}")
idle_seconds=10
settle_seconds=3
patience=30 # seconds until there must be a window
programs=("$folder/bench/bare-sdl 3" "$folder/feltside" '/usr/games/sgt-solo' '/usr/games/sol'
  '/usr/games/kpat' '/usr/games/ace-solitaire')

# Of all threads.
switches() {
  awk '/ctxt_switches/ { sum += $2 } END { print sum }' "/proc/$program_pid"/task/*/status
}

# measure PROGRAM NAME: one run; a line of milliseconds, kilobytes, threads and wake-ups to NAME.
measure() {
  local words begin woken shown
  read -r -a words <<<"$1"
  begin=${EPOCHREALTIME/[.,]/}
  "${words[@]}" >/dev/null 2>&1 &
  program_pid=$!
  until xdotool search --onlyvisible --name . >/dev/null 2>&1; do
    if ! kill -0 "$program_pid" 2>/dev/null || [ $((EPOCHSECONDS - begin / 1000000)) -ge $patience ]; then
      end_program
      return 1
    fi
  done
  shown=$(((${EPOCHREALTIME/[.,]/} - begin) / 1000))
  sleep $settle_seconds
  woken=$(switches)
  sleep $idle_seconds
  echo "$shown $(status VmRSS) $(status Threads) $(($(switches) - woken))" >>"$work/$2"
  end_program
}

median() {
  cut -d ' ' -f "$2" "$work/$1" | sort -n |
    awk '{ value[NR] = $1 } END { print value[int((NR + 1) / 2)] }'
}

for needed in Xvfb xdotool; do
  command -v $needed >/dev/null || fail "$needed is needed"
done
# One of the others does not start without a message bus.
if [ -z "${DBUS_SESSION_BUS_ADDRESS:-}" ] && command -v dbus-run-session >/dev/null; then
  exec dbus-run-session -- bench/neighbours.sh "$@" 2>/dev/null
fi
start_display
export XDG_CONFIG_HOME=$work/settings HOME=$work
printf '%-16s %10s %10s %10s %10s\n' program ms kB threads wake-ups
for program in "${programs[@]}"; do
  name=$(basename "${program%% *}")
  [ -x "${program%% *}" ] || continue
  for ((run = 0; run < runs; run++)); do
    measure "$program" "$name" || say "$name shows no window"
  done
  [ ! -s "$work/$name" ] ||
    printf '%-16s %10s %10s %10s %10s\n' "$name" "$(median "$name" 1)" "$(median "$name" 2)" \
      "$(median "$name" 3)" "$(median "$name" 4)"
done
