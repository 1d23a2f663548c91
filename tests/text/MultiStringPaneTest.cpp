#include "text/MultiStringPane.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "host/NamedColors.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/LibraryExports.h"
#include "tests/PaneTest.h"
#include "tests/text/WatchedItem.h"

namespace {

class MultiStringTest : public PaneTest {
protected:
    MultiStringTest()
        : list(XMLLib::CreateContainer(Text("TextList"))) {
        for (char const *text : {"Stopped", "Playing back", "Recording"})
            list->AddUStringItem(Text("String"), Text(text));
        item.Spot("Origin", {40, 30}).Integer("FSRID", 7).Integer("Align", 1).Integer("LineSpacing", 23);
        item.Container()->AddItem(Text("TextList"), list);
    }
    MultiStringPane *New() { return MultiStringPane::NewMultiStringPane(glog, 6, item.Sheet()); }
    static UString Shown(MultiStringPane const &pane) {
        UString text;
        pane.GetCurrentString(text);
        return text;
    }
    static int WidthOf(char const *text) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(7));
        return LooseStringWidth(Text(text), 0.0f, 1.0f);
    }
    // In a column that fills the glog.
    MultiStringPane *NewInLayout() {
        CompoundPane *const column = new CompoundPane;
        column->CompoundPaneInit(glog, 1);
        Rect all = {0, 0, 200, 300};
        column->SetBox(&all);
        column->SetUseLayout(true);
        MultiStringPane *const pane = New();
        column->Add(pane, -1);
        return pane;
    }

    boost::shared_ptr<XMLLib::ContainerItem> list;
    TestItem item;
};

} // namespace

TEST_F(MultiStringTest, ChoosesNoStringByItself) {
    MultiStringPane *const pane = New();
    EXPECT_EQ(pane->CurrentIndex(), -1);
    EXPECT_EQ(pane->CountStrings(), 3U);
    EXPECT_EQ(pane->GetID(), 6);
}

TEST_F(MultiStringTest, TellsTheStringThatIsChosen) {
    MultiStringPane *const pane = New();
    pane->SelectString(2);
    EXPECT_EQ(Shown(*pane), Text("Recording"));
    pane->SelectString(0);
    EXPECT_EQ(Shown(*pane), Text("Stopped"));
}

TEST_F(MultiStringTest, IsReachedByItsProcedureVariable) {
    MultiStringPane *const pane = New();
    gstrSetIndStr(pane, 1);
    EXPECT_EQ(Shown(*pane), Text("Playing back"));
    auto const exports = ExportsOfTheLibrary();
    EXPECT_EQ(exports.count("gstrSetIndStr"), 1U);
}

TEST_F(MultiStringTest, OfOneSheetReadTheirListsSeparately) {
    MultiStringPane *const first = New(), *const second = New();
    first->SelectString(0);
    list->AddUStringItem(Text("String"), Text("Waiting"));
    second->SelectString(2);
    EXPECT_EQ(Shown(*first), Text("Stopped"));
    EXPECT_EQ(Shown(*second), Text("Recording"));
    EXPECT_EQ(first->CountStrings(), 3U);
}

TEST_F(MultiStringTest, WithoutAListOrWithSomethingElseInItFailsTheAssertionOfItsPointer) {
    TestItem empty;
    empty.Spot("Origin", {0, 0});
    EXPECT_THROW(MultiStringPane::NewMultiStringPane(glog, 6, empty.Sheet()), BrokenInvariant);
    list->AddSIntItem(Text("String"), 4);
    EXPECT_THROW(New(), BrokenInvariant);
}

TEST_F(MultiStringTest, DrawsItsStringFromTheOriginOutsideALayout) {
    MultiStringPane *const pane = New();
    pane->SelectString(1);
    Lines const expected = Traced(*pane, [] {
        SaveTextState const state;
        SaveColors const colors;
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
        SetFontData(GetIndVelaFont(7));
        DrawStringAtPoint(Text("Playing back"), {40, 30}, -1, TextSettings::kTruncateNone);
    });
    EXPECT_EQ(DrawingOf(*pane), expected);
    EXPECT_TRUE(KeepsColors(*pane));
}

TEST_F(MultiStringTest, KeepsItsBoxOutsideALayout) {
    MultiStringPane *const pane = New();
    Rect box = {20, 30, 50, 130};
    pane->SetBox(&box);
    pane->SelectString(1);
    EXPECT_EQ(BoxOf(*pane), box);
}

