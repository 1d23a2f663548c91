#include "desktop/drawing/AreaScale.h"
#include <cstddef>
#include <vector>

namespace {

constexpr int kChannels = 4, kBitsPerChannel = 8;
constexpr std::uint32_t kChannelMask = 0xFF;

// One row or column of pixels, a number of elements apart.
struct Line {
    std::uint32_t *pixels;
    std::size_t step;
    int count;
};

// Lengths are counted so that the line is from.count * to.count long: every pixel of `from` is to.count long
// then, and every pixel of `to` from.count, in whole numbers.
void ScaleLine(Line const &from, Line const &to) {
    std::size_t source = 0;
    int sourceLeft = to.count; // of the current source pixel
    for (int i = 0; i < to.count; ++i) {
        std::uint32_t sums[kChannels] = {0, 0, 0, 0};
        int wanted = from.count;
        while (wanted > 0) {
            int const part = sourceLeft < wanted ? sourceLeft : wanted;
            std::uint32_t const pixel = from.pixels[source * from.step];
            for (int c = 0; c < kChannels; ++c)
                sums[c] += (pixel >> (c * kBitsPerChannel) & kChannelMask) * static_cast<std::uint32_t>(part);
            wanted -= part;
            sourceLeft -= part;
            if (sourceLeft == 0) {
                ++source;
                sourceLeft = to.count;
            }
        }
        std::uint32_t pixel = 0;
        std::uint32_t const whole = static_cast<std::uint32_t>(from.count);
        for (int c = 0; c < kChannels; ++c)
            pixel |= (sums[c] + whole / 2) / whole << (c * kBitsPerChannel);
        to.pixels[static_cast<std::size_t>(i) * to.step] = pixel;
    }
}

} // namespace

void ScalePixels(std::uint32_t const *from, int fromWidth, int fromHeight, std::uint32_t *to, int toWidth,
                 int toHeight) {
    std::size_t const oldPitch = static_cast<std::size_t>(fromWidth),
                      newPitch = static_cast<std::size_t>(toWidth);
    std::vector<std::uint32_t> wide(newPitch * static_cast<std::size_t>(fromHeight));
    std::vector<std::uint32_t> row(oldPitch);
    for (int y = 0; y < fromHeight; ++y) {
        row.assign(from, from + oldPitch);
        from += oldPitch;
        ScaleLine({row.data(), 1, fromWidth},
                  {wide.data() + static_cast<std::size_t>(y) * newPitch, 1, toWidth});
    }
    for (std::size_t x = 0; x < newPitch; ++x)
        ScaleLine({wide.data() + x, newPitch, fromHeight}, {to + x, newPitch, toHeight});
}
