#!/usr/bin/env bash
# Fetches the sources of libraries that an edition is built with, as Debian 12 has them:
#   tools/library_sources.sh NAME...
# The names and versions stand in editions/libraries/sources.txt. What is there already is left alone.
set -u
cd "$(dirname "$(readlink -f "$0")")/.." || exit 1
. tools/common.sh

folder=$PWD/build/libraries
log=$folder/sources.log

# The system's own entries for packages, read as entries for their sources; /etc stays as it is.
write_source_lists() {
  rm -rf "$folder/apt"
  mkdir -p "$folder"/apt/{parts,lists/partial,cache/archives/partial} || return
  sed 's/^deb /deb-src /' /etc/apt/sources.list /etc/apt/sources.list.d/*.list \
    >"$folder/apt/sources.list" 2>/dev/null
  local file
  for file in /etc/apt/sources.list.d/*.sources; do
    [ ! -f "$file" ] || sed 's/^Types:.*/Types: deb-src/' "$file" >"$folder/apt/parts/${file##*/}"
  done
}

# with_sources COMMAND WORD...: one of apt's commands on those entries, with a memory of its own.
with_sources() {
  local command=$1
  shift
  "$command" -o Dir::Etc::SourceList="$folder/apt/sources.list" \
    -o Dir::Etc::SourceParts="$folder/apt/parts" -o Dir::State::Lists="$folder/apt/lists" \
    -o Dir::Cache="$folder/apt/cache" "$@"
}

# download PACKAGE: the newest sources that can be had. A mirror may not have all that its list names.
download() {
  local version newest=
  while read -r version; do
    : "${newest:=$version}"
    with_sources apt-get source "$1=$version" >>"$log" 2>&1 || continue
    [ "$version" = "$newest" ] || say "$1 $newest cannot be had, taking $version"
    return
  done < <(with_sources apt-cache showsrc "$1" | sed -n 's/^Version: //p' | sort -Vru)
  return 1
}

# fetch NAME PACKAGE VERSION: leaves the sources, with Debian's changes made to them, in a folder NAME.
fetch() {
  local name=$1 package=$2 version=$3 work=$folder/fetch-$1 found
  rm -rf "$work"
  mkdir -p "$work" || return
  (cd "$work" && download "$package") || return
  found=$(find "$work" -mindepth 1 -maxdepth 1 -type d)
  [[ ${found##*/} == "$package-$version"* ]] || {
    say "Debian has ${found##*/}, and editions/libraries was written for $version"
    return 1
  }
  printf '%s\n' "$version" >"$found/VERSION-FETCHED"
  rm -rf "${folder:?}/$name"
  mv "$found" "$folder/$name" && rm -r "$work"
}

missing=()
for name in "$@"; do
  wanted=$(grep "^$name " editions/libraries/sources.txt) || fail "no such library: $name"
  read -r _ _ version <<<"$wanted"
  [ "$(cat "$folder/$name/VERSION-FETCHED" 2>/dev/null)" = "$version" ] || missing+=("$wanted")
done
[ ${#missing[@]} != 0 ] || exit 0

say "fetching the sources of ${missing[*]%% *} (log: $log)"
write_source_lists || fail "cannot write into $folder"
# An entry that has no sources is no harm; one that is needed is missed below.
with_sources apt-get update >"$log" 2>&1
for wanted in "${missing[@]}"; do
  # shellcheck disable=SC2086 # three words
  fetch $wanted || fail "the sources of ${wanted%% *} cannot be had (see $log)"
done
rm -r "$folder/apt"
