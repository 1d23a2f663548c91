// Scaling images to another number of pixels.
#pragma once
#include <cstdint>

// Scales premultiplied pixels, rows without gaps, by averaging what each new pixel covers: nothing is lost
// when an image shrinks, and one that grows by a whole factor keeps its pixels as squares. Opaque images stay
// opaque to their edges. Every side has to be at least 1 and at most 8192.
void ScalePixels(std::uint32_t const *from, int fromWidth, int fromHeight, std::uint32_t *to, int toWidth,
                 int toHeight);
