// What glogview was asked to do.
#pragma once
#include "desktop/Desktop.h"
#include <string>

struct CommandLine {
    std::string dialog;
    std::string png, script, messages, trace, dump; // paths; empty: not asked for
    bool watch = false;
    DesktopOptions desktop;

    // Whether this runs without a display.
    bool IsSimulated() const { return !png.empty() || !script.empty(); }

    // True when there is something to do. Otherwise help or a complaint was printed, and `status` is the exit
    // status: 0 after help, 2 for a bad command line.
    bool Parse(int argc, char **argv, int &status);
};
