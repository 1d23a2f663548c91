// Scripts of events for the simulated desktop.
#pragma once
#include "desktop/windows/InputEvent.h"
#include <string>
#include <vector>

// One step of a script. Which fields count, the kind tells.
struct ScriptStep {
    enum Kind {
        kPress,
        kMove,
        kRelease,
        kClick,
        kDoubleClick,
        kRightClick,
        kWheel,
        kKey,
        kType,
        kCompose, // `text`, and `caret` characters into it
        kWait,
        kResize,
        kActivate, // `on`
        kMenu,
        kPrint,
        kSnapshot,
        kDump
    };
    Kind kind = kWait;
    int h = 0, v = 0;      // place, or width and height
    int item = 0;          // whose top left corner the place counts from; 0: the window's
    bool inMiddle = false; // of the item, whatever the place
    double wheelH = 0, wheelV = 0;
    unsigned short modifiers = 0;
    int key = 0;
    int caret = 0;
    double seconds = 0;
    bool on = true;
    std::vector<int> path; // of kMenu: item numbers, each but the last of a submenu; a single 0 dismisses
    std::string text;      // typed, or a file's path
    std::string source;    // "name:line" for messages
};

namespace EventScript {
// Reads steps, one a line. Throws ScriptError with name, line and what was expected.
std::vector<ScriptStep> Parse(std::string const &steps, std::string const &name);
// The code of a key by its name in scripts ("Return", "a"); KeyCodes::kNone for an unknown one.
int KeyByName(std::string const &name);
} // namespace EventScript
