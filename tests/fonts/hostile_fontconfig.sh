#!/usr/bin/env bash
# Runs test binaries under a hostile user font configuration (hostile-fonts.conf.in beside this
# script): the library's text, golden images included, must look the same as without it.
# GLOBKIT_HOSTILE_FONT_ROOT may name an unpacked font package to add, for example
#   apt-get download fonts-urw-base35 && dpkg -x fonts-urw-base35_*.deb /tmp/urw
# Installed ghostscript fonts are picked up through the system configuration anyway.
# usage: hostile_fontconfig.sh test-binary...
set -u
here="$(cd "$(dirname "$0")" && pwd)"
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT

root="${GLOBKIT_HOSTILE_FONT_ROOT:-$work/no-fonts}"
mkdir -p "$work/cache" "$work/no-fonts"
sed -e "s|@WORK@|$work|g" -e "s|@FONT_ROOT@|$root|g" "$here/hostile-fonts.conf.in" >"$work/fonts.conf"
export FONTCONFIG_FILE="$work/fonts.conf"
export XDG_CACHE_HOME="$work/cache"
unset FONTCONFIG_PATH

# The configuration must bite, or passing proves nothing.
if command -v fc-match >/dev/null; then
  mono="$(fc-match -f '%{family[0]}' courier)"
  aa="$(fc-match -f '%{antialias}' 'DejaVu Sans')"
  echo "hostile configuration: courier is '$mono', anti-aliasing '$aa'"
  [ "$mono" != "DejaVu Sans Mono" ] || { echo "FAIL: courier still resolves to DejaVu Sans Mono"; exit 1; }
  [ "$aa" = "False" ] || { echo "FAIL: anti-aliasing is not turned off"; exit 1; }
fi

status=0
for binary in "$@"; do
  GLOBKIT_GOLDEN_OUT="${GLOBKIT_GOLDEN_OUT:-$PWD/golden-out-hostile}" "$binary" --gtest_brief=1 ||
    status=1
done
exit $status
