#!/usr/bin/env bash
# The gallery without a display: every page is built, painted and written as a PNG, and the
# tree dump is well formed enough for line tools.
# usage: gallery_headless.sh path/to/globkit-gallery
set -u
gallery="${1:?usage: gallery_headless.sh path/to/globkit-gallery}"
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT

fail() {
  echo "FAIL: $*"
  exit 1
}

env -u DISPLAY -u WAYLAND_DISPLAY "$gallery" --size 900x640 --screenshot "$work/shots" \
  >"$work/paths" 2>"$work/err" || fail "screenshots: status $? $(cat "$work/err")"
[ "$(wc -l <"$work/paths")" -eq 12 ] || fail "expected 12 pages, got: $(cat "$work/paths")"
while read -r png; do
  [ -s "$png" ] || fail "$png is missing or empty"
  [ "$(head -c 8 "$png" | od -An -tx1 | tr -d ' \n')" = "89504e470d0a1a0a" ] || fail "$png is no PNG"
done <"$work/paths"
grep -q "page-check-boxes-radio-sets.png" "$work/paths" || fail "page names not as expected"

"$gallery" --headless --size 900x640 --dump-tree >"$work/tree.json" 2>"$work/err" ||
  fail "tree dump: status $?"
grep -q '"window": {"width": 900, "height": 640' "$work/tree.json" || fail "no window size"
[ "$(grep -c '"kind": "tab"' "$work/tree.json")" -eq 12 ] || fail "expected 12 page tabs"
grep -q '"kind": "gallerypage", "name": "Foundation".*"visible": true' "$work/tree.json" ||
  fail "the first page is not shown"
grep -q '"kind": "gallerypage", "name": "Panels"' "$work/tree.json" &&
  fail "a later page is built before its tab is chosen"

env -u DISPLAY -u WAYLAND_DISPLAY "$gallery" --size 900x640 --palette light \
  --screenshot "$work/light" >"$work/light-paths" 2>"$work/err" ||
  fail "light screenshots: status $? $(cat "$work/err")"
[ "$(wc -l <"$work/light-paths")" -eq 12 ] || fail "expected 12 light pages"
cmp -s "$work/shots/page-buttons.png" "$work/light/page-buttons.png" &&
  fail "the light palette drew the dark pages"
"$gallery" --headless --palette sepia >/dev/null 2>&1
[ $? -eq 2 ] || fail "an unknown palette is not refused"

"$gallery" --size 10x10 >/dev/null 2>&1
[ $? -eq 2 ] || fail "a bad size is not refused"
echo "PASS"
