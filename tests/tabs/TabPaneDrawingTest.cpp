#include "desktop/drawing/Surface.h"
#include "host/Icons.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tests/tabs/TabTest.h"

namespace {

// What tabs of the given pieces look like.
struct Pieces {
    short left, body, right;
};

class TabPaneDrawingTest : public TabTest {
protected:
    static void DrawPieces(Rect const &tab, Pieces const &pieces) {
        Rect body = {tab.top, static_cast<short>(tab.left + 6), tab.bottom,
                     static_cast<short>(tab.right - 6)};
        Draw1Icon(1000, pieces.left, tab.left, tab.top);
        TileIcon(&body, 1000, pieces.body, 18, 17);
        Draw1Icon(1000, pieces.right, static_cast<short>(tab.right - 6), tab.top);
    }
    static void DrawName(UString const &name, Rect const &box, short style = 1, short size = 11,
                         TextSettings::TruncateCode truncation = TextSettings::kTruncateNone) {
        OS::TextLayout layout;
        DrawTextLayoutInRect(layout, name, box, GetIndVelaFont(3)->family, style, size,
                             TextSettings::kAlignCenter, truncation, 1, 0, 0, 0, 0.0f, 1.0f, 1.0f);
    }
    // The calls of a row that is drawn by the function.
    Lines Row(TabPane &pane, std::function<void()> const &draw) {
        return Traced(pane, [&] {
            pane.Prepare();
            SaveColors const colors;
            GrayForeColor(20);
            GrayBackColor(100);
            draw();
        });
    }
    static UString Mark() { return UString("\xC8", UString::kByteEncoding1); }
};

// Writes down what it is asked, and looks otherwise.
class Restyled : public OpenTabs {
public:
    using OpenTabs::OpenTabs;
    bool WindowIsActive() const override { return false; }
    int GetTabEndWidth() const override { return 9; }
    int GetTabBodyWidth() const override { return 12; }
    int GetTabHeight() const override { return 21; }
    int GetIconSet() const override { return 1841; }
    int GetIcon(Part part, int item, bool active) override {
        asked += (active ? 'A' : 'a') + std::to_string(int(part)) + std::to_string(item) + ' ';
        return part;
    }
    Rect AdjustNameBox(Rect box, int) const override {
        return {static_cast<short>(box.top + 2), box.left, box.bottom, static_cast<short>(box.right - 10)};
    }
    void SetTextColor(bool selected) override { asked += selected ? "on " : "off "; }
    void DecorateTab(Rect tab, Rect nameBox, int item, int nameWidth) override {
        asked += "decorate ";
        tabs.push_back(tab);
        names.push_back(nameBox);
        EXPECT_EQ(nameWidth, GetItemNameWidth(item));
    }
    std::string asked;
    std::vector<Rect> tabs, names;
};

} // namespace

TEST_F(TabPaneDrawingTest, TabsAreDrawnPieceByPieceWithTheirNames) {
    TabPane *const pane = Make();
    pane->SetSelectedItem(1);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Row(*pane, [&] {
                  Pieces const pieces[] = {{70, 73, 72}, {77, 77, 76}, {73, 73, 71}};
                  for (int i = 0; i < 3; ++i) {
                      DrawPieces(pane->GetItemBox(i), pieces[i]);
                      DrawName(pane->GetItemName(i), pane->GetItemBox(i));
                  }
              }));
}

