#include "host/TextLayout.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Resources.h"
#include "desktop/type/FontFamilies.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/ShapedTextCache.h"
#include "desktop/type/TextLru.h"
#include "host/VelaDrawing.h"
#include "tests/resources/Text.h"
#include "tests/type/Canvas.h"
#include <chrono>
#include <functional>
#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <vector>

namespace {

using TextSettings::kAlignCenter;
using TextSettings::kAlignLeft;
using TextSettings::kTruncateEnd;
using TextSettings::kTruncateNone;

void Update(OS::TextLayout &layout, char const *text, int font = 0, int wrap = 0) {
    UpdateTextLayout(layout, U(text), font, kAlignCenter, kTruncateNone, 1, wrap, 0, 0, 0, 1, 1);
}

void Draw(OS::TextLayout &layout, char const *text, Rect const &r,
          TextSettings::TruncateCode truncation = kTruncateNone, int wrap = 0) {
    DrawTextLayoutInRect(layout, U(text), r, 0, kAlignCenter, truncation, 1, wrap, 0, 0, 0, 1, 1);
}

TEST(TextLayout, HasNoWidthAtFirst) { EXPECT_EQ(OS::TextLayout().GetWidth(), 0); }

TEST(TextLayout, HasTheWidthOfItsText) {
    Canvas canvas(10, 10);
    OS::TextLayout layout;
    Update(layout, "Cancel");
    EXPECT_EQ(layout.GetWidth(), LooseStringWidth(U("Cancel"), 0, 1));
    Update(layout, "");
    EXPECT_EQ(layout.GetWidth(), 0);
}

TEST(TextLayout, FollowsAChangeOfFont) {
    OS::TextLayout layout;
    Update(layout, "Cancel", 0);
    double const small = layout.GetWidth();
    Update(layout, "Cancel", 9);
    EXPECT_GT(layout.GetWidth(), small);
    UpdateTextLayout(layout, U("Cancel"), OS::Font::FamilyID(), 0, 12, kAlignLeft, kTruncateNone, 0, 0, 0, 0,
                     0, 1, 1);
    EXPECT_EQ(layout.GetWidth(), small);
}

TEST(TextLayout, TakesStyleAndSize) {
    OS::TextLayout plain, bold;
    UpdateTextLayout(plain, U("Hamburgefonstiv"), OS::Font::FamilyID(), 0, 11, kAlignLeft, kTruncateNone, 0,
                     0, 0, 0, 0, 1, 1);
    UpdateTextLayout(bold, U("Hamburgefonstiv"), OS::Font::FamilyID(), 1, 11, kAlignLeft, kTruncateNone, 0, 0,
                     0, 0, 0, 1, 1);
    EXPECT_GT(bold.GetWidth(), plain.GetWidth());
}

TEST(TextLayout, HasTheWidthOfItsLongestLineWhenItWraps) {
    OS::TextLayout lines, longest;
    Update(lines, "one\nthe longest line\ntwo", 0, 1);
    Update(longest, "the longest line");
    EXPECT_EQ(lines.GetWidth(), longest.GetWidth());
}

TEST(TextLayout, KeepsItsFullWidthWhenItIsShortened) {
    Canvas canvas(200, 40);
    OS::TextLayout layout;
    Update(layout, "A rather long label");
    double const whole = layout.GetWidth();
    Draw(layout, "A rather long label", Rect{0, 0, 20, 50}, kTruncateEnd);
    EXPECT_EQ(layout.GetWidth(), whole);
}

TEST(TextLayout, HasTheBrokenWidthAfterItWasDrawnInLines) {
    Canvas canvas(200, 90);
    OS::TextLayout layout;
    Draw(layout, "several words that need several lines", Rect{0, 0, 90, 60}, kTruncateNone, 1);
    EXPECT_GT(layout.GetWidth(), 20);
    EXPECT_LE(layout.GetWidth(), 60);
}

TEST(TextLayout, GoingBackToALookOrATextShapesNothingAnew) {
    Canvas canvas(10, 10);
    OS::TextLayout layout;
    auto const update = [&](char const *text, short style) {
        UpdateTextLayout(layout, U(text), OS::Font::FamilyID(), style, 11, kAlignLeft, kTruncateNone, 0, 0, 0,
                         0, 0, 1, 1);
        return layout.GetWidth();
    };
    TextShape plain;
    plain.font = FontSpec::Make(OS::Font::FamilyID().GetOrderedFontID(), 0, 11);
    for (auto const &goElsewhere : {std::function<void()>([&] { update("To and fro", 1); }),
                                    std::function<void()>([&] { update("Elsewhere", 0); })}) {
        double const width = update("To and fro", 0);
        goElsewhere();
        std::unique_ptr<ShapedText> first = ShapedTextCache::TakeAside(u"To and fro", plain);
        ShapedText const *const kept = first.get();
        ShapedTextCache::SetAside(u"To and fro", plain, std::move(first));
        EXPECT_EQ(update("To and fro", 0), width);
        goElsewhere();
        EXPECT_EQ(ShapedTextCache::TakeAside(u"To and fro", plain).get(), kept);
    }
}

TEST(TextLayout, WhatIsSetAsideGoesWithTheFonts) {
    Canvas canvas(10, 10);
    TextShape plain;
    plain.font = FontSpec::Make(OS::Font::FamilyID().GetOrderedFontID(), 0, 11);
    ShapedTextCache::SetAside(u"aside", plain, ShapedTextCache::TakeAside(u"aside", plain));
    Resources::Instance().Open(Resources::FindDirectory());
    EXPECT_TRUE(ShapedTextCache::TakeAside(u"aside", plain)->IsCurrent());
    std::unique_ptr<ShapedText> old = ShapedTextCache::TakeAside(u"old", plain);
    Resources::Instance().Open(Resources::FindDirectory());
    ShapedTextCache::SetAside(u"old", plain, std::move(old));
    EXPECT_TRUE(ShapedTextCache::TakeAside(u"old", plain)->IsCurrent());
}

TEST(DrawTextLayoutInRect, LooksLikeDrawStringInRect) {
    Canvas withLayout(100, 30), without(100, 30);
    OS::TextLayout layout;
    DrawingPort::MakeCurrent(&withLayout.Port());
    Draw(layout, "Cancel", Rect{5, 10, 24, 90});
    DrawingPort::MakeCurrent(&without.Port());
    SetFontData(GetIndVelaFont(0));
    DrawStringInRect(U("Cancel"), Rect{5, 10, 24, 90}, kAlignCenter, kTruncateNone, 1, 0, 0, 0, 1, 1, 0);
    EXPECT_FALSE(withLayout.IsBlank());
    EXPECT_EQ(withLayout.Copy(), without.Copy());
}

TEST(DrawTextLayoutInRect, LeavesThePortsFontAlone) {
    Canvas canvas(100, 30);
    VelaDrawing::TextSize(31);
    OS::TextLayout layout;
    Draw(layout, "Cancel", Rect{5, 10, 24, 90});
    EXPECT_EQ(VelaDrawing::GetPortTextSize(&canvas.Port()), 31);
}

TEST(DrawTextLayoutInRect, DrawsTheTextItIsGivenWhateverItKeeps) {
    Canvas canvas(100, 30), fresh(100, 30);
    OS::TextLayout layout, other;
    DrawingPort::MakeCurrent(&canvas.Port());
    Draw(layout, "first", Rect{5, 10, 24, 90});
    canvas.Erase();
    Draw(layout, "second", Rect{5, 10, 24, 90});
    DrawingPort::MakeCurrent(&fresh.Port());
    Draw(other, "second", Rect{5, 10, 24, 90});
    EXPECT_EQ(canvas.Copy(), fresh.Copy());
}

TEST(DrawTextLayoutInRect, FitsEveryRectangleAnew) {
    Canvas canvas(200, 30), fresh(200, 30);
    OS::TextLayout layout, other;
    DrawingPort::MakeCurrent(&canvas.Port());
    for (short right : {short(40), short(199), short(60)}) {
        canvas.Erase();
        Draw(layout, "A rather long label", Rect{5, 10, 24, right}, kTruncateEnd);
    }
    DrawingPort::MakeCurrent(&fresh.Port());
    Draw(other, "A rather long label", Rect{5, 10, 24, 60}, kTruncateEnd);
    EXPECT_EQ(canvas.Copy(), fresh.Copy());
}

TEST(DrawTextLayoutInRect, ShortensWrappedTextInItsLastLine) {
    Canvas cut(200, 60), shortened(200, 60);
    OS::TextLayout layout, other;
    Rect const twoLines = {0, 0, 30, 60};
    DrawingPort::MakeCurrent(&cut.Port());
    Draw(layout, "several words that need several lines", twoLines, kTruncateNone, 1);
    DrawingPort::MakeCurrent(&shortened.Port());
    Draw(other, "several words that need several lines", twoLines, kTruncateEnd, 1);
    EXPECT_LE(shortened.Ink().bottom, 30);
    EXPECT_NE(cut.Copy(), shortened.Copy());
}

TEST(DrawTextLayoutInRect, SurvivesAChangeOfFonts) {
    Canvas canvas(200, 30);
    OS::TextLayout layout;
    Draw(layout, "Cancel", Rect{5, 10, 24, 90});
    std::vector<std::uint32_t> const before = canvas.Copy();
    FontLibrary::Instance().AddSystemFonts();
    Resources::Instance().Open(Resources::FindDirectory());
    canvas.Erase();
    Draw(layout, "Cancel", Rect{5, 10, 24, 90});
    EXPECT_EQ(canvas.Copy(), before);
}

TEST(DrawTextLayoutInRect, LeavesALineInTheTrace) {
    Canvas canvas(100, 30);
    std::vector<std::string> lines;
    DrawingTrace::SetSink([&](std::string const &line) { lines.push_back(line); });
    OS::TextLayout layout;
    Draw(layout, "OK", Rect{5, 10, 24, 90});
    DrawTextLayoutInRect(layout, U("Tab"), Rect{1, 2, 3, 4}, OS::Font::FamilyID(), 33, 10, kAlignCenter,
                         kTruncateEnd, 1, 0, 0, 0, 0, 1, 1);
    DrawingTrace::SetSink(DrawingTrace::Sink());
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0],
              R"({"op":"DrawTextLayoutInRect","text":"OK","rect":[5,10,24,90],"alignment":"center",)"
              R"("truncation":"none","verticalAlignment":1,"wrap":0,"family":"Roboto","face":0,"size":12,)"
              R"("fore":[0,0,0]})");
    EXPECT_EQ(lines[1],
              R"({"op":"DrawTextLayoutInRect","text":"Tab","rect":[1,2,3,4],"alignment":"center",)"
              R"("truncation":"end","verticalAlignment":1,"wrap":0,"family":"Roboto","face":33,"size":10,)"
              R"("fore":[0,0,0]})");
}

