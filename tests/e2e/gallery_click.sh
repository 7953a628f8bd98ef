#!/usr/bin/env bash
# End to end: the gallery in a real window on a private X server, driven with real X input.
# It finds controls through --dump-tree, clicks them with xdotool and looks for their messages
# in the --log file; then it asks the gallery to quit and expects a clean exit.
# usage: gallery_click.sh path/to/globkit-gallery
# Exits 77 (skipped) only when Xvfb or xdotool cannot be run at all.
set -u

gallery="${1:?usage: gallery_click.sh path/to/globkit-gallery}"
readonly SKIP=77
readonly TIMEOUT_S=30

for tool in Xvfb xdotool; do
  if ! command -v "$tool" >/dev/null 2>&1; then
    echo "SKIP: $tool is not installed (tools/bootstrap installs it)"
    exit $SKIP
  fi
done

work="$(mktemp -d)"
xvfb_pid=""
gallery_pid=""

cleanup() {
  for pid in "$gallery_pid" "$xvfb_pid"; do
    if [ -n "$pid" ] && kill -0 "$pid" 2>/dev/null; then
      kill "$pid" 2>/dev/null
      for _ in $(seq 50); do kill -0 "$pid" 2>/dev/null || break; sleep 0.1; done
      kill -9 "$pid" 2>/dev/null
    fi
  done
  wait 2>/dev/null
  rm -rf "$work"
}
trap cleanup EXIT

fail() {
  echo "FAIL: $*"
  for f in gallery.err log tree.json; do
    [ -s "$work/$f" ] && { echo "--- $f"; head -c 4000 "$work/$f"; echo; }
  done
  exit 1
}

# Polls `condition` (a command) every 0.1 s until it succeeds or the timeout passes.
wait_for() {
  local what="$1"
  shift
  local deadline=$((SECONDS + TIMEOUT_S))
  until "$@"; do
    [ $SECONDS -lt $deadline ] || fail "timed out waiting for $what"
    if [ -n "$gallery_pid" ] && ! kill -0 "$gallery_pid" 2>/dev/null; then
      fail "the gallery exited while waiting for $what"
    fi
    sleep 0.1
  done
}

# --- A private X server on a free display (Xvfb picks the number and tells us) ---
Xvfb -displayfd 3 -screen 0 1280x900x24 -nolisten tcp 3>"$work/display" 2>"$work/xvfb.err" &
xvfb_pid=$!
deadline=$((SECONDS + TIMEOUT_S))
until [ -s "$work/display" ]; do
  if ! kill -0 "$xvfb_pid" 2>/dev/null || [ $SECONDS -ge $deadline ]; then
    echo "SKIP: Xvfb cannot run here: $(head -c 500 "$work/xvfb.err")"
    xvfb_pid=""
    exit $SKIP
  fi
  sleep 0.1
done
export DISPLAY=":$(head -n1 "$work/display")"
if ! xdotool getmouselocation >/dev/null 2>&1; then
  echo "SKIP: xdotool cannot reach the X server"
  exit $SKIP
fi

# The gallery keeps its panel layout beside the preferences: a folder of this run's own.
export XDG_CONFIG_HOME="$work/config"

# --- The gallery in a window ---
# Xvfb has no GPU: SDL draws in software instead of through Mesa's GL emulation, whose driver
# is unloaded at exit and so hides its own allocations from the leak checker's suppressions.
SDL_VIDEODRIVER=x11 SDL_RENDER_DRIVER=software SDL_FRAMEBUFFER_ACCELERATION=0 "$gallery" --size 1100x760 --log "$work/log" --dump-tree \
  >"$work/tree.json" 2>"$work/gallery.err" &
gallery_pid=$!

tree_done() { grep -q '^}$' "$work/tree.json" 2>/dev/null; }
wait_for "the Glob tree" tree_done
window_found() {
  window="$(xdotool search --name '^globkit gallery$' 2>/dev/null | head -n1)"
  [ -n "$window" ]
}
wait_for "the gallery window" window_found
grep -q '"width": 1100, "height": 760' "$work/tree.json" || fail "window size not as asked"

