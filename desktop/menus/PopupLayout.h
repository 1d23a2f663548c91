// Where the parts of a closed pop-up lie.
#pragma once
#include "host/Geometry.h"
#include "host/PopupMenuDrawing.h"

// Icon, text and arrow from left to right. A part that is not there has an empty rectangle at its place.
struct PopupLayout {
    PopupLayout(Rect const &, PopupMenuPulldown, bool hasIcon);

    Rect icon, text, arrow; // as high as the pop-up
    bool hasArrow;
    bool narrowArrow; // the small mark
};
