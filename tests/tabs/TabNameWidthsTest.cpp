#include "tabs/TabNameWidths.h"
#include "tests/frame/Allocations.h"
#include "tests/tabs/TabTest.h"

namespace {

class TabNameWidthsTest : public TabTest {
protected:
    static double Shaped(OS::TextLayout &layout) { return layout.GetWidth(); }
};

} // namespace

TEST_F(TabNameWidthsTest, ANameThatWasMeasuredIsFoundWithoutMemory) {
    OpenTabs *const pane = Make({"A name that is measured once"});
    int const width = pane->GetItemNameWidth(0);
    Allocations::Counter const allocations;
    EXPECT_EQ(pane->GetItemNameWidth(0), width);
    EXPECT_EQ(allocations.Count(), 0);
}

TEST_F(TabNameWidthsTest, ARowOfKnownNamesIsLaidOutWithoutMemory) {
    OpenTabs *const pane = Make();
    pane->FitIntoRect({20, 10, 37, 60});
    pane->FitIntoRect({20, 10, 37, 300});
    Allocations::Counter const allocations;
    pane->FitIntoRect({20, 10, 37, 60});
    EXPECT_EQ(allocations.Count(), 0);
}

TEST_F(TabNameWidthsTest, ANameIsShapedOnceForAllPanes) {
    OpenTabs *const first = Make({"A name of two panes"});
    OpenTabs *const second = Make({"A name of two panes"});
    int const width = (first->GetItemBox(0), first->GetItemNameWidth(0));
    EXPECT_GT(Shaped(*first->GetItem(0).textLayout), 0);
    EXPECT_EQ((second->GetItemBox(0), second->GetItemNameWidth(0)), width);
    EXPECT_EQ(Shaped(*second->GetItem(0).textLayout), 0) << "its layout was not needed";
}

TEST_F(TabNameWidthsTest, OtherFlagsAreAnotherWidth) {
    OpenTabs *const pane = Make({"A name of two sizes"});
    int const plain = (pane->GetItemBox(0), pane->GetItemNameWidth(0));
    pane->SetTextDrawingFlags(TabPane::kTextSize9);
    EXPECT_LT(pane->GetItemNameWidth(0), plain);
    pane->SetTextDrawingFlags(0);
    EXPECT_EQ(pane->GetItemNameWidth(0), plain);
}

TEST_F(TabNameWidthsTest, EveryWidthIsFoundAgain) {
    OS::Font::FamilyID const family = GetIndVelaFont(3)->family;
    TabNameWidths &widths = TabNameWidths::Instance();
    struct Known {
        UString text;
        short style, size;
        int width;
    };
    std::vector<Known> known;
    for (char const *text : {"", "b", "ab", "a", "Track 10", "Track 9", "z"})
        for (short style : {0, 1, 32})
            for (short size : {9, 10, 11}) {
                OS::TextLayout layout;
                known.push_back(
                    {Text(text), style, size, widths.WidthOf(Text(text), layout, family, style, size)});
            }
    for (Known const &one : known) {
        OS::TextLayout layout;
        EXPECT_EQ(widths.WidthOf(one.text, layout, family, one.style, one.size), one.width);
        EXPECT_EQ(layout.GetWidth(), 0) << "it was shaped again";
    }
}