# Pages are built when first shown: where the Buttons page's controls stand comes from a
# headless run of the same size that starts on that page.
"$gallery" --headless --size 1100x760 --page Buttons --dump-tree >"$work/buttons.json" 2>/dev/null ||
  fail "no tree of the Buttons page"

# The centre of the Glob whose line in the tree has `kind` and `name`, as "X Y".
centre_of() {
  local line
  line="$(grep -hF "\"kind\": \"$1\", \"name\": \"$2\"" "$work/tree.json" "$work/buttons.json" | head -n1)"
  [ -n "$line" ] || return 1
  echo "$line" | sed -E 's/.*"rect": \[([0-9-]+), ([0-9-]+), ([0-9]+), ([0-9]+)\].*/\1 \2 \3 \4/' |
    awk '{ printf "%d %d\n", $1 + $3 / 2, $2 + $4 / 2 }'
}

click_on() {
  local xy
  xy="$(centre_of "$1" "$2")" || fail "no $1 named '$2' in the tree"
  # shellcheck disable=SC2086
  xdotool mousemove --window "$window" $xy click 1
}

logged() { grep -qF -- "$1" "$work/log" 2>/dev/null; }

# 1. A tab of the pages dialogue: the gallery logs the dialogue's report.
click_on tab "Buttons"
wait_for "the Buttons tab's report" logged 'Gallery  lazytabbeddialogue "Pages"  "TabChanged"'
click_on button "Apply"
wait_for "the Apply button's report" logged 'Buttons  button "Apply"  "apply"'
click_on button "Mute"
wait_for "the latching button's report" logged 'Buttons  button "Mute"  "mute on"'

# 2. Back to the foundation page, then a tile on it reports to its page.
click_on tab "Foundation"
wait_for "the Foundation page" logged 'Buttons  button "Mute"  "mute on"'
click_on tile "Queued message"
wait_for "the tile's message" logged 'Foundation  tile "Queued message"  "queued hello"'

# 3. Keys typed into the key probe arrive with the library's codes.
click_on keyprobe "Key probe"
sleep 0.2
xdotool key ctrl+c Left
xdotool type 'q'
wait_for "Ctrl+C" logged '"key 0x22000043 Ctrl+C"'
wait_for "Left" logged '"key 0x0800004B Left"'
wait_for "a typed character" logged '"key 0x00000071 q"'

# 4. The floating panel, dragged for real by its title strip (left of its pin button).
panel_at() {
  grep -hF '"kind": "standard_panel", "name": "Drag and drop"' "$1" | head -n1 |
    sed -E 's/.*"rect": \[([0-9-]+), ([0-9-]+), .*/\1 \2/'
}
read -r px py <<<"$(panel_at "$work/tree.json")"
[ -n "${py:-}" ] || fail "no drag and drop panel in the tree"
sx=$((px + 60))
sy=$((py + 14))
xdotool mousemove --window "$window" $sx $sy
sleep 0.1
xdotool mousedown 1
for step in 1 2 3 4 5; do
  xdotool mousemove --window "$window" $((sx - step * 40)) $((sy - step * 30))
  sleep 0.05
done
xdotool mouseup 1
sleep 0.2

# --- Quit as a window manager would ask; the gallery must exit cleanly ---
kill -TERM "$gallery_pid"
deadline=$((SECONDS + TIMEOUT_S))
while kill -0 "$gallery_pid" 2>/dev/null; do
  [ $SECONDS -lt $deadline ] || fail "the gallery did not quit"
  sleep 0.1
done
wait "$gallery_pid"
status=$?
gallery_pid=""
[ $status -eq 0 ] || fail "the gallery exited with status $status"

# 5. The panel's new place was saved on the way out and is where a new start puts it.
[ -s "$work/config/globkit/gallery-layout" ] || fail "no saved layout"
"$gallery" --headless --size 1100x760 --dump-tree >"$work/again.json" 2>"$work/gallery.err" ||
  fail "no tree from the restart"
read -r qx qy <<<"$(panel_at "$work/again.json")"
[ "$qx $qy" = "$((px - 200)) $((py - 150))" ] ||
  fail "the panel was at $px $py, dragged by -200 -150, and came back at $qx $qy"

echo "PASS: $(wc -l <"$work/log") messages logged"
exit 0
