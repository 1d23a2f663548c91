#include "tests/tabs/TabTest.h"
#include <map>

namespace {

int const kPlain = 0, kCondensed = TabPane::kUseCondensedText, kShort = TabPane::kUseShortNames;
int const kSize10 = TabPane::kTextSize10, kSize9 = TabPane::kTextSize9;

// Tabs whose widths without padding are the test's, a width for each way to draw the names. It tells the ways
// from one another by what a ruler measures in them.
class ScriptedTabs : public OpenTabs {
public:
    ScriptedTabs(glogRec *owner, Rect const &box, int count)
        : OpenTabs(owner, box, std::vector<Item>(static_cast<std::size_t>(count), Item(UString(), Ruler())),
                   0) {
        GetItem(0).textLayout.reset(new OS::TextLayout);
        for (int flags : {kPlain, kCondensed, kSize10, kCondensed | kSize10, kSize9, kCondensed | kSize9}) {
            SetTextDrawingFlags(flags);
            flagsByRuler[RulerWidth()] = flags;
        }
        SetTextDrawingFlags(0);
        isScripted = true;
    }

    void SetupFont() override {
        OpenTabs::SetupFont();
        if (isScripted)
            Note(NameOfFlags() + (Hidden() ? '-' + std::to_string(Hidden()) : ""));
    }
    void SetBox(Rect *box) override {
        OpenTabs::SetBox(box);
        if (isScripted)
            Note("box " + std::to_string(box->left) + " to " + std::to_string(box->right));
    }
    int GetMinTabWidth() const override { return leastWidth; }
    int GetNameExtraWidth(int item) const override {
        if (!isScripted)
            return 0;
        ScriptedTabs &self = const_cast<ScriptedTabs &>(*this);
        auto const width = widths.find(self.Flags());
        return (width == widths.end() ? plainWidth : width->second) - self.GetItemNameWidth(item);
    }

    // How names are drawn.
    int Flags() {
        bool const isShort = GetItemNameWidth(0) != 0;
        return flagsByRuler.at(RulerWidth()) | (isShort ? kShort : 0);
    }
    int Hidden() const {
        int hidden = 0;
        for (int i = 0; i < CountItems(); ++i)
            hidden += TabIsVisible(i) ? 0 : 1;
        return hidden;
    }
    // On each side of a name.
    int Padding() {
        Rect const tab = GetItemBox(0);
        auto const width = widths.find(Flags());
        return (tab.right - tab.left - (width == widths.end() ? plainWidth : width->second)) / 2;
    }

    int plainWidth = 60;       // of a tab without padding
    std::map<int, int> widths; // the same by flags, where it differs
    int leastWidth = 0;

    // What was done since the last call, one word or two for each step: the look that a row was laid out with
    // and how many items were hidden then; the box that the pane took.
    std::string Steps() {
        std::string taken;
        taken.swap(steps);
        return taken;
    }

private:
    static UString Ruler() {
        return UString("Wide enough to tell styles and sizes apart", UString::kByteEncoding1);
    }
    int RulerWidth() { return CachedStringWidth(Ruler(), layout); }
    void Note(std::string const &step) { steps += (steps.empty() ? "" : ", ") + step; }
    std::string NameOfFlags() {
        int const flags = Flags();
        std::string name = flags & kShort ? "short" : "";
        name += flags & kCondensed ? "condensed" : "";
        name += flags & kSize10 ? "10" : flags & kSize9 ? "9" : "";
        return name.empty() ? "plain" : name;
    }

    std::string steps;

    std::map<int, int> flagsByRuler;
    OS::TextLayout layout;
    bool isScripted = false;
};

class TabPaneFittingTest : public TabTest {
protected:
    // Three tabs at (10, 20).
    ScriptedTabs *MakeScripted(int count = 3) { return new ScriptedTabs(glog, {20, 10, 37, 310}, count); }
    // From the left edge of the pane.
    static Rect Target(int width) { return {20, 10, 37, static_cast<short>(10 + width)}; }
    static int RowWidth(TabPane &pane) { return Width(pane.GetOptimalRect()); }
};

} // namespace

