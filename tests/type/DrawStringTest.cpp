#include "desktop/drawing/Region.h"
#include "desktop/observe/DrawingTrace.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/resources/Text.h"
#include "tests/type/Canvas.h"
#include <gtest/gtest.h>
#include <string>
#include <vector>

namespace {

using TextSettings::kTruncateEnd;
using TextSettings::kTruncateMiddle;
using TextSettings::kTruncateNone;

std::vector<std::uint32_t> Picture(char const *text, int maxWidth, TextSettings::TruncateCode truncation) {
    Canvas canvas(200, 30);
    DrawStringAtPoint(U(text), Point{20, 10}, maxWidth, truncation);
    return canvas.Copy();
}

TEST(DrawStringAtPoint, PutsTheBaselineOnThePoint) {
    Canvas canvas(100, 40);
    DrawStringAtPoint(U("HIE"), Point{25, 10}, -1, kTruncateNone);
    EXPECT_EQ(canvas.Ink().bottom, 25);
    EXPECT_GE(canvas.Ink().left, 10);
    EXPECT_LE(canvas.Ink().left, 12);
}

TEST(DrawStringAtPoint, DrawsInTheForegroundColour) {
    Canvas canvas(100, 60);
    VelaDrawing::TextSize(40);
    SetForegroundColor(RGBColor{0xFFFF, 0, 0});
    DrawStringAtPoint(U("I"), Point{50, 10}, -1, kTruncateNone);
    DeviceRect const ink = canvas.Ink();
    EXPECT_EQ(canvas.Pixels().Row((ink.top + ink.bottom) / 2)[(ink.left + ink.right) / 2], 0xFFFF0000u);
}

TEST(DrawStringAtPoint, LeavesThePenAlone) {
    Canvas canvas(100, 40);
    VelaDrawing::MoveTo(3, 4);
    DrawStringAtPoint(U("text"), Point{25, 10}, -1, kTruncateNone);
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_TRUE(pen.h == 3 && pen.v == 4);
}

TEST(DrawStringAtPoint, IsTheSamePictureEveryTime) {
    EXPECT_EQ(Picture("Steady", -1, kTruncateNone), Picture("Steady", -1, kTruncateNone));
}

TEST(DrawStringAtPoint, ShortensOnlyWhatIsTooWide) {
    EXPECT_EQ(Picture("Short", 100, kTruncateEnd), Picture("Short", -1, kTruncateNone));
    EXPECT_NE(Picture("A rather long label", 60, kTruncateEnd),
              Picture("A rather long label", 60, kTruncateNone));
}

TEST(DrawStringAtPoint, ShortensAtTheEndOrInTheMiddle) {
    std::vector<std::uint32_t> const end = Picture("A rather long label", 60, kTruncateEnd);
    std::vector<std::uint32_t> const middle = Picture("A rather long label", 60, kTruncateMiddle);
    EXPECT_NE(end, middle);
}

TEST(DrawStringAtPoint, LeavesNoGapRoundTheEllipsis) {
    // The text that is left, drawn for itself, is the same picture: nothing is stretched to fill the width.
    UString const shortened = U("Too wid\xE2\x80\xA6"
                                "e by far");
    int const width = LooseStringWidth(shortened, 0, 1);
    EXPECT_EQ(Picture("Too wide for its frame by far", width + 3, kTruncateMiddle),
              Picture("Too wid\xE2\x80\xA6"
                      "e by far",
                      -1, kTruncateNone));
}

TEST(DrawStringAtPoint, StaysWithinTheWidthHoweverItIsShortened) {
    for (TextSettings::TruncateCode truncation : {kTruncateNone, kTruncateEnd, kTruncateMiddle}) {
        for (int width : {1, 5, 37, 60}) {
            Canvas canvas(200, 30);
            DrawStringAtPoint(U("A rather long label"), Point{20, 10}, width, truncation);
            EXPECT_LE(canvas.Ink().right, 10 + width) << truncation << ' ' << width;
        }
    }
}

TEST(DrawStringAtPoint, DrawsNothingInNoWidth) {
    for (int width : {0, -2, -1000}) {
        Canvas canvas(200, 30);
        DrawStringAtPoint(U("text"), Point{20, 10}, width, kTruncateEnd);
        EXPECT_TRUE(canvas.IsBlank()) << width;
    }
}

TEST(DrawStringAtPoint, DrawsLineBreaksAsSpaces) {
    EXPECT_EQ(Picture("two\nwords", -1, kTruncateNone), Picture("two words", -1, kTruncateNone));
    EXPECT_EQ(Picture("two\r\nwords", -1, kTruncateNone), Picture("two words", -1, kTruncateNone));
}

TEST(DrawStringAtPoint, DrawsOnBehindAnEmbeddedZero) {
    Canvas canvas(200, 30);
    DrawStringAtPoint(U(std::string_view("a\0bcdefgh", 9)), Point{20, 0}, -1, kTruncateNone);
    EXPECT_GT(canvas.Ink().right, 40);
}

TEST(DrawStringAtPoint, StaysWithinTheClip) {
    Canvas canvas(200, 30);
    Rect const clip = {10, 20, 18, 31};
    VelaDrawing::ClipRect(&clip);
    DrawStringAtPoint(U("clipped text"), Point{20, 5}, -1, kTruncateNone);
    DeviceRect const ink = canvas.Ink();
    EXPECT_FALSE(ink.Empty());
    EXPECT_GE(ink.left, 20);
    EXPECT_LE(ink.right, 31);
    EXPECT_LE(ink.bottom, 18);
}

TEST(DrawStringAtPoint, DrawsPartsAsTheyAreInTheWhole) {
    Canvas whole(200, 30);
    DrawStringAtPoint(U("Wafting glyphs"), Point{20, 5}, -1, kTruncateNone);
    for (int left = 0; left < 90; left += 7) {
        Canvas part(200, 30);
        Rect const clip = {0, static_cast<short>(left), 30, static_cast<short>(left + 7)};
        VelaDrawing::ClipRect(&clip);
        DrawStringAtPoint(U("Wafting glyphs"), Point{20, 5}, -1, kTruncateNone);
        for (int y = 0; y < 30; ++y) {
            for (int x = left; x < left + 7; ++x)
                ASSERT_EQ(part.Pixels().Row(y)[x], whole.Pixels().Row(y)[x]) << x << ' ' << y;
        }
    }
}

TEST(DrawStringAtPoint, IsSharpAtTheScaleOfThePort) {
    Canvas canvas(100, 40, 2);
    DrawStringAtPoint(U("HIE"), Point{25, 10}, -1, kTruncateNone);
    DeviceRect const ink = canvas.Ink();
    EXPECT_EQ(ink.bottom, 50);
    // A stretched picture would have every pixel twice.
    bool anyOdd = false;
    for (int y = ink.top; y < ink.bottom; ++y) {
        for (int x = ink.left & ~1; x + 1 < ink.right; x += 2)
            anyOdd = anyOdd || canvas.Pixels().Row(y)[x] != canvas.Pixels().Row(y)[x + 1];
    }
    EXPECT_TRUE(anyOdd);
}

TEST(DrawStringAtPoint, FollowsTheOrigin) {
    Canvas canvas(100, 60);
    canvas.Port().SetOrigin(20, 30);
    DrawStringAtPoint(U("HIE"), Point{10, 0}, -1, kTruncateNone);
    EXPECT_EQ(canvas.Ink().bottom, 40);
    EXPECT_GE(canvas.Ink().left, 20);
}

TEST(DrawStringAtPoint, TakesAnyPlaceAndText) {
    Canvas canvas(20, 20);
    for (short place : {short(-32768), short(0), short(32767)}) {
        DrawStringAtPoint(U("far"), Point{place, place}, -1, kTruncateNone);
        DrawStringAtPoint(UString(), Point{place, place}, 10, kTruncateMiddle);
        DrawString(U("far"));
    }
    DrawStringAtPoint(Utf::FromUnits(std::u16string(100000, u'm')), Point{15, 0}, -1, kTruncateNone);
    EXPECT_FALSE(canvas.IsBlank());
}

TEST(DrawStringAtPoint, DoesNothingWithoutAPort) {
    ASSERT_EQ(DrawingPort::CurrentPort(), nullptr);
    EXPECT_NO_THROW(DrawStringAtPoint(U("nowhere"), Point{0, 0}, -1, kTruncateNone));
    EXPECT_NO_THROW(DrawString(U("nowhere")));
}

TEST(DrawString, MovesThePenByTheWidth) {
    Canvas canvas(200, 40);
    VelaDrawing::MoveTo(10, 25);
    DrawString(U("Page "));
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen.h, 10 + LooseStringWidth(U("Page "), 0, 1));
    EXPECT_EQ(pen.v, 25);
    EXPECT_EQ(canvas.Ink().bottom, 25 + 3); // the g descends
}

