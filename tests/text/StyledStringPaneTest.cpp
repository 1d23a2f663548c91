#include "text/StyledStringPane.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/NamedColors.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/text/WatchedItem.h"
#include <algorithm>
#include <memory>

namespace {

class StyledStringTest : public PaneTest {
protected:
    static AutoPtr<StyledStringItem> Part(char const *text, int font = 0, RGBColor const *color = nullptr) {
        return NewStyledText(Text(text), *GetIndVelaFont(font), color);
    }
    static int WidthOf(char const *text, int font = 0) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(font));
        return LooseStringWidth(Text(text), 0.0f, 1.0f);
    }
    static short AscentOf(int font) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(font));
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return info.ascent;
    }
    StyledStringPane *New(Rect box, bool keepRight = false) {
        StyledStringPane *const pane = new StyledStringPane(glog, 3, keepRight);
        pane->SetBox(&box);
        return pane;
    }
    // The pane with the text, as it draws when it is aligned so.
    Lines DrawnAligned(StyledStringPane &pane, int alignment) {
        pane.SetAlignment(alignment);
        return Only("MoveTo", DrawingOf(pane));
    }
    Lines Pen(StyledStringPane &pane, int h, int v) {
        return Traced(pane, [=] { VelaDrawing::MoveTo(static_cast<short>(h), static_cast<short>(v)); });
    }
    // A glog with a style sheet, instead of the one without.
    void GiveSheet(int spacing, int border) {
        TestItem item;
        item.Integer("GStyledString_LineSpacing", spacing).Integer("GStyledString_TopBorder", border);
        glog = desktop.NewGlog(
            GlogOptions().Size(320, 200).StyleSheet(std::make_shared<GlogStyleSheet>(item.Container())));
    }
};

class CountingPane : public StyledStringPane {
public:
    using StyledStringPane::StyledStringPane;
    void Inval() override {
        ++invalidations;
        StyledStringPane::Inval();
    }
    int invalidations = 0;
};

// Knows whether it lives.
class WatchedPart : public StyledStringItem {
public:
    explicit WatchedPart(bool &alive_)
        : alive(alive_) {
        alive = true;
    }
    ~WatchedPart() override { alive = false; }

private:
    bool &alive;
};

} // namespace

// The text

TEST_F(StyledStringTest, AStringWithoutPartsHasNoSize) {
    StyledString const string;
    EXPECT_EQ(string.GetWidth(), 0);
    EXPECT_EQ(string.GetAscent(), 0);
}

TEST_F(StyledStringTest, AStringIsAsWideAsItsPartsTogetherAndAsHighAsTheHighest) {
    StyledString string;
    string.Add(Part("Level ", 0));
    string.Add(Part("-6 dB", 7));
    EXPECT_EQ(string.GetWidth(), WidthOf("Level ", 0) + WidthOf("-6 dB", 7));
    EXPECT_EQ(string.GetAscent(), std::max(AscentOf(0), AscentOf(7)));
    string.Add(AutoPtr<StyledStringItem>());
    EXPECT_EQ(string.GetWidth(), WidthOf("Level ", 0) + WidthOf("-6 dB", 7));
}

TEST_F(StyledStringTest, AStringOwnsItsParts) {
    bool alive = false;
    {
        StyledString string;
        string.Add(AutoPtr<StyledStringItem>(new WatchedPart(alive)));
        EXPECT_TRUE(alive);
        EXPECT_EQ(string.GetWidth(), 0); // of a kind that shows nothing
    }
    EXPECT_FALSE(alive);
}

TEST_F(StyledStringTest, AStringIsMeasuredWithoutAWindowToo) {
    SetPortToGlog(glog);
    fontSaveRec const large = *GetIndVelaFont(7);
    SetFontData(&large);
    StyledString string;
    string.Add(Part("Level", 0));
    EXPECT_EQ(string.GetWidth(), WidthOf("Level", 0));
}

TEST_F(StyledStringTest, AStringIsDrawnPartByPartFromThePen) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    RGBColor const red = {0xFFFF, 0, 0};
    StyledString string;
    string.Add(Part("Level ", 0));
    string.Add(Part("-6 dB", 7, &red));
    Lines const drawn = Traced(*pane, [&] {
        VelaDrawing::MoveTo(20, 30);
        string.Draw();
    });
    Lines const expected = Traced(*pane, [&] {
        VelaDrawing::MoveTo(20, 30);
        SetFontData(GetIndVelaFont(0));
        DrawString(Text("Level "));
        SetFontData(GetIndVelaFont(7));
        VelaDrawing::RGBForeColor(red);
        DrawString(Text("-6 dB"));
    });
    EXPECT_EQ(Only("DrawString", drawn), Only("DrawString", expected));
    EXPECT_EQ(Only("DrawString", drawn).size(), 2U);
}