TEST_F(TabPaneFittingTest, TheRulerTellsAllWaysApart) {
    ScriptedTabs *const pane = MakeScripted();
    for (int flags :
         {kPlain, kCondensed, kSize10, kCondensed | kSize10, kSize9, kCondensed | kSize9, kShort}) {
        pane->SetTextDrawingFlags(flags);
        EXPECT_EQ(pane->Flags(), flags);
    }
}

TEST_F(TabPaneFittingTest, ARowThatFitsIsPlainAndThePaneIsAsWideAsIt) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(400));
    EXPECT_EQ(pane->Padding(), 11);
    EXPECT_EQ(pane->Flags(), kPlain);
    EXPECT_EQ(pane->Hidden(), 0);
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 37, 10 + 3 * (60 + 22)}));
}

TEST_F(TabPaneFittingTest, ARowThatFitsExactlyFits) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(3 * 82));
    EXPECT_EQ(pane->Padding(), 11);
    EXPECT_EQ(Width(BoxOf(*pane)), 3 * 82);
}

TEST_F(TabPaneFittingTest, ThePaneKeepsTopAndBottom) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect({100, 10, 200, 400});
    EXPECT_EQ(BoxOf(*pane).top, 20);
    EXPECT_EQ(BoxOf(*pane).bottom, 37);
}

// Edges

TEST_F(TabPaneFittingTest, KeepsToTheLeftEdgeWhenTheRightOneHasMovedFurther) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect({20, 15, 37, 400});
    EXPECT_EQ(BoxOf(*pane).left, 15);
}

TEST_F(TabPaneFittingTest, KeepsToTheRightEdgeWhenTheLeftOneHasMovedFurther) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect({20, -60, 37, 320});
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 320 - 3 * 82, 37, 320}));
}

TEST_F(TabPaneFittingTest, KeepsToTheLeftEdgeWhenBothHaveMovedTheSame) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect({20, 0, 37, 300});
    EXPECT_EQ(BoxOf(*pane).left, 0);
}

// The least width

TEST_F(TabPaneFittingTest, NarrowTabsAreAsWideAsTheLeastWidth) {
    ScriptedTabs *const pane = MakeScripted();
    pane->leastWidth = 100;
    pane->FitIntoRect(Target(400));
    EXPECT_EQ(Width(pane->GetItemBox(0)), 100);
}

TEST_F(TabPaneFittingTest, TheLeastWidthIsWhatGivesFirst) {
    ScriptedTabs *const pane = MakeScripted();
    pane->leastWidth = 100;
    pane->FitIntoRect(Target(3 * 93 + 2));
    EXPECT_EQ(Width(pane->GetItemBox(0)), 93);
    EXPECT_EQ(pane->Flags(), kPlain);
}

TEST_F(TabPaneFittingTest, TheLeastWidthDoesNotGiveBelow30) {
    ScriptedTabs *const pane = MakeScripted();
    pane->plainWidth = 2;
    pane->leastWidth = 50;
    pane->FitIntoRect(Target(3 * 30));
    EXPECT_EQ(Width(pane->GetItemBox(0)), 30);
    EXPECT_EQ(pane->Flags(), kPlain);
    pane->FitIntoRect(Target(3 * 30 - 1));
    EXPECT_EQ(Width(pane->GetItemBox(0)), 30);
    EXPECT_EQ(pane->Hidden(), 1) << "neither padding nor text make it narrower";
}

TEST_F(TabPaneFittingTest, EachFitStartsWithTheWholeLeastWidth) {
    ScriptedTabs *const pane = MakeScripted();
    pane->leastWidth = 100;
    pane->FitIntoRect(Target(260));
    pane->FitIntoRect(Target(400));
    EXPECT_EQ(Width(pane->GetItemBox(0)), 100);
}

// Padding

