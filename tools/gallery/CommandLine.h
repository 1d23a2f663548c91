// What the gallery was asked to do.
#pragma once
#include "desktop/Desktop.h"
#include <string>

struct CommandLine {
    std::string page;     // name of the page to begin with; empty: the first
    std::string pages;    // directory of the dialogs; empty: the gallery's own
    std::string pictures; // directory for pictures of all pages; empty: not asked for
    std::string script, messages;
    DesktopOptions desktop;

    // True when there is something to do. Otherwise help or a complaint was printed, and `status` is the exit
    // status: 0 after help, 2 for a bad command line.
    bool Parse(int argc, char **argv, int &status);
};
