#!/bin/bash
# The gallery in a real window, clicked with the mouse, does and shows the same as on the simulated desktop.
#
#   gallery-agrees.sh GALLERY DIRECTORY
#
# Leaves both pictures, and both lists of messages, in the directory.
set -eu

gallery=$1
work=$2
readonly patience=200 # tenths of a second

rm -rf "$work"
mkdir -p "$work"
cd "$work"

fail() {
    echo "gallery-agrees: $*" >&2
    exit 1
}
for tool in xdotool import compare python3; do
    command -v "$tool" >/dev/null || fail "$tool is missing"
done

# The middle of the first oval button, in the window's coordinates.
echo "dump tree.json" >dump.script
"$gallery" --page push-buttons --scale 1 --script dump.script
read -r h v < <(python3 - <<'END'
import json

def first_oval(panes, top, left):
    for pane in panes:
        t, l, b, r = pane["box"]
        if pane["class"] == "OvalButtonPane":
            return (left + (l + r) // 2, top + (t + b) // 2)
        found = first_oval(pane.get("panes", []), top + t, left + l)
        if found:
            return found

print(*first_oval(json.load(open("tree.json"))["panes"], 0, 0))
END
)

# The pause lets the button come up again before the picture is taken.
printf 'click %d %d\nwait 1\nsnapshot simulated.png\n' "$h" "$v" >click.script
"$gallery" --page push-buttons --scale 1 --script click.script --messages simulated.jsonl

"$gallery" --page push-buttons --scale 1 --messages real.jsonl &
program=$!
trap 'kill "$program" 2>/dev/null || true' EXIT
window=$(timeout 20 xdotool search --sync --onlyvisible --name '^Glog Panes' | tail -n 1) || fail "no window appeared"
xdotool windowfocus --sync "$window" mousemove --window "$window" "$h" "$v" click 1

messages() { sed -E 's/"time":[^,]*,//' "$1"; }
agree() {
    import -silent -window "$window" real.png &&
        [ "$(compare -metric AE real.png simulated.png null: 2>&1)" = 0 ] &&
        [ "$(messages real.jsonl)" = "$(messages simulated.jsonl)" ]
}
for ((i = 0; i < patience; ++i)); do
    agree && break
    sleep 0.1
done
[ "$(messages real.jsonl)" = "$(messages simulated.jsonl)" ] ||
    fail "the messages differ: $(diff <(messages simulated.jsonl) <(messages real.jsonl) || true)"
grep -q '"message":"GlogButtonPressed"' real.jsonl || fail "the button did not report that it was pressed"
agree || fail "the pictures differ in $(compare -metric AE real.png simulated.png null: 2>&1) pixels: $work/real.png, simulated.png"

kill -TERM "$program"
wait "$program" || fail "the gallery ended with status $?"
trap - EXIT
echo "The window and the simulated desktop agree on $(grep -c . real.jsonl) messages and every pixel."
