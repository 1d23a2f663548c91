#include "desktop/type/ShapedTextCache.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/resources/Text.h"
#include "tests/type/Canvas.h"
#include <gtest/gtest.h>
#include <limits>
#include <string>

namespace {

TEST(LooseStringWidth, IsZeroForNoText) { EXPECT_EQ(LooseStringWidth(UString(), 0, 1), 0); }

TEST(LooseStringWidth, IsTheSameEveryTime) {
    Canvas canvas(10, 10);
    int const width = LooseStringWidth(U("Every time"), 0, 1);
    EXPECT_GT(width, 30);
    for (int i = 0; i < 3; ++i)
        EXPECT_EQ(LooseStringWidth(U("Every time"), 0, 1), width);
}

TEST(LooseStringWidth, IsTheSameAtEveryScale) {
    int widths[3];
    int *width = widths;
    for (double scale : {1.0, 1.5, 2.0}) {
        Canvas canvas(10, 10, scale);
        *width++ = LooseStringWidth(U("AVATAR To Wa 1234"), 0, 1);
    }
    EXPECT_EQ(widths[0], widths[1]);
    EXPECT_EQ(widths[0], widths[2]);
}

TEST(LooseStringWidth, FollowsThePortsFont) {
    Canvas canvas(10, 10);
    VelaDrawing::TextSize(12);
    int const small = LooseStringWidth(U("Wide"), 0, 1);
    VelaDrawing::TextSize(24);
    EXPECT_NEAR(LooseStringWidth(U("Wide"), 0, 1), 2 * small, 3);
}

TEST(LooseStringWidth, AddsSpacingBetweenCharacters) {
    Canvas canvas(10, 10);
    int const plain = LooseStringWidth(U("abcd"), 0, 1);
    EXPECT_EQ(LooseStringWidth(U("abcd"), 2, 1), plain + 6);
}

TEST(LooseStringWidth, StretchesWithTheScale) {
    Canvas canvas(10, 10);
    int const plain = LooseStringWidth(U("abcd"), 0, 1);
    EXPECT_EQ(LooseStringWidth(U("abcd"), 0, 2), 2 * plain);
    EXPECT_EQ(LooseStringWidth(U("abcd"), 0, 0.5f), (plain + 1) / 2);
}

TEST(LooseStringWidth, TakesSenselessSpacingAndScaleAsNone) {
    Canvas canvas(10, 10);
    int const plain = LooseStringWidth(U("abcd"), 0, 1);
    float const nan = std::numeric_limits<float>::quiet_NaN();
    EXPECT_EQ(LooseStringWidth(U("abcd"), nan, nan), plain);
    EXPECT_EQ(LooseStringWidth(U("abcd"), 0, 0), plain);
    EXPECT_EQ(LooseStringWidth(U("abcd"), 0, -3), plain);
    EXPECT_GT(LooseStringWidth(U("abcd"), 0, std::numeric_limits<float>::infinity()), plain);
}

TEST(LooseStringWidth, MeasuresAnyUnits) {
    Canvas canvas(10, 10);
    std::u16string text;
    for (int unit = 0; unit < 0x10000; unit += 251)
        text += static_cast<char16_t>(unit);
    EXPECT_GT(LooseStringWidth(Utf::FromUnits(text), 0, 1), 0);
}

TEST(LooseStringWidth, MeasuresHugeTextsWithinReason) {
    Canvas canvas(10, 10);
    UString const text = Utf::FromUnits(std::u16string(200000, u'W'));
    int const width = LooseStringWidth(text, 0, 1);
    EXPECT_GT(width, 32767);
    EXPECT_LE(width, 1 << 20);
}

TEST(LooseStringWidth, StaysRightWhenMoreTextsAreMeasuredThanAreKept) {
    Canvas canvas(10, 10);
    int const first = LooseStringWidth(U("row 0"), 0, 1);
    for (int i = 0; i < 10000; ++i)
        LooseStringWidth(U("r" + std::to_string(i)), 0, 1);
    EXPECT_EQ(LooseStringWidth(U("row 0"), 0, 1), first);
}

TEST(TightStringWidth, LeavesOutTheSideBearings) {
    Canvas canvas(60, 40);
    VelaDrawing::TextSize(20);
    int const tight = TightStringWidth(U("H"), 0, 1);
    EXPECT_LT(tight, LooseStringWidth(U("H"), 0, 1));
    DrawStringAtPoint(U("H"), Point{30, 10}, -1, TextSettings::kTruncateNone);
    EXPECT_NEAR(tight, canvas.Ink().Width(), 1);
}

TEST(TightStringWidth, IsZeroWithoutInk) {
    Canvas canvas(10, 10);
    EXPECT_EQ(TightStringWidth(UString(), 0, 1), 0);
    EXPECT_EQ(TightStringWidth(U("   "), 0, 1), 0);
}

} // namespace