TEST_F(TabPaneFittingTest, ThePaddingGivesAsMuchAsItHasTo) {
    ScriptedTabs *const pane = MakeScripted();
    // 6 sides of names: one pixel each for up to 6 that are missing.
    for (int missing = 1; missing < 48; ++missing) {
        pane->FitIntoRect(Target(3 * 82 - missing));
        int const taken = (missing + 5) / 6;
        EXPECT_EQ(pane->Padding(), 11 - taken) << missing;
        EXPECT_EQ(Width(BoxOf(*pane)), 3 * 82 - 6 * taken) << missing;
        EXPECT_EQ(pane->Flags(), kPlain) << missing;
    }
}

TEST_F(TabPaneFittingTest, WithAllThePaddingNeededItGoesStraightToTheLeast) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(3 * 82 - 48));
    EXPECT_EQ(pane->Padding(), 3);
    EXPECT_EQ(pane->Flags(), kPlain);
    EXPECT_EQ(Width(BoxOf(*pane)), 3 * 66);
    EXPECT_EQ(pane->Hidden(), 0);
}

// Text

TEST_F(TabPaneFittingTest, TextGivesInItsOrder) {
    ScriptedTabs *const pane = MakeScripted();
    int const order[] = {kCondensed, kSize10, kCondensed | kSize10, kSize9, kCondensed | kSize9, kShort};
    for (int flags : order) {
        pane->widths.clear();
        pane->widths[flags] = 20;
        // Later ways would fit too.
        for (int const *later = std::find(std::begin(order), std::end(order), flags);
             later != std::end(order); ++later)
            pane->widths[*later] = 20;
        pane->FitIntoRect(Target(3 * 26));
        EXPECT_EQ(pane->Flags(), flags);
        EXPECT_EQ(pane->Padding(), 3);
        EXPECT_EQ(pane->Hidden(), 0);
        EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 37, 10 + 3 * 26}));
    }
}

TEST_F(TabPaneFittingTest, ShortAndCondensedTogetherAreNeverTaken) {
    ScriptedTabs *const pane = MakeScripted();
    pane->widths[kShort | kCondensed] = 1;
    pane->FitIntoRect(Target(100));
    EXPECT_EQ(pane->Flags(), kPlain);
    EXPECT_GT(pane->Hidden(), 0);
}

// Hidden items

TEST_F(TabPaneFittingTest, HidesAsManyAsItHasToWithTheNamesPlainAgain) {
    struct Case {
        int width, hidden;
    };
    ScriptedTabs *const pane = MakeScripted(4);
    for (Case c : {Case{3 * 66 + 24, 1}, Case{3 * 66 + 23, 2}, Case{2 * 66 + 24, 2}, Case{66 + 24, 3},
                   Case{66 + 23, 4}, Case{24, 4}}) {
        pane->FitIntoRect(Target(c.width));
        EXPECT_EQ(pane->Hidden(), c.hidden) << c.width;
        EXPECT_EQ(pane->Flags(), kPlain) << c.width;
        EXPECT_EQ(Width(BoxOf(*pane)), (4 - c.hidden) * 66 + 24) << c.width;
    }
}

TEST_F(TabPaneFittingTest, WhatCannotFitTakesItsBoxAllTheSame) {
    ScriptedTabs *const pane = MakeScripted();
    for (int width : {23, 1, 0, -40}) {
        pane->FitIntoRect(Target(width));
        EXPECT_EQ(pane->Hidden(), 3) << width;
        EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 37, 34})) << width;
    }
}

TEST_F(TabPaneFittingTest, ASingleItemIsHiddenByItself) {
    ScriptedTabs *const pane = MakeScripted(1);
    pane->FitIntoRect(Target(30));
    EXPECT_EQ(pane->Hidden(), 1);
    EXPECT_EQ(pane->GetOptimalRect(), (Rect{20, 10, 37, 34}));
}

TEST_F(TabPaneFittingTest, AnEmptyRowFitsAnywhere) {
    TabPane *const pane = Make({});
    for (int width : {100, 0, -50}) {
        pane->FitIntoRect(Target(width));
        EXPECT_EQ(Width(BoxOf(*pane)), 0) << width;
    }
}

