// The axes of the mouse's wheel, as its events number them.
#pragma once

// Others are possible and mean nothing.
enum WheelAxis { kWheelHorizontal = 0, kWheelVertical = 1 };
