// The host's own fields of a pane.
#pragma once
#include "host/CompoundPane.h"
#include "host/GlogPane.h"
#include <memory>
#include <vector>

struct GlogPane::Rep {
    int id = 0;
    Rect box{0, 0, 0, 0};
    bool visible = true; // the pane's own flag
    bool active = false;
    bool selected = false;
    bool started = false; // GlogItemInit was called
    // The pane itself when it holds others. Asked for every pane between any two events, where a cast would
    // be most of the work.
    CompoundPane *asContainer = nullptr;
    RCPtr<GlogLayoutRectItem> layoutItem;
    bool subItemMode = false;
    std::vector<RCPtr<GlogLayoutRectItem>> subItems;
    std::unique_ptr<HelpTagHelper> help;
    PaneWatch *watches = nullptr; // those who want to know when the pane goes away
};

struct CompoundPane::CompoundRep {
    std::vector<GlogPane *> subpanes; // owned, from the bottom to the top
    RCPtr<GlogLayoutGroup> layout;
    bool sizesToLayout = false;
    bool noErase = false;
    bool hasFrame = false;
};