TEST_F(MultiStringTest, InALayoutStandsAtTheLeftWhateverTheAlignment) {
    MultiStringPane *const pane = NewInLayout();
    pane->SelectString(1);
    Show();
    Rect const place = pane->GetDrawRectangle();
    Lines const expected = Traced(*pane, [&] {
        SaveTextState const state;
        SaveColors const colors;
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
        SetFontData(GetIndVelaFont(7));
        DrawStringInRect(Text("Playing back"), place, TextSettings::kAlignLeft, TextSettings::kTruncateNone,
                         1, 0, 0, 0.0f, 1.0f, 1.0f, 0.0f);
    });
    EXPECT_EQ(DrawingOf(*pane), expected);
}

TEST_F(MultiStringTest, InALayoutIsAsWideAsTheStringAndAsHighAsTheLine) {
    MultiStringPane *const pane = NewInLayout();
    pane->SelectString(0);
    Show();
    Rect const stopped = {0, 0, 23, static_cast<short>(WidthOf("Stopped"))};
    EXPECT_EQ(pane->GetLayoutRect()->GetItemRect(), stopped);
    pane->SelectString(1);
    UpdateGlog(glog);
    EXPECT_EQ(pane->GetLayoutRect()->GetItemRect().right, WidthOf("Playing back"));
}

TEST_F(MultiStringTest, RepaintsOldAndNewAreaAndNothingForTheStringThatShows) {
    MultiStringPane *const pane = New();
    Rect box = {20, 30, 50, 130};
    pane->SetBox(&box);
    pane->SelectString(0);
    Show();
    pane->SelectString(0);
    EXPECT_EQ(Repainted(), std::vector<Rect>());
    pane->SelectString(2);
    EXPECT_EQ(Repainted(), std::vector<Rect>{box});
}

TEST_F(MultiStringTest, TellsItsLayoutItemTheHeightOfTheLineAndEachNewWidth) {
    MultiStringPane *const pane = New();
    WatchedItem &told = WatchedItem::PutInto(*pane);
    pane->GetFromXML(item.Sheet());
    EXPECT_EQ(told.told, (WatchedItem::Tolds{{kNaturalHeight, 23, kInPixels, true}}));
    EXPECT_EQ(pane->CountStrings(), 6U) << "those of the sheet once more";
    told.told.clear();
    for (int index : {1, 1, 0, 0})
        pane->SelectString(index);
    EXPECT_EQ(told.told, (WatchedItem::Tolds{{kNaturalWidth, WidthOf("Playing back"), kInPixels, true},
                                             {kNaturalWidth, WidthOf("Stopped"), kInPixels, true}}));
}

TEST_F(MultiStringTest, ChoosingAndDrawingLeaveThePortsFont) {
    MultiStringPane *const pane = New();
    pane->Prepare();
    SetFontData(GetIndVelaFont(0));
    int const before = LooseStringWidth(Text("Recording"), 0.0f, 1.0f);
    ASSERT_NE(before, WidthOf("Recording"));
    pane->SelectString(2);
    EXPECT_EQ(LooseStringWidth(Text("Recording"), 0.0f, 1.0f), before);
    (pane->*&Opened<MultiStringPane>::DrawGuts)(nullptr);
    EXPECT_EQ(LooseStringWidth(Text("Recording"), 0.0f, 1.0f), before);
}

TEST_F(MultiStringTest, ItsFontFollowsTheRuleOfItsKey) {
    struct {
        int id, font;
    } const cases[] = {{9, 9}, {30, 0}, {31, 1}, {12, 0}, {0x107, 7}};
    for (auto const &c : cases) {
        TestItem odd;
        odd.Integer("FSRID", c.id);
        odd.Container()->AddItem(Text("TextList"), list);
        MultiStringPane *const pane = MultiStringPane::NewMultiStringPane(glog, 6, odd.Sheet());
        WatchedItem &told = WatchedItem::PutInto(*pane);
        pane->SelectString(2);
        SaveTextState const state;
        SetFontData(GetIndVelaFont(c.font));
        ASSERT_EQ(told.told.size(), 1U);
        EXPECT_EQ(told.told[0].value, LooseStringWidth(Text("Recording"), 0.0f, 1.0f)) << c.id;
    }
}

TEST_F(MultiStringTest, InALayoutRepaintsTheWidthBeforeAndTheWidthAfter) {
    MultiStringPane *const pane = NewInLayout();
    pane->SelectString(0);
    Show();
    auto const repaintedUpTo = [&] {
        short right = 0;
        for (Rect const &r : Repainted())
            right = std::max(right, r.right);
        return int(right);
    };
    pane->SelectString(1);
    EXPECT_GE(repaintedUpTo(), WidthOf("Playing back"));
    pane->SelectString(0);
    EXPECT_GE(repaintedUpTo(), WidthOf("Playing back")) << "what showed beyond the shorter string";
}
