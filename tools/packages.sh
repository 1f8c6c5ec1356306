# shellcheck shell=bash
# What to install, read from where it stands: debian/control. Sourced by bash at the top folder of the
# project.

# packages PROFILE...: the packages that are needed with these build profiles, and by the game itself.
packages() {
  awk -v profiles=" $* " '
    # Whether all words of a group such as "nocheck !pkg.feltside.play" hold.
    function holds(group, words, i, count) {
      count = split(group, words, " ")
      for (i = 1; i <= count; i++)
        if ((index(profiles, " " substr(words[i], 1 + (words[i] ~ /^!/)) " ") > 0) == (words[i] ~ /^!/))
          return 0
      return 1
    }
    /^[^ ]/ { in_list = /^(Build-)?Depends:/ }
    in_list && /^ [^$]/ {
      name = $1
      sub(/,$/, "", name)
      count = split($0, groups, "<")
      wanted = count == 1
      for (i = 2; i <= count; i++) {
        sub(/>.*/, "", groups[i])
        if (holds(groups[i])) wanted = 1
      }
      if (wanted) print name
    }' debian/control
}

# absent_packages PACKAGE...: those that dpkg does not have.
absent_packages() {
  local installed
  installed=$(dpkg-query -W -f '${db:Status-Status} ${Package}\n' "$@" 2>/dev/null |
    awk '$1 == "installed" { print $2 }')
  printf '%s\n' "$@" | grep -vxF -e "$installed"
}

# install_packages LOG PACKAGE...: as root, or through sudo, which may ask for a password.
install_packages() {
  local log=$1 as_root=()
  shift
  [ "$(id -u)" = 0 ] || as_root=(sudo)
  say "installing $* (log: $log)"
  # Lists that cannot be renewed may still do.
  "${as_root[@]}" apt-get update >"$log" 2>&1
  "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y --no-install-recommends \
    -o DPkg::Lock::Timeout=120 "$@" >>"$log" 2>&1
}

# require_packages LOG PROFILE...: installs what is missing of the packages for these profiles. Where
# that cannot be done they are named, and it is left to the build to say what it does not find.
require_packages() {
  local log=$1 needed absent why
  shift
  mapfile -t needed < <(packages "$@")
  if ! command -v dpkg-query >/dev/null || ! command -v apt-get >/dev/null; then
    say "this system has no apt-get; needed are, by their Debian names: ${needed[*]}"
    return
  fi
  mapfile -t absent < <(absent_packages "${needed[@]}")
  [ ${#absent[@]} != 0 ] || return 0
  if [ "$(id -u)" != 0 ] && ! command -v sudo >/dev/null; then
    why='installing takes root or sudo'
  elif install_packages "$log" "${absent[@]}"; then
    return 0
  else
    why="installing failed (see $log)"
  fi
  say "$why; not installed are ${absent[*]}; going on with what is here"
}
