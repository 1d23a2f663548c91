// The icons that the benchmarks draw.
#pragma once
#include "desktop/drawing/PixelScope.h"

class DeviceScale;

namespace BenchIcons {

short const kFamily = 1841; // of oval buttons
short const kLeftCap = 0, kMiddle = 1, kRightCap = 2;
int const kWidth = 16, kHeight = 19; // logical pixels

// The icon's pixels at the scale. Throws std::runtime_error when the artwork does not have it: the mark for a
// missing icon would be measured instead.
PixelImage Image(short index, DeviceScale);

// Draws the image by the bare library call.
void Compose(PixelImage const &, pixman_image_t *target, int left, int top, int width);

} // namespace BenchIcons