TEST_F(TabPaneFittingTest, MoreRoomBringsEverythingBack) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(30));
    pane->FitIntoRect(Target(300));
    EXPECT_EQ(pane->Hidden(), 0);
    EXPECT_EQ(pane->Padding(), 11);
    EXPECT_EQ(pane->Flags(), kPlain);
}

TEST_F(TabPaneFittingTest, DeletionsLeaveTheNumberOfHiddenItems) {
    ScriptedTabs *const pane = MakeScripted(4);
    pane->FitIntoRect(Target(66 + 24));
    ASSERT_EQ(pane->Hidden(), 3);
    pane->DeleteItem(0);
    EXPECT_EQ(pane->Hidden(), 3) << "no tab is visible any more";
    pane->DeleteItem(0);
    EXPECT_FALSE(pane->TabIsVisible(0));
    EXPECT_EQ(Width(pane->GetItemBox(1)), 24);
    Show();
    EXPECT_TRUE(Only("Draw1Icon", DrawingOf(*pane)).empty()) << "there are fewer items than are hidden";
    pane->DeleteAllItems();
    EXPECT_EQ(pane->GetOptimalRect(), (Rect{0, 0, 0, 0}));
    EXPECT_TRUE(Only("Draw1Icon", DrawingOf(*pane)).empty());
}

// Step by step

TEST_F(TabPaneFittingTest, TheRowIsMeasuredAsItIsFirst) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(3 * 82));
    EXPECT_EQ(pane->Steps(), "plain, box 10 to 256");
}

TEST_F(TabPaneFittingTest, WithoutALeastWidthThereIsNothingToNarrow) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(3 * 82 - 6));
    EXPECT_EQ(pane->Steps(), "plain, plain, plain, plain, box 10 to 250")
        << "as it is, to be narrowed, once more, and with less padding";
}

TEST_F(TabPaneFittingTest, TheLeastWidthGivesPixelByPixelAndTheRowIsMeasuredOnceMore) {
    ScriptedTabs *const pane = MakeScripted();
    pane->leastWidth = 90;
    pane->FitIntoRect(Target(3 * 87));
    EXPECT_EQ(pane->Steps(), "plain, plain, plain, plain, plain, plain, box 10 to 271")
        << "as it is; 90, 89, 88 and 87 wide; once more";
}

TEST_F(TabPaneFittingTest, TheLeastWidthIsGivenUpAt30) {
    ScriptedTabs *const pane = MakeScripted(1);
    pane->plainWidth = 2;
    pane->leastWidth = 32;
    pane->FitIntoRect(Target(29));
    // as it is; 32, 31 and 30 wide; once more; with less padding; with the least
    EXPECT_EQ(pane->Steps().find("plain, plain, plain, plain, plain, plain, plain, condensed"), 0u);
}

TEST_F(TabPaneFittingTest, PaddingThatCannotSufficeIsNotTried) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(3 * 82 - 48));
    EXPECT_EQ(pane->Steps(), "plain, plain, plain, plain, box 10 to 208")
        << "as it is, to be narrowed, once more, and with the least padding";
}

TEST_F(TabPaneFittingTest, PaddingThatShouldSufficeIsTriedBeforeTheLeastOne) {
    // Wider tabs when the padding gives: it does not suffice then.
    class Stubborn : public ScriptedTabs {
    public:
        using ScriptedTabs::ScriptedTabs;
        int GetNameExtraWidth(int item) const override {
            bool const gives = ++asked > 3; // rows
            return ScriptedTabs::GetNameExtraWidth(item) + (gives ? 10 : 0);
        }
        mutable int asked = 0;
    };
    Stubborn *const pane = new Stubborn(glog, {20, 10, 37, 310}, 1);
    pane->Steps();
    pane->asked = 0;
    pane->FitIntoRect(Target(80));
    EXPECT_EQ(pane->Steps(), "plain, plain, plain, plain, plain, box 10 to 86");
}