TEST(DrawString, MovesThePenWhereNothingShows) {
    Canvas canvas(20, 20);
    VelaDrawing::MoveTo(500, 500);
    DrawString(U("out of sight"));
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen.h, 500 + LooseStringWidth(U("out of sight"), 0, 1));
}

TEST(DrawString, StopsThePenAtTheEdgeOfThePlane) {
    Canvas canvas(20, 20);
    VelaDrawing::MoveTo(32760, 0);
    DrawString(U("beyond the edge"));
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen.h, 32767);
}

DeviceRect InkInRect(Rect const &r, TextSettings::Alignment alignment, int verticalAlignment) {
    Canvas canvas(200, 60);
    DrawStringInRect(U("HIE"), r, alignment, kTruncateNone, verticalAlignment, 0, 0, 0, 1, 1, 0);
    return canvas.Ink();
}

TEST(DrawStringInRect, AlignsSideways) {
    Rect const r = {10, 20, 30, 120};
    DeviceRect const left = InkInRect(r, TextSettings::kAlignLeft, 0);
    DeviceRect const center = InkInRect(r, TextSettings::kAlignCenter, 0);
    DeviceRect const right = InkInRect(r, TextSettings::kAlignRight, 0);
    EXPECT_NEAR(left.left, 20, 2);
    EXPECT_NEAR(center.left + center.right, 140, 2);
    EXPECT_NEAR(right.right, 120, 2);
    EXPECT_EQ(InkInRect(r, TextSettings::kAlignDefault, 0).left, left.left);
}

