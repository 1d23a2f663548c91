// Where menus and their items lie, and the other parts of menus that are plain calculation.
#include "desktop/menus/MenuAim.h"
#include "desktop/menus/MenuColumns.h"
#include "desktop/menus/MenuPlace.h"
#include "desktop/menus/NoteDuration.h"
#include "desktop/menus/PopupLayout.h"
#include "desktop/menus/TypedPrefix.h"
#include "tests/menus/MenuTest.h"
#include <set>

static bool operator==(ScreenRect const &a, ScreenRect const &b) {
    return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}
static std::ostream &operator<<(std::ostream &out, ScreenRect const &r) {
    return out << "{left " << r.left << ", top " << r.top << ", right " << r.right << ", bottom " << r.bottom
               << "}";
}

namespace {

ScreenRect const kScreen{0, 0, 1000, 800};

Menu MenuOf(int items) {
    Menu menu;
    for (int i = 0; i < items; ++i)
        menu.Append(MenuItem());
    return menu;
}

Menu MenuOf(std::initializer_list<char const *> texts) {
    Menu menu;
    for (char const *text : texts) {
        MenuItem item = *text == '-' ? MenuItem::Separator() : MenuItem();
        item.text = UString(text, UString::kByteEncoding1);
        menu.Append(item);
    }
    return menu;
}

} // namespace

// Rows

TEST(MenuRowsTest, LieBelowEachOther) {
    MenuRows const rows(MenuOf({"a", "-", "c"}));
    EXPECT_EQ(rows.Top(1), 5);
    EXPECT_EQ(rows.Top(2), 25);
    EXPECT_EQ(rows.Top(3), 34);
    EXPECT_EQ(rows.Bottom(3), 54);
    EXPECT_EQ(rows.Height(), 59);
    EXPECT_EQ(rows.Middle(1), 15);
}

TEST(MenuRowsTest, AreFoundByTheirHeight) {
    MenuRows const rows(MenuOf({"a", "-", "c"}));
    struct Case {
        int v, item, below;
    };
    for (Case c : {Case{-1, 0, 1}, Case{4, 0, 1}, Case{5, 1, 1}, Case{24, 1, 1}, Case{25, 2, 2},
                   Case{33, 2, 2}, Case{34, 3, 3}, Case{53, 3, 3}, Case{54, 0, 4}, Case{1000, 0, 4}}) {
        EXPECT_EQ(rows.At(c.v), c.item) << c.v;
        EXPECT_EQ(rows.FirstBelow(c.v), c.below) << c.v;
    }
}

TEST(MenuRowsTest, OfAnEmptyMenuThereAreNone) {
    MenuRows const rows{Menu()};
    EXPECT_EQ(rows.Count(), 0);
    EXPECT_GT(rows.Height(), 0);
    EXPECT_EQ(rows.At(8), 0);
    EXPECT_EQ(rows.FirstBelow(0), 1);
}

// Places

TEST(MenuPlaceTest, TheCurrentItemLiesOverThePopUp) {
    MenuRows const rows(MenuOf(5));
    MenuPlace const place = MenuPlace::Over({300, 300, 400, 320}, kScreen, rows, 120, 17, 4);
    EXPECT_EQ(place.box, (ScreenRect{283, 310 - rows.Middle(4), 403, 310 - rows.Middle(4) + rows.Height()}));
    EXPECT_EQ(place.scroll, 0);
}

TEST(MenuPlaceTest, WithoutRoomTheMenuMovesIntoTheScreen) {
    MenuRows const rows(MenuOf(10));
    EXPECT_EQ(MenuPlace::Over({5, 790, 105, 810}, kScreen, rows, 120, 17, 1).box,
              (ScreenRect{0, 800 - rows.Height(), 120, 800}));
    EXPECT_EQ(MenuPlace::Over({950, -30, 1050, -10}, kScreen, rows, 120, 17, 10).box,
              (ScreenRect{880, 0, 1000, rows.Height()}));
}

