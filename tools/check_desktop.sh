#!/usr/bin/env bash
# Checks what the game brings to a desktop: its entry, its description, its manual pages, and that its
# icon is there in each size. Needs desktop-file-utils, appstream and mandoc.
set -u
cd "$(dirname "$(readlink -f "$0")")/../editions/desktop" || exit 1
faults=0
desktop-file-validate feltside.desktop || faults=1
said=$(appstreamcli validate --no-net --pedantic ./*.metainfo.xml 2>&1) || {
  echo "$said"
  faults=1
}
version=$(sed -n 's/^project(Feltside VERSION \([0-9.]*\).*/\1/p' ../../CMakeLists.txt)
for file in ./*.metainfo.xml ../../debian/changelog; do
  grep -qF -e "release version=\"$version\"" -e "feltside ($version)" "$file" || {
    echo "$file does not name the version $version"
    faults=1
  }
done
# The pages refer to each other and are not installed yet.
said=$(mandoc -T lint ./*.6 2>&1 | grep -v 'referenced manual not found: Xr feltside')
[ -z "$said" ] || {
  echo "$said"
  faults=1
}
for size in 16 22 24 32 48 64 128 256; do
  [ -f icons/feltside_$size.png ] || {
    echo "There is no icon of $size pixels."
    faults=1
  }
done
exit $faults
