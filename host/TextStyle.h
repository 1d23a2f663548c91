#pragma once
#include "host/OSFont.h"
#include "host/RGBColor.h"

namespace OS {

struct TextStyle {
    Font::FamilyID family;
    int face;
    short size;
    RGBAColor color;
    TextStyle() : face(0), size(0) {}
};
}
