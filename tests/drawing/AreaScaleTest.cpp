#include "desktop/drawing/AreaScale.h"
#include <vector>

namespace {
std::vector<std::uint32_t> Scaled(std::vector<std::uint32_t> const &from, int fromWidth, int toWidth,
                                  int toHeight) {
    std::vector<std::uint32_t> to(static_cast<std::size_t>(toWidth * toHeight));
    ScalePixels(from.data(), fromWidth, static_cast<int>(from.size()) / fromWidth, to.data(), toWidth,
                toHeight);
    return to;
}
typedef std::vector<std::uint32_t> Pixels;
} // namespace

TEST(AreaScale, WholeFactorsKeepPixelsAsSquares) {
    Pixels const doubled = Scaled({0xFF010203u, 0x80000000u}, 2, 4, 2);
    EXPECT_EQ(doubled, (Pixels{0xFF010203u, 0xFF010203u, 0x80000000u, 0x80000000u, 0xFF010203u, 0xFF010203u,
                               0x80000000u, 0x80000000u}));
}

TEST(AreaScale, ShrinkingAveragesAllThatIsCovered) {
    EXPECT_EQ(Scaled({0xFF000000u, 0xFF000000u, 0xFF000000u, 0xFFFFFFFFu}, 2, 1, 1), (Pixels{0xFF404040u}));
    EXPECT_EQ(Scaled({0xFF000000u, 0xFFFFFFFFu, 0xFF000000u}, 3, 2, 1), (Pixels{0xFF555555u, 0xFF555555u}));
}

TEST(AreaScale, OpaqueStaysOpaqueAndPlainStaysPlain) {
    for (int width = 1; width < 40; ++width)
        for (std::uint32_t pixel : Scaled(Pixels(17 * 13, 0xFF7F80FEu), 17, width, 40 - width))
            ASSERT_EQ(pixel, 0xFF7F80FEu);
}
