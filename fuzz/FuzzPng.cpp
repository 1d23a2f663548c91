// PNG files.
#include "desktop/drawing/Surface.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/MemoryFile.h"
#include "fuzz/support/Require.h"
#include <algorithm>

namespace {

int const kLongestSide = 8192;
int const kMostCheckedRows = 64;

bool IsPremultiplied(std::uint32_t pixel) {
    std::uint32_t const alpha = pixel >> 24;
    return (pixel >> 16 & 0xFF) <= alpha && (pixel >> 8 & 0xFF) <= alpha && (pixel & 0xFF) <= alpha;
}

void Check(Surface const &surface) {
    Require(surface.Width() >= 1 && surface.Width() <= kLongestSide, "the width is allowed");
    Require(surface.Height() >= 1 && surface.Height() <= kLongestSide, "the height is allowed");
    for (int y = 0; y < std::min(surface.Height(), kMostCheckedRows); ++y) {
        std::uint32_t const *const row = surface.Row(y);
        Require(std::all_of(row, row + surface.Width(), IsPremultiplied), "pixels are premultiplied");
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    MemoryFile const file(data, size);
    std::string error;
    std::unique_ptr<Surface> const surface = Surface::ReadPng(file.Path(), error);
    Require(surface ? error.empty() : !error.empty(), "a file either is a picture, or it is said why not");
    if (surface)
        Check(*surface);
    return 0;
}
