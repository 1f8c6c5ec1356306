#!/usr/bin/env bash
# Checks the scripts themselves: what shellcheck and flake8 have to say of each. Needs both.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh

# Scripts of the shell are known by their first line, or by their name where they are only sourced.
mapfile -t shell_scripts < <(
  find . \( -path ./build -o -path ./.git \) -prune -o -type f -print0 |
    xargs -0 awk 'FNR == 1 { if (/^#!.*sh$/ || /^# shellcheck shell/) print FILENAME; nextfile }'
)
[ ${#shell_scripts[@]} != 0 ] || fail 'found no scripts'
faults=0
shellcheck -x "${shell_scripts[@]}" || faults=1
system_python -m flake8 --exclude build || faults=1
say "${#shell_scripts[@]} scripts of the shell, $(find . -name '*.py' -not -path './build/*' | wc -l) of Python"
exit $faults