TEST(MenuPlaceTest, AMenuHigherThanTheScreenIsCutToItAroundTheCurrentItem) {
    MenuRows const rows(MenuOf(100));
    MenuPlace const middle = MenuPlace::Over({300, 390, 400, 410}, kScreen, rows, 120, 17, 50);
    EXPECT_EQ(middle.box, (ScreenRect{283, 0, 403, 800}));
    EXPECT_EQ(middle.box.top + rows.Middle(50) - middle.scroll, 400);
    MenuPlace const first = MenuPlace::Over({300, 390, 400, 410}, kScreen, rows, 120, 17, 1);
    EXPECT_EQ(first.box, (ScreenRect{283, 400 - rows.Middle(1), 403, 800}));
    EXPECT_EQ(first.scroll, 0);
    MenuPlace const last = MenuPlace::Over({300, 390, 400, 410}, kScreen, rows, 120, 17, 100);
    EXPECT_EQ(last.box, (ScreenRect{283, 0, 403, 400 - rows.Middle(100) + rows.Height()}));
    EXPECT_EQ(last.scroll, rows.Height() - last.box.Height());
}

TEST(MenuPlaceTest, NearTheScreensEdgeAFewItemsShow) {
    MenuRows const rows(MenuOf(100));
    MenuPlace const place = MenuPlace::Over({300, 780, 400, 800}, kScreen, rows, 120, 17, 1);
    EXPECT_EQ(place.box, (ScreenRect{283, 560, 403, 800}));
    EXPECT_EQ(place.scroll, 0);
}

TEST(MenuPlaceTest, TakesAnyScreenAndPopUp) {
    for (ScreenRect screen : {ScreenRect{0, 0, 0, 0}, ScreenRect{10, 10, 5, 5}, ScreenRect{0, 0, 1, 1}}) {
        for (int items : {0, 1, 100}) {
            MenuRows const rows(MenuOf(items));
            MenuPlace const over = MenuPlace::Over({-30000, 30000, 30000, -30000}, screen, rows, 50, 17, -3);
            EXPECT_GE(over.box.Height(), 1);
            EXPECT_GE(over.scroll, 0);
            MenuPlace const beside = MenuPlace::Beside({0, 0, 10, 10}, 0, screen, rows, 50, 3);
            EXPECT_GE(beside.box.Height(), 1);
        }
    }
}

TEST(MenuPlaceTest, ASubmenuLiesOnTheSideWithRoom) {
    MenuRows const rows(MenuOf(3));
    EXPECT_EQ(MenuPlace::Beside({300, 100, 400, 300}, 200, kScreen, rows, 120, 3).box,
              (ScreenRect{397, 195, 517, 195 + rows.Height()}));
    EXPECT_EQ(MenuPlace::Beside({850, 100, 950, 300}, 200, kScreen, rows, 120, 3).box,
              (ScreenRect{733, 195, 853, 195 + rows.Height()}));
    EXPECT_EQ(MenuPlace::Beside({300, 700, 400, 800}, 780, kScreen, rows, 120, 3).box.bottom, 800);
}

// Columns

class MenuColumnsTest : public MenuTest {};

TEST_F(MenuColumnsTest, IconsAndDecoratorsMoveTheText) {
    Menu menu = MenuOf({"a", "b"});
    int const plain = MenuColumns(menu).TextLeft();
    menu.Change(2)->icon = 1;
    int const withIcon = MenuColumns(menu).TextLeft();
    EXPECT_GT(withIcon, plain);
    menu.Change(1)->submenu = 7;
    EXPECT_EQ(MenuColumns(menu).TextLeft(), withIcon);
    EXPECT_GT(MenuColumns(menu).RightPad(), MenuColumns(MenuOf({"a"})).RightPad());
}

TEST_F(MenuColumnsTest, TheWidestTextIsFoundAmongThoseThatDoNotShow) {
    ShowWindow();
    Menu menu = MenuOf(1000);
    menu.Change(900)->text = Text("the widest of them all by far, which nobody has seen so far");
    MenuColumns const columns(menu);
    EXPECT_GT(columns.NaturalWidth(menu, 1, 10), columns.NaturalWidth(MenuOf(1000), 1, 10) + 200);
}

// Aiming

namespace {

// Whether the last of the places still aims at a submenu to the right of (100, 0) to (100, 200).
bool Aims(std::initializer_list<ScreenPoint> places, ScreenRect const &submenu = {100, 0, 200, 200}) {
    MenuAim aim;
    bool aims = false;
    for (ScreenPoint place : places)
        aims = aim.Follow(place, submenu);
    return aims;
}

} // namespace

