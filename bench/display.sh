# shellcheck shell=bash
# An X display of their own for the programs that are measured, one at a time. Sourced by the scripts
# here, which use tools/common.sh.

work=$(mktemp -d)
display_pid=
program_pid=

end_program() {
  [ -z "$program_pid" ] || { kill "$program_pid" && wait "$program_pid"; } 2>/dev/null
  program_pid=
}

clean_up() {
  end_program
  [ -z "$display_pid" ] || { kill "$display_pid" && wait "$display_pid"; } 2>/dev/null
  rm -rf "$work"
}
trap clean_up EXIT

# start_display: returns once there is one, in DISPLAY.
start_display() {
  Xvfb -noreset -displayfd 5 -screen 0 1280x1024x24 -nolisten tcp 5>"$work/display" 2>"$work/xvfb.log" &
  display_pid=$!
  until [ -s "$work/display" ]; do
    kill -0 "$display_pid" 2>/dev/null || fail "Xvfb does not start: $(cat "$work/xvfb.log")"
    sleep 0.1
  done
  DISPLAY=:$(cat "$work/display")
  export DISPLAY
}

status() { awk -v name="$1:" '$1 == name { print $2 }' "/proc/$program_pid/status"; }