TEST_F(TabPaneDrawingTest, TabsAreDrawnInTheirOwnPort) {
    TabPane *const pane = Make();
    Show();
    LeaveForAnotherPort();
    (pane->*&Opened<TabPane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(TabPaneDrawingTest, HasAnIconForEveryPieceAndPlace) {
    TabPane *const pane = Make();
    struct Case {
        int part, item, plain, selected;
    };
    for (Case c : {Case{0, 0, 70, 74}, Case{0, 1, 73, 77}, Case{0, 2, 73, 77}, Case{1, 0, 72, 76},
                   Case{1, 1, 72, 76}, Case{1, 2, 71, 75}, Case{2, 0, 73, 77}, Case{2, 2, 73, 77},
                   Case{3, 1, 73, 73}, Case{-1, 0, 73, 73}, Case{99, 2, 73, 73}}) {
        for (bool active : {false, true}) {
            pane->SetSelectedItem_NoBroadcast(c.item + 1);
            EXPECT_EQ(pane->GetIcon(TabPane::Part(c.part), c.item, active), c.plain) << c.part << c.item;
            pane->SetSelectedItem_NoBroadcast(c.item);
            EXPECT_EQ(pane->GetIcon(TabPane::Part(c.part), c.item, active), c.selected) << c.part << c.item;
        }
    }
}

TEST_F(TabPaneDrawingTest, ATabByItselfIsFirstAndLast) {
    TabPane *const pane = Make({"a"});
    EXPECT_EQ(pane->GetIcon(TabPane::kLeftEnd, 0, true), 74);
    EXPECT_EQ(pane->GetIcon(TabPane::kRightEnd, 0, true), 75);
}

TEST_F(TabPaneDrawingTest, ARowWithoutTabsDrawsNothing) {
    TabPane *const pane = Make({});
    Show();
    EXPECT_EQ(DrawingOf(*pane), Row(*pane, [] {}));
}

TEST_F(TabPaneDrawingTest, ShortNamesAreDrawnWhereTheyAreWanted) {
    TabPane *const pane = Make({"Instrument"});
    pane->SetItemShortName(0, Text("Inst"));
    pane->SetTextDrawingFlags(TabPane::kUseShortNames | TabPane::kUseCondensedText | TabPane::kTextSize10);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Row(*pane, [&] {
                  DrawPieces(pane->GetItemBox(0), {74, 77, 75});
                  DrawName(Text("Inst"), pane->GetItemBox(0), 32, 10);
              }));
}

TEST_F(TabPaneDrawingTest, HiddenItemsHaveOneSelectedTabWithAMark) {
    TabPane *const pane = Make({"one", "two", "three", "four"});
    pane->FitIntoRect({20, 10, 37, 72});
    ASSERT_TRUE(pane->TabIsVisible(0));
    ASSERT_FALSE(pane->TabIsVisible(1));
    Show();
    EXPECT_EQ(DrawingOf(*pane), Row(*pane, [&] {
                  DrawPieces(pane->GetItemBox(0), {74, 77, 76});
                  DrawName(Text("one"), pane->GetItemBox(0));
                  DrawPieces(pane->GetItemBox(3), {77, 77, 75});
                  VelaDrawing::TextSize(20);
                  DrawName(Mark(), pane->GetItemBox(3), 1, 11, TextSettings::kTruncateEnd);
              }));
    EXPECT_EQ(pane->GetSelectedItem(), 0);
}

TEST_F(TabPaneDrawingTest, AnOnlyItemThatIsHiddenShowsItsName) {
    TabPane *const pane = Make({"Instrument"});
    pane->FitIntoRect({20, 10, 37, 40});
    ASSERT_FALSE(pane->TabIsVisible(0));
    Show();
    EXPECT_EQ(DrawingOf(*pane), Row(*pane, [&] {
                  DrawPieces(pane->GetItemBox(0), {74, 77, 75});
                  DrawName(Text("Instrument"), pane->GetItemBox(0), 1, 11, TextSettings::kTruncateEnd);
              }));
}

TEST_F(TabPaneDrawingTest, OverflowWithNothingHiddenDrawsOrdinaryTabs) {
    TabPane *const pane = Make();
    Show();
    Lines const ordinary = DrawingOf(*pane);
    pane->SetTextDrawingFlags(TabPane::kOverflow);
    EXPECT_EQ(DrawingOf(*pane), ordinary);
}

TEST_F(TabPaneDrawingTest, SubclassesRestyleTabs) {
    Restyled *const pane = new Restyled(glog, Rect{20, 10, 41, 310}, Items({"a", "b"}), 0);
    Show();
    pane->asked.clear();
    pane->tabs.clear();
    pane->names.clear();
    Lines const lines = DrawingOf(*pane);
    EXPECT_EQ(pane->asked, "a00 a20 a10 on decorate a01 a21 a11 off decorate ");
    EXPECT_EQ(pane->tabs, (std::vector<Rect>{pane->GetItemBox(0), pane->GetItemBox(1)}));
    EXPECT_EQ(pane->names, (std::vector<Rect>{pane->AdjustNameBox(pane->GetItemBox(0), 0),
                                              pane->AdjustNameBox(pane->GetItemBox(1), 1)}));
    EXPECT_EQ(Only("TileIcon", lines), Only("TileIcon", Row(*pane,
                                                            [&] {
                                                                for (int i = 0; i < 2; ++i) {
                                                                    Rect body = pane->GetItemBox(i);
                                                                    VelaDrawing::InsetRect(&body, 6, 0);
                                                                    TileIcon(&body, 1841, 2, 12, 21);
                                                                }
                                                            })))
        << "the body begins 6 from the edges, whatever the ends";
    EXPECT_EQ(Only("Draw1Icon", lines), Only("Draw1Icon", Row(*pane, [&] {
                                                 for (int i = 0; i < 2; ++i) {
                                                     Rect const tab = pane->GetItemBox(i);
                                                     Draw1Icon(1841, 0, tab.left, tab.top);
                                                     Draw1Icon(1841, 1, static_cast<short>(tab.right - 9),
                                                               tab.top);
                                                 }
                                             })));
}

TEST_F(TabPaneDrawingTest, TheTabOfHiddenItemsIsNotDecorated) {
    Restyled *const pane = new Restyled(glog, Rect{20, 10, 41, 310}, Items({"one", "two", "three"}), 0);
    pane->FitIntoRect({20, 10, 41, 40});
    Show();
    pane->asked.clear();
    DrawingOf(*pane);
    EXPECT_EQ(pane->asked, "a02 a22 a12 on ") << "it is drawn as the last tab";
}

TEST_F(TabPaneDrawingTest, TheTabOfHiddenItemsShowsNoSignOfASelectedOne) {
    TabPane *const pane = Make({"one", "two", "three", "four"});
    pane->FitIntoRect({20, 10, 37, 72});
    pane->SetSelectedItem(-1);
    Show();
    Lines const none = DrawingOf(*pane);
    for (int hidden : {1, 2, 3}) {
        pane->SetSelectedItem(hidden);
        EXPECT_EQ(DrawingOf(*pane), none) << hidden;
    }
}

TEST_F(TabPaneDrawingTest, ASubclassMayChangeTheRowWhileItIsDrawn) {
    // Gives the first tab another name, and takes away the last one, when it is decorated.
    class Changing : public OpenTabs {
    public:
        using OpenTabs::OpenTabs;
        void DecorateTab(Rect, Rect, int item, int) override {
            ++decorated;
            if (item != 0 || CountItems() == 1)
                return;
            SetItemName(0, UString("longer than before", UString::kByteEncoding1));
            DeleteItem(CountItems() - 1);
        }
        int decorated = 0;
    };
    Changing *const pane = new Changing(glog, Rect{20, 10, 37, 310}, Items({"a", "b"}), 0);
    Show();
    EXPECT_EQ(pane->CountItems(), 1);
    EXPECT_GE(pane->decorated, 1);
}

TEST_F(TabPaneDrawingTest, ANarrowLastTabHasRoundCornersToo) {
    TabPane *const pane = Make({"first", "W"});
    pane->FitIntoRect({20, 10, 37, 60});
    ASSERT_TRUE(pane->TabIsVisible(1));
    Rect const tab = pane->GetItemBox(1);
    ASSERT_LT(Width(tab), 24);
    Show();
    Surface const &picture = *desktop.Picture(glog);
    std::uint32_t const ground = picture.Row(tab.top - 2)[tab.right - 1];
    EXPECT_EQ(picture.Row(tab.top)[tab.right], ground);
    EXPECT_NE(picture.Row(tab.top)[tab.right - 8], ground);
    // The corner's pixel is the right end's alone: over the body it would be darker.
    TabPane *const wide = Make({"first", "as wide as it may be"});
    Rect below{60, 10, 77, 310};
    wide->SetBox(&below);
    wide->Inval();
    UpdateGlog(glog);
    Rect const other = wide->GetItemBox(1);
    Surface const &both = *desktop.Picture(glog);
    for (int v = 0; v < 17; ++v)
        for (int h = 1; h <= 2; ++h)
            EXPECT_EQ(both.Row(tab.top + v)[tab.right - h], both.Row(other.top + v)[other.right - h])
                << v << h;
}

TEST_F(TabPaneDrawingTest, KeepsTheColors) {
    TabPane *const pane = Make();
    Show();
    EXPECT_TRUE(KeepsColors(*pane));
}
