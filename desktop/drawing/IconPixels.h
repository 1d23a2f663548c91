// An icon as plain pixels, for what is not drawn into a window.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstdint>
#include <vector>

struct IconPixels {
    int width = 0, height = 0;         // device pixels
    std::vector<std::uint32_t> pixels; // 0xAARRGGBB premultiplied, rows from top to bottom without gaps
};

// A copy of the icon in the present theme; without pixels when it is not drawn.
IconPixels CopyIconPixels(short family, short index, DeviceScale);
