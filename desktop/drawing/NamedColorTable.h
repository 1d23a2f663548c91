// The named colours with their names.
#pragma once
#include "host/RGBColor.h"

struct NamedColorEntry {
    char const *name;
    RGBColor *color;
};
constexpr int kNamedColorCount = 36;
extern NamedColorEntry const kNamedColorTable[kNamedColorCount];