TEST(DrawStringInRect, AlignsAtTheTopOrInTheMiddle) {
    Rect const r = {10, 20, 51, 120};
    EXPECT_EQ(InkInRect(r, TextSettings::kAlignLeft, 0).bottom, 10 + 12);
    // 41 less a line of 15 leaves 26: 13 above, and the baseline 12 below that.
    EXPECT_EQ(InkInRect(r, TextSettings::kAlignLeft, 1).bottom, 10 + 13 + 12);
}

TEST(DrawStringInRect, IsCutAtTheSidesOfTheRectangle) {
    for (TextSettings::Alignment alignment :
         {TextSettings::kAlignLeft, TextSettings::kAlignCenter, TextSettings::kAlignRight}) {
        Canvas canvas(200, 60);
        DrawStringInRect(U("wider than its rectangle"), Rect{10, 50, 30, 90}, alignment, kTruncateNone, 1, 0,
                         0, 0, 1, 1, 0);
        DeviceRect const ink = canvas.Ink();
        EXPECT_GE(ink.left, 50) << alignment;
        EXPECT_LE(ink.right, 90) << alignment;
        EXPECT_GT(ink.Width(), 30) << alignment;
    }
}

TEST(DrawStringInRect, ShortensToTheRectangle) {
    Canvas shortened(200, 60);
    DrawStringInRect(U("wider than its rectangle"), Rect{10, 50, 30, 90}, TextSettings::kAlignCenter,
                     kTruncateEnd, 1, 0, 0, 0, 1, 1, 0);
    EXPECT_GE(shortened.Ink().left, 50);
    EXPECT_LE(shortened.Ink().right, 90);
}

TEST(DrawStringInRect, BreaksLinesAtItsWidth) {
    Canvas canvas(200, 100);
    DrawStringInRect(U("several words that need several lines"), Rect{10, 20, 90, 90},
                     TextSettings::kAlignLeft, kTruncateNone, 0, 1, 0, 0, 1, 1, 0);
    DeviceRect const ink = canvas.Ink();
    EXPECT_LE(ink.right, 90);
    EXPECT_GT(ink.bottom, 10 + 2 * 15);
}

TEST(DrawStringInRect, CutsLinesBelowItsRectangle) {
    Canvas canvas(200, 100);
    DrawStringInRect(U("several words that need several lines"), Rect{10, 20, 30, 70},
                     TextSettings::kAlignLeft, kTruncateNone, 0, 1, 0, 0, 1, 1, 0);
    EXPECT_LE(canvas.Ink().bottom, 30);
}

TEST(DrawStringInRect, BreaksLinesWhereTheTextDoes) {
    Canvas canvas(200, 100);
    DrawStringInRect(U("H\nH\r\nH"), Rect{0, 20, 90, 90}, TextSettings::kAlignLeft, kTruncateNone, 0, 1, 0, 0,
                     1, 1, 0);
    EXPECT_EQ(canvas.Ink().bottom, 12 + 2 * 15);
}

TEST(DrawStringInRect, PutsTextFromRightToLeftAtTheRightByDefault) {
    Canvas canvas(200, 40);
    UString const hebrew = U("\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D");
    DrawStringInRect(hebrew, Rect{5, 0, 25, 200}, TextSettings::kAlignDefault, kTruncateNone, 0, 0, 0, 0, 1,
                     1, 0);
    EXPECT_GT(canvas.Ink().left, 100);
    canvas.Erase();
    DrawStringInRect(hebrew, Rect{5, 0, 25, 200}, TextSettings::kAlignLeft, kTruncateNone, 0, 0, 0, 0, 1, 1,
                     0);
    EXPECT_LT(canvas.Ink().right, 100);
}

