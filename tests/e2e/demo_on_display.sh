#!/usr/bin/env bash
# The demo on a real (virtual) X display: a tab dragged with X pointer events onto another frame's
# right edge makes a new frame there, the ` key maximises the frame under the pointer, and a SIGTERM
# makes the demo save on its way out. Skipped
# (exit 77) where xvfb-run or xdotool is missing. Usage: demo_on_display.sh path/to/orvdemo
set -euo pipefail
demo="$1"
if ! command -v xvfb-run >/dev/null || ! command -v xdotool >/dev/null; then
    echo "xvfb-run or xdotool missing: skipped"
    exit 77
fi
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
export DEMO="$demo" WORK="$work"
# The display process's libraries (X11, D-Bus, loaded and unloaded by SDL) keep allocations that no
# code of ours owns; leaks of our own code are the headless tests' business.
export ASAN_OPTIONS="${ASAN_OPTIONS:+$ASAN_OPTIONS:}detect_leaks=0"

xvfb-run -a -s "-screen 0 1920x1080x24" bash -c '
    set -euo pipefail
    "$DEMO" --prefs "$WORK/prefs" --out "$WORK/out" --describe "$WORK/where.txt" >"$WORK/demo.log" 2>&1 &
    pid=$!
    for _ in $(seq 100); do [ -s "$WORK/where.txt" ] && break; sleep 0.1; done
    if [ ! -s "$WORK/where.txt" ]; then echo "the demo never came up"; cat "$WORK/demo.log"; exit 1; fi
    grep -q "running on the display" "$WORK/demo.log" || { echo "the demo did not take the display"; cat "$WORK/demo.log"; exit 1; }
    read -r _ _ tx ty < <(grep "^tab info " "$WORK/where.txt")
    read -r _ _ left top width height < <(grep "^frame source " "$WORK/where.txt")
    # Inside the right edge band of the source monitor, half way down.
    dx=$((left + width - 20)); dy=$((top + height / 2))
    xdotool mousemove "$tx" "$ty"; sleep 0.2
    xdotool mousedown 1; sleep 0.2
    for step in 1 2 3 4 5 6 7 8; do
        xdotool mousemove $((tx + (dx - tx) * step / 8)) $((ty + (dy - ty) * step / 8)); sleep 0.1
    done
    sleep 0.3
    xdotool mouseup 1; sleep 0.5
    read -r _ _ left top width height < <(grep "^frame timeline " "$WORK/where.txt")
    xdotool mousemove $((left + width / 2)) $((top + height / 2)); sleep 0.2
    xdotool key grave; sleep 0.5
    kill -TERM "$pid"
    wait "$pid"
'

saved="$(grep -l "<ustring>Editing</ustring>" "$work"/prefs/SavedWorkspaces/*.xml | head -1)"
if [ -z "$saved" ]; then
    echo "no saved Editing workspace"
    exit 1
fi
frames="$(grep -o "<key>Frame</key>" "$saved" | wc -l)"
echo "frames saved: $frames"
# Editing starts with five frames; the drop makes a sixth, for the info panel alone.
[ "$frames" -eq 6 ]
grep -q "<key>MaxFramePath</key>" "$saved" || { echo "no frame was maximised"; exit 1; }