TEST(TextLru, FindsWhatWasAddedUnderTextAndShape) {
    TextLru<int> lru(4, 100);
    TextShape shape, wider;
    wider.width = 50;
    lru.Add(u"a", shape, 1);
    lru.Add(u"a", wider, 2);
    ASSERT_NE(lru.Find(u"a", shape), nullptr);
    EXPECT_EQ(*lru.Find(u"a", shape), 1);
    EXPECT_EQ(*lru.Find(u"a", wider), 2);
    EXPECT_EQ(lru.Find(u"b", shape), nullptr);
}

TEST(TextLru, DropsTheLeastRecentlyUsed) {
    TextLru<int> lru(2, 100);
    TextShape const shape;
    lru.Add(u"a", shape, 1);
    lru.Add(u"b", shape, 2);
    lru.Find(u"a", shape);
    lru.Add(u"c", shape, 3);
    EXPECT_NE(lru.Find(u"a", shape), nullptr);
    EXPECT_EQ(lru.Find(u"b", shape), nullptr);
}

TEST(TextLru, GivesAwayAValueAndTheRoomThatItTook) {
    TextLru<std::unique_ptr<int>> lru(100, 10);
    TextShape const shape;
    lru.Add(u"123456", shape, std::make_unique<int>(1));
    std::unique_ptr<int> const taken = lru.Take(u"123456", shape);
    ASSERT_NE(taken, nullptr);
    EXPECT_EQ(*taken, 1);
    EXPECT_EQ(lru.Take(u"123456", shape), nullptr);
    lru.Add(u"abcdef", shape, std::make_unique<int>(2));
    lru.Add(u"ghij", shape, std::make_unique<int>(3));
    EXPECT_EQ(lru.Size(), 2u);
}

TEST(TextLru, IsBoundedByTheLengthOfItsTextsToo) {
    TextLru<int> lru(100, 10);
    TextShape const shape;
    lru.Add(u"123456", shape, 1);
    lru.Add(u"abcdef", shape, 2);
    EXPECT_EQ(lru.Size(), 1u);
    lru.Add(std::u16string(1000, u'x'), shape, 3);
    EXPECT_NE(lru.Find(std::u16string(1000, u'x'), shape), nullptr);
    lru.Clear();
    EXPECT_EQ(lru.Size(), 0u);
}

} // namespace