TEST_F(TabPaneFittingTest, EachWayOfDrawingIsLaidOutWhenItIsSetAndMeasuredWhenItIsTried) {
    ScriptedTabs *const pane = MakeScripted();
    pane->widths[kShort] = 20;
    pane->FitIntoRect(Target(3 * 26));
    EXPECT_EQ(pane->Steps(), "plain, plain, plain, plain, "
                             "condensed, condensed, 10, 10, condensed10, condensed10, 9, 9, "
                             "condensed9, condensed9, short, short, box 10 to 88");
}

TEST_F(TabPaneFittingTest, ShortAndCondensedIsLaidOutAndNotTried) {
    ScriptedTabs *const pane = MakeScripted();
    pane->FitIntoRect(Target(100));
    std::string const steps = pane->Steps();
    EXPECT_NE(steps.find("short, short, shortcondensed, plain, "), std::string::npos) << steps;
}

TEST_F(TabPaneFittingTest, OneItemAfterTheOtherIsHidden) {
    ScriptedTabs *const pane = MakeScripted(5);
    pane->FitIntoRect(Target(2 * 66 + 24));
    std::string const steps = pane->Steps(), end = "shortcondensed, ";
    EXPECT_EQ(steps.substr(steps.find(end) + end.size()),
              "plain, plain-1, plain-2, plain-3, box 10 to 166, plain-3, box 10 to 166")
        << "the first is laid out before anything is hidden; the box is taken twice";
}

TEST_F(TabPaneFittingTest, WhatDoesNotFitWithEverythingHiddenIsMeasuredOnceMoreAndTaken) {
    ScriptedTabs *const pane = MakeScripted(2);
    pane->FitIntoRect(Target(5));
    std::string const steps = pane->Steps(), end = "shortcondensed, ";
    EXPECT_EQ(steps.substr(steps.find(end) + end.size()), "plain, plain-1, plain-2, plain-2, box 10 to 34");
}

TEST_F(TabPaneFittingTest, TheLastBoxKeepsToTheEdgeThatTheFirstStepHasChosen) {
    ScriptedTabs *const pane = MakeScripted(5);
    pane->FitIntoRect({20, 154, 37, 310});
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 310 - 2 * 66 - 24, 37, 310}));
}

TEST_F(TabPaneFittingTest, HidesMoreWhenTabsAreWiderInShortRows) {
    // Each hidden item makes the tabs that still show 40 pixels wider.
    class Growing : public ScriptedTabs {
    public:
        using ScriptedTabs::ScriptedTabs;
        int GetNameExtraWidth(int item) const override {
            return ScriptedTabs::GetNameExtraWidth(item) + 40 * Hidden();
        }
    };
    Growing *const pane = new Growing(glog, {20, 10, 37, 310}, 4);
    pane->FitIntoRect(Target(3 * 66 + 24));
    EXPECT_EQ(pane->Hidden(), 3) << "106 + 106 + 106, 146 + 146, 186";
}

// Repaints

TEST_F(TabPaneFittingTest, WhereThePaneWasAndWhereItIsAreRepainted) {
    ScriptedTabs *const pane = MakeScripted();
    Show();
    pane->FitIntoRect(Target(150));
    std::vector<Rect> const repainted = Repainted();
    ASSERT_EQ(repainted.size(), 1u);
    EXPECT_EQ(repainted[0], (Rect{20, 10, 37, 310}));
    Rect const narrow = BoxOf(*pane);
    pane->FitIntoRect(Target(300));
    ASSERT_GT(BoxOf(*pane).right, narrow.right);
    EXPECT_EQ(Repainted(), std::vector<Rect>{BoxOf(*pane)}) << "where it is now";
}

TEST_F(TabPaneFittingTest, ManyTabsFitAnyWidth) {
    std::vector<TabPane::Item> items;
    for (int i = 0; i < 40; ++i)
        items.push_back(TabPane::Item(Text("Track"), Text("T")));
    TabPane *const pane = new TabPane(glog, Rect{20, 10, 37, 310}, items, 0);
    for (int width = 0; width < 4000; width += 37) {
        pane->FitIntoRect(Target(width));
        EXPECT_LE(Width(BoxOf(*pane)), std::max(width, 24)) << width;
        EXPECT_EQ(Width(BoxOf(*pane)), RowWidth(*pane)) << width;
    }
}