TEST(MenuAimTest, FollowsTheMouseTowardTheSubmenu) {
    EXPECT_TRUE(Aims({{50, 20}, {60, 40}}));
    EXPECT_TRUE(Aims({{50, 20}, {60, 40}, {70, 60}, {80, 80}}));
    EXPECT_TRUE(Aims({{250, 20}, {240, 40}})) << "a submenu on the left";
}

TEST(MenuAimTest, AWayElsewhereIsNoAim) {
    EXPECT_FALSE(Aims({{50, 20}}));
    EXPECT_FALSE(Aims({{50, 20}, {50, 60}})) << "straight down";
    EXPECT_FALSE(Aims({{50, 20}, {40, 40}})) << "away from it";
    EXPECT_FALSE(Aims({{50, 20}, {52, 120}})) << "too steep";
}

TEST(MenuAimTest, AStepStraightDownOnTheWayIsForgiven) {
    EXPECT_TRUE(Aims({{50, 20}, {60, 30}, {70, 40}, {70, 44}}));
}

// Typing

TEST(TypedPrefixTest, LooksFromTheCurrentItemOn) {
    Menu const menu = MenuOf({"Alpha", "Beta", "alto", "Gamma"});
    EXPECT_EQ(TypedPrefix().Type(UString("a", UString::kByteEncoding1), 0, menu, 1), 3);
    EXPECT_EQ(TypedPrefix().Type(UString("A", UString::kByteEncoding1), 0, menu, 3), 1);
    EXPECT_EQ(TypedPrefix().Type(UString("z", UString::kByteEncoding1), 0, menu, 1), 0);
    EXPECT_EQ(TypedPrefix().Type(UString("a", UString::kByteEncoding1), 0, menu, 0), 1);
    EXPECT_EQ(TypedPrefix().Type(UString("a", UString::kByteEncoding1), 0, Menu(), 0), 0);
}

TEST(TypedPrefixTest, LeavesOutWhatCannotBeChosen) {
    Menu menu = MenuOf({"x", "apple", "avocado"});
    menu.Change(2)->enabled = false;
    EXPECT_EQ(TypedPrefix().Type(UString("a", UString::kByteEncoding1), 0, menu, 1), 3);
}

TEST(TypedPrefixTest, LettersInQuickSuccessionMakeALongerBeginning) {
    Menu const menu = MenuOf({"x", "sine", "saw", "square"});
    TypedPrefix typed;
    EXPECT_EQ(typed.Type(UString("s", UString::kByteEncoding1), 0, menu, 1), 2);
    EXPECT_TRUE(typed.IsGoing(0.9));
    EXPECT_EQ(typed.Type(UString("q", UString::kByteEncoding1), 0.9, menu, 2), 4);
    EXPECT_FALSE(typed.IsGoing(2));
    EXPECT_EQ(typed.Type(UString("s", UString::kByteEncoding1), 2, menu, 4), 2);
}

// Closed pop-ups

TEST(PopupLayoutTest, IconTextAndArrowStandSideBySide) {
    Rect const r{10, 100, 30, 220};
    PopupLayout const all(r, kPulldownNormal, true);
    EXPECT_LT(all.icon.right, all.text.left + 1);
    EXPECT_LT(all.text.right, all.arrow.left + 1);
    EXPECT_LT(all.arrow.right, r.right);
    EXPECT_TRUE(all.hasArrow);
    PopupLayout const plain(r, kPulldownNormal, false);
    EXPECT_LT(plain.text.left, all.text.left);
}

TEST(PopupLayoutTest, WithoutAnArrowTheTextHasMoreRoom) {
    Rect const r{10, 100, 30, 220};
    PopupLayout const none(r, kPulldown0, false);
    EXPECT_FALSE(none.hasArrow);
    EXPECT_GT(none.text.right, PopupLayout(r, kPulldownNormal, false).text.right);
}