// The pane

TEST_F(StyledStringTest, ShowsNothingWithoutAText) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    EXPECT_EQ(Only("DrawString", DrawingOf(*pane)), Lines());
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(Only("DrawString", DrawingOf(*pane)).size(), 1U);
    pane->AdoptStyledString(AutoPtr<StyledString>());
    EXPECT_EQ(Only("DrawString", DrawingOf(*pane)), Lines());
}

TEST_F(StyledStringTest, WithoutAGlogTakesATextAllTheSame) {
    StyledStringPane pane(nullptr, 3, true);
    pane.AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(pane.GetGlog(), nullptr);
}

TEST_F(StyledStringTest, StandsAtTheLeftTheRightOrInTheMiddle) {
    StyledStringPane *const pane = New({10, 20, 40, 201});
    pane->AdoptStyledStringItem(Part("Level"));
    int const width = WidthOf("Level"), baseline = 10 + AscentOf(0);
    EXPECT_EQ(DrawnAligned(*pane, StyledStringPane::kLeft), Pen(*pane, 20, baseline));
    EXPECT_EQ(DrawnAligned(*pane, StyledStringPane::kRight), Pen(*pane, 201 - width, baseline));
    EXPECT_EQ(DrawnAligned(*pane, StyledStringPane::kCentre), Pen(*pane, (201 + 20 - width) / 2, baseline));
    for (int const other : {5, 3, -1})
        EXPECT_EQ(DrawnAligned(*pane, other), Pen(*pane, 20, baseline)) << other;
}

TEST_F(StyledStringTest, LeavesTheRoomAboveThatTheGlogsSheetSays) {
    GiveSheet(18, 4);
    StyledStringPane *const pane = New({10, 20, 40, 200});
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(Only("MoveTo", DrawingOf(*pane)), Pen(*pane, 20, 10 + 4 + AscentOf(0)));
}

TEST_F(StyledStringTest, ErasesItsBoxOnlyWhenToldTo) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    EXPECT_EQ(Only("EraseRect", DrawingOf(*pane)), Lines());
    pane->SetEraseBackground(true);
    EXPECT_EQ(Only("EraseRect", DrawingOf(*pane)).size(), 1U); // without a text, too
}

TEST_F(StyledStringTest, DrawsInTheColourOfDialogTextAndLeavesThePorts) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(Only("RGBForeColor", DrawingOf(*pane)),
              Traced(*pane, [] { VelaDrawing::RGBForeColor(kDialogActiveTextColor); }));
    EXPECT_TRUE(KeepsColors(*pane));
}

TEST_F(StyledStringTest, DeletesTheTextThatItHadAndItsLast) {
    bool first = false, second = false;
    {
        StyledStringPane pane(glog, 3, false);
        pane.AdoptStyledStringItem(AutoPtr<StyledStringItem>(new WatchedPart(first)));
        pane.AdoptStyledStringItem(AutoPtr<StyledStringItem>(new WatchedPart(second)));
        EXPECT_FALSE(first);
        EXPECT_TRUE(second);
    }
    EXPECT_FALSE(second);
}

TEST_F(StyledStringTest, KeepsTheTextThatItIsGivenOnceMoreAndRedraws) {
    bool alive = false;
    std::unique_ptr<CountingPane> const pane(new CountingPane(glog, 3, false)); // gone before `alive`
    StyledString *const text = new StyledString;
    text->Add(AutoPtr<StyledStringItem>(new WatchedPart(alive)));
    pane->AdoptStyledString(AutoPtr<StyledString>(text));
    EXPECT_EQ(pane->invalidations, 1);
    pane->AdoptStyledString(AutoPtr<StyledString>(text));
    EXPECT_TRUE(alive);
    EXPECT_EQ(pane->invalidations, 2);
    pane->SetAlignment(2);
    pane->SetEraseBackground(true);
    EXPECT_EQ(pane->invalidations, 2);
}

// Geometry

TEST_F(StyledStringTest, KeepsItsBoxWithoutTheRightDistance) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    PositionGlog(glog, std::make_unique<Rect>(Rect{0, 0, 200, 500}).get(), false);
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 40, 200}));
}

TEST_F(StyledStringTest, KeepsTheDistanceFromTheWindowsRightEdge) {
    StyledStringPane *const pane = New({10, 20, 40, 200}, true); // 120 away
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 40, 200}));
    PositionGlog(glog, std::make_unique<Rect>(Rect{0, 0, 200, 500}).get(), false);
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 40, 380}));
}

TEST_F(StyledStringTest, MeasuresTheRightDistanceAnewWithEveryBox) {
    StyledStringPane *const pane = New({10, 20, 40, 200}, true);
    Rect nearer = {10, 20, 40, 310};
    pane->SetBox(&nearer);
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane), nearer);
    PositionGlog(glog, std::make_unique<Rect>(Rect{0, 0, 200, 500}).get(), false);
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane).right, 490);
}