TEST(DrawStringInRect, StretchesSideways) {
    Canvas plain(200, 40), stretched(200, 40);
    Rect const r = {5, 10, 25, 200};
    DrawingPort::MakeCurrent(&plain.Port());
    DrawStringInRect(U("HHHHHH"), r, TextSettings::kAlignLeft, kTruncateNone, 0, 0, 0, 0, 1, 1, 0);
    DrawingPort::MakeCurrent(&stretched.Port());
    DrawStringInRect(U("HHHHHH"), r, TextSettings::kAlignLeft, kTruncateNone, 0, 0, 0, 0, 2, 1, 0);
    EXPECT_NEAR(stretched.Ink().Width(), 2 * plain.Ink().Width(), 3);
    EXPECT_EQ(stretched.Ink().Height(), plain.Ink().Height());
}

TEST(DrawStringInRect, DrawsNothingInAnEmptyRectangle) {
    Canvas canvas(200, 40);
    DrawStringInRect(U("text"), Rect{20, 50, 10, 50}, TextSettings::kAlignCenter, kTruncateNone, 1, 0, 0, 0,
                     1, 1, 0);
    DrawStringInRect(U("text"), Rect{10, 50, 20, 40}, TextSettings::kAlignCenter, kTruncateEnd, 1, 1, 0, 0, 1,
                     1, 0);
    EXPECT_TRUE(canvas.IsBlank());
}

TEST(Faces, UnderlineDrawsALine) {
    Canvas canvas(60, 30);
    DrawStringAtPoint(U("HH"), Point{20, 10}, -1, kTruncateNone);
    int const plain = canvas.Ink().bottom;
    VelaDrawing::TextFace(4);
    DrawStringAtPoint(U("HH"), Point{20, 10}, -1, kTruncateNone);
    EXPECT_GT(canvas.Ink().bottom, plain);
}

class Trace : public testing::Test {
protected:
    Trace() {
        DrawingTrace::SetSink([this](std::string const &line) { lines.push_back(line); });
    }
    ~Trace() override { DrawingTrace::SetSink(DrawingTrace::Sink()); }
    std::vector<std::string> lines;
};

TEST_F(Trace, HasTheArgumentsOfEveryCall) {
    Canvas canvas(100, 40);
    canvas.Port().State().textSize = 12;
    canvas.Port().State().pen.location = Point{7, 3};
    DrawStringAtPoint(U("a"), Point{20, 10}, 50, kTruncateEnd);
    DrawString(U("b"));
    DrawStringInRect(U("c"), Rect{1, 2, 3, 4}, TextSettings::kAlignRight, kTruncateNone, 1, 0, 0, 0, 1, 1, 0);
    SetFontData(GetIndVelaFont(7));
    ASSERT_EQ(lines.size(), 4u);
    EXPECT_EQ(lines[0],
              R"({"op":"DrawStringAtPoint","text":"a","at":[20,10],"maxWidth":50,"truncation":"end",)"
              R"("family":"Roboto","face":0,"size":12,"fore":[0,0,0]})");
    EXPECT_EQ(
        lines[1],
        R"({"op":"DrawString","text":"b","at":[7,3],"family":"Roboto","face":0,"size":12,"fore":[0,0,0]})");
    EXPECT_EQ(
        lines[2],
        R"({"op":"DrawStringInRect","text":"c","rect":[1,2,3,4],"alignment":"right","truncation":"none",)"
        R"("verticalAlignment":1,"wrap":0,"family":"Roboto","face":0,"size":12,"fore":[0,0,0]})");
    EXPECT_EQ(lines[3], R"({"op":"SetFontData","family":"Roboto","face":1,"size":14})");
}

TEST_F(Trace, HasCallsThatShowNothing) {
    Canvas canvas(10, 10);
    DrawStringAtPoint(U("far away"), Point{500, 500}, -1, kTruncateNone);
    EXPECT_EQ(lines.size(), 1u);
}

TEST_F(Trace, IsSilentForMeasuring) {
    Canvas canvas(10, 10);
    LooseStringWidth(U("x"), 0, 1);
    OS::TextLayout layout;
    UpdateTextLayout(layout, U("x"), 0, TextSettings::kAlignLeft, kTruncateNone, 0, 0, 0, 0, 0, 1, 1);
    EXPECT_TRUE(lines.empty());
}

} // namespace