TEST(PopupLayoutTest, AnArrowAloneStandsInTheMiddle) {
    Rect const r{10, 100, 30, 140};
    for (PopupMenuPulldown alone : {kPulldownNoText, kPulldownNarrow}) {
        PopupLayout const parts(r, alone, false);
        EXPECT_NEAR((parts.arrow.left + parts.arrow.right) / 2, 120, 1);
        EXPECT_EQ(parts.text.left, parts.text.right);
    }
}

TEST(PopupLayoutTest, ANarrowOneHasItsArrowInTheCornerOfItsIcon) {
    PopupLayout const parts({10, 100, 30, 124}, kPulldownNarrow, true);
    EXPECT_TRUE(parts.narrowArrow);
    EXPECT_GT(parts.arrow.top, 20);
    EXPECT_GT(parts.arrow.left, 112);
}

TEST(PopupLayoutTest, TakesAnyRectangle) {
    for (Rect r :
         {Rect{0, 0, 0, 0}, Rect{5, 5, 6, 6}, Rect{30, 30, 10, 10}, Rect{-32768, -32768, 32767, 32767}}) {
        for (int pulldown = 0; pulldown <= 3; ++pulldown) {
            PopupLayout const parts(r, PopupMenuPulldown(pulldown), true);
            EXPECT_LE(parts.text.left, parts.text.right) << pulldown;
        }
    }
}

// Notes

TEST(NoteDurationTest, EveryNoteHasItsLength) {
    struct Case {
        int note;
        NoteDuration::Kind kind;
        int above, below;
    };
    for (Case c : {Case{0, NoteDuration::kPlain, 1, 1}, Case{0, NoteDuration::kDotted, 3, 2},
                   Case{0, NoteDuration::kTriplet, 2, 3}, Case{1, NoteDuration::kPlain, 1, 2},
                   Case{1, NoteDuration::kDotted, 3, 4}, Case{1, NoteDuration::kTriplet, 1, 3},
                   Case{2, NoteDuration::kTriplet, 1, 6}, Case{7, NoteDuration::kPlain, 1, 128},
                   Case{7, NoteDuration::kDotted, 3, 256}, Case{7, NoteDuration::kTriplet, 1, 192}}) {
        DurationValue const value = NoteDuration{c.note, c.kind}.Value();
        EXPECT_EQ(value.first, c.above) << c.note << ' ' << c.kind;
        EXPECT_EQ(value.second, c.below) << c.note << ' ' << c.kind;
    }
}

TEST(NoteDurationTest, IsFoundFromAnyFractionOfItsLength) {
    for (int kind = 0; kind < NoteDuration::kKindCount; ++kind) {
        for (int note = 0; note < NoteDuration::kNotes; ++note) {
            DurationValue const value = NoteDuration{note, NoteDuration::Kind(kind)}.Value();
            NoteDuration found;
            ASSERT_TRUE(NoteDuration::Find({value.first * 5, value.second * 5}, found));
            EXPECT_EQ(found.note, note);
            EXPECT_EQ(found.kind, kind);
        }
    }
}

TEST(NoteDurationTest, WhatIsNoNoteIsNotFound) {
    int const kMost = 2147483647, kLeast = -kMost - 1;
    for (DurationValue value :
         {DurationValue(), DurationValue(0, 4), DurationValue(1, 0), DurationValue(-1, -4),
          DurationValue(1, -4), DurationValue(5, 4), DurationValue(1, 256), DurationValue(7, 16),
          DurationValue(kMost, 1), DurationValue(1, kMost), DurationValue(kLeast, kLeast)}) {
        NoteDuration found{3, NoteDuration::kDotted};
        EXPECT_FALSE(NoteDuration::Find(value, found)) << value.first << '/' << value.second;
        EXPECT_EQ(found.note, 3);
    }
}

class NoteNames : public MenuTest {};

TEST_F(NoteNames, AreAllDifferentInEveryLanguage) {
    for (char const *language : {"en", "de"}) {
        Resources::Instance().SetLanguage(language);
        std::set<std::string> names;
        for (int kind = 0; kind < NoteDuration::kKindCount; ++kind)
            for (int note = 0; note < NoteDuration::kNotes; ++note)
                names.insert(Ascii(NoteDuration{note, NoteDuration::Kind(kind)}.Name()));
        EXPECT_EQ(names.size(), 24u) << language;
        EXPECT_EQ(names.count(""), 0u) << language;
    }
}
