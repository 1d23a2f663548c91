#!/bin/bash
# Starts a program, waits for its window, does something to it, and expects that this ends the program well.
#
#   use-window.sh PROGRAM TITLE XDOTOOL-ARGUMENT...
#
# Of the arguments the word WINDOW stands for the window.
set -eu

program=$1
title=$2
shift 2
readonly patience=20 # seconds

"$program" &
process=$!
trap 'kill "$process" 2>/dev/null || true' EXIT
window=$(timeout "$patience" xdotool search --sync --onlyvisible --name "^$title\$" | tail -n 1)
xdotool windowfocus --sync "$window" "${@/#WINDOW/$window}"
timeout "$patience" tail --pid="$process" -f /dev/null
wait "$process"
trap - EXIT