TEST_F(StyledStringTest, IsMeasuredFromTheRightEdgeWithoutABox) {
    StyledStringPane *const pane = new StyledStringPane(glog, 3, true);
    pane->CalcBox();
    EXPECT_EQ(BoxOf(*pane).right, 0);
}

TEST_F(StyledStringTest, InALayoutIsAsWideAsItsTextAndAsHighAsTheSheetSays) {
    GiveSheet(18, 0);
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300};
    column->SetBox(&all);
    column->SetUseLayout(true);
    StyledStringPane *const pane = new StyledStringPane(glog, 3, false);
    column->Add(pane, -1);
    pane->AdoptStyledStringItem(Part("Level"));
    Show();
    EXPECT_EQ(pane->GetLayoutRect()->GetItemRect(), (Rect{0, 0, 18, static_cast<short>(WidthOf("Level"))}));
}

TEST_F(StyledStringTest, AnOffsetBeyondSixteenBitsIsTheLargest) {
    GiveSheet(0, 2147483647);
    StyledStringPane *const pane = New({10, 20, 40, 200});
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(Only("MoveTo", DrawingOf(*pane)), Pen(*pane, 20, 32767));
}

TEST_F(StyledStringTest, BeginsWithBlackOnWhite) {
    StyledStringPane *const pane = New({10, 20, 40, 200});
    pane->SetEraseBackground(true);
    Lines const drawn = DrawingOf(*pane);
    ASSERT_GE(drawn.size(), 2U);
    EXPECT_EQ(Only("ClearColors", drawn).size(), 1U);
    EXPECT_EQ(Only("ClearColors", {drawn.front()}).size(), 1U) << drawn.front();
}

TEST_F(StyledStringTest, WithoutALineSpacingIsAsHighAsItsBoxInALayout) {
    GiveSheet(0, 0);
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300}, high = {0, 0, 50, 100};
    column->SetBox(&all);
    column->SetUseLayout(true);
    StyledStringPane *const pane = new StyledStringPane(glog, 3, false);
    pane->SetBox(&high);
    pane->GetLayoutRect()->SetAttribute(GlogLayoutItem::kHeight, 80, GlogLayoutItem::kPixels, UString());
    column->Add(pane, -1);
    pane->AdoptStyledStringItem(Part("Level"));
    Show();
    Rect const place = pane->GetLayoutRect()->GetItemRect();
    EXPECT_EQ(place.bottom - place.top, 50) << "a height of 0 takes the one before away";
}

TEST_F(StyledStringTest, TellsItsLayoutItemWidthAndHeightOnceItHasAText) {
    GiveSheet(18, 4);
    StyledStringPane *const pane = New({10, 20, 40, 200});
    WatchedItem &item = WatchedItem::PutInto(*pane);
    pane->CalcBox();
    pane->AdoptStyledString(AutoPtr<StyledString>());
    EXPECT_TRUE(item.told.empty());
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(item.told, (WatchedItem::Tolds{{kNaturalWidth, WidthOf("Level"), kInPixels, true},
                                             {kNaturalHeight, 18, kInPixels, true}}));
}

TEST_F(StyledStringTest, RepaintsWhereItWasBeforeItFollowsTheWindow) {
    class Noting : public StyledStringPane {
    public:
        using StyledStringPane::StyledStringPane;
        void Inval() override { invalidated.push_back(GetBounds()); }
        void SetBox(Rect *box) override {
            ++boxes;
            StyledStringPane::SetBox(box);
        }
        std::vector<Rect> invalidated;
        int boxes = 0;
    };
    Noting *const pane = new Noting(glog, 3, true);
    Rect const before = {10, 20, 40, 200};
    Rect box = before;
    pane->SetBox(&box);
    Rect wider = {0, 0, 200, 500};
    PositionGlog(glog, &wider, false);
    pane->invalidated.clear();
    pane->boxes = 0;
    pane->AdoptStyledStringItem(Part("Level"));
    EXPECT_EQ(pane->invalidated, std::vector<Rect>{before});
    EXPECT_EQ(pane->boxes, 1);
    EXPECT_EQ(BoxOf(*pane), (Rect{10, 20, 40, 380}));
}

TEST_F(StyledStringTest, InTheMiddleOfABoxThatIsTooNarrowHalvesTowardZero) {
    int const width = WidthOf("Level");
    for (short right : {short(0), short(1)}) {
        StyledStringPane *const pane = New({10, 0, 40, right});
        pane->AdoptStyledStringItem(Part("Level"));
        EXPECT_EQ(DrawnAligned(*pane, StyledStringPane::kCentre),
                  Pen(*pane, -((width - right) / 2), 10 + AscentOf(0)));
    }
}
