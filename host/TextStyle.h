// The look of a run of editable text.
#pragma once
#include "host/OSFont.h"
#include "host/RGBColor.h"

namespace OS {

struct TextStyle {
    Font::FamilyID family; // that of dialog text by default
    int face;              // 0 plain, 1 bold, 32 condensed; the values add up
    short size;            // logical pixels
    RGBAColor color;       // black and opaque by default

    TextStyle()
        : face(0)
        , size(0) {}
};

} // namespace OS
