#!/usr/bin/env bash
# play_sessions.sh FOLDER: plays the sessions of tools/sessions/ with the feltside-stylus of a build
# folder, without a display, and names the pictures that they leave in FOLDER/pictures/.
#
# Each session has settings of its own, never the player's.
set -u
build=$(readlink -f "$1") || exit 1
sessions=$(dirname "$(readlink -f "$0")")/sessions
pictures=$build/pictures

rm -rf "$pictures"
mkdir -p "$pictures" || exit 1
for session in "$sessions"/*.stylus; do
  name=$(basename "$session" .stylus)
  answers=$build/session_$name.log
  settings=$build/session_settings/$name
  rm -rf "$settings"
  mkdir -p "$settings/Quillworks" || exit 1
  cp "$sessions/$name.toml" "$settings/Quillworks/Feltside.toml" || exit 1
  (cd "$pictures" && XDG_CONFIG_HOME=$settings "$build/feltside-stylus") <"$session" >"$answers"
  code=$?
  if [ "$code" != 0 ] || grep -q '"error":' "$answers"; then
    grep -o '"error":.*' "$answers" >&2
    echo "The session $name ended with $code; its answers are in $answers" >&2
    exit 1
  fi
done
for picture in "${1%/}"/pictures/*.png; do
  echo "  $picture"
done
