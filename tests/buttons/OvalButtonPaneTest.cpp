#include "buttons/OvalButtonPane.h"
#include "host/CompoundPane.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

short const kFaceFamily = 1841;
short const kLabelList = 4323;

class OvalButton : public PaneTest {
protected:
    static gobResRec RecordOf(short top, short left, short width, short mode = 0) {
        return {gobResRec::kKind, top, left, width, 1, mode};
    }
    OvalButtonPane *New(short top, short left, short width, short mode = 0) {
        gobResRec record = RecordOf(top, left, width, mode);
        return OvalButtonPane::NewOvalButtonPane(glog, &record);
    }
    static UString LabelOf(OvalButtonPane &button) {
        UString text;
        button.GetButtonText(text);
        return text;
    }
    bool IsRedrawn() {
        desktop.TakeDrawing();
        UpdateGlog(glog);
        return !Only("Draw1Icon", desktop.TakeDrawing()).empty();
    }
    // The calls of a button at (20, 10) of that width.
    Lines Expected(OvalButtonPane &button, short width, bool down, RGBColor const &color) {
        return Expected(button, Rect{10, 20, 29, static_cast<short>(20 + width)}, down, color);
    }
    Lines Expected(OvalButtonPane &button, Rect const &box, bool down, RGBColor const &color) {
        short const base = down ? 3 : 0;
        short const drop = down ? 1 : 0;
        int const pieces = (box.right - box.left) / 16 - 1;
        return Traced(button, [&] {
            ClearColors();
            Draw1Icon(kFaceFamily, base, box.left, box.top);
            {
                Rect const middle = {box.top, static_cast<short>(box.left + 16), box.bottom,
                                     static_cast<short>(box.right - 16)};
                WithClipRect const clip(middle);
                for (int i = 0; i < pieces; ++i)
                    Draw1Icon(kFaceFamily, static_cast<short>(base + 1),
                              static_cast<short>(middle.left + 16 * i), box.top);
            }
            Draw1Icon(kFaceFamily, static_cast<short>(base + 2), static_cast<short>(box.right - 16), box.top);
            VelaDrawing::RGBForeColor(color);
            Rect const textRect = {static_cast<short>(box.top + drop), box.left,
                                   static_cast<short>(box.bottom + drop - 2), box.right};
            OS::TextLayout layout;
            DrawTextLayoutInRect(layout, LabelOf(button), textRect, 0, TextSettings::kAlignCenter,
                                 TextSettings::kTruncateNone, 1, 0, 0, 0, 0.0f, 1.0f, 1.0f);
        });
    }
};

} // namespace

TEST_F(OvalButton, IsNineteenPixelsHighAndAsWideAsItsRecordSays) {
    EXPECT_EQ(BoxOf(*New(10, 20, 80)), (Rect{10, 20, 29, 100}));
}

TEST_F(OvalButton, IsNotMadeWithoutAGlog) {
    gobResRec record = RecordOf(0, 0, 80);
    EXPECT_EQ(OvalButtonPane::NewOvalButtonPane(nullptr, &record), nullptr);
}

TEST_F(OvalButton, TakesItsLabelFromTheStringList) {
    OvalButtonPane *const button = New(10, 20, 80);
    EXPECT_FALSE(LabelOf(*button).empty());
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 1));
}

TEST_F(OvalButton, TakesItsModeFromTheRecord) {
    New(10, 20, 80, 1);
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 0);
}

TEST_F(OvalButton, KeepsTheLowByteOfTheRecordsMode) {
    New(10, 20, 80, 0x100);
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 1);
}

TEST_F(OvalButton, IsDrawnWithTwoCapsAndWholeMiddlePiecesAtAnyWidth) {
    for (short width : {-50, -16, -10, 0, 15, 16, 20, 31, 32, 33, 47, 48, 50, 64, 80, 95, 200}) {
        OvalButtonPane *const button = New(10, 20, width);
        EXPECT_EQ(DrawingOf(*button), Expected(*button, width, false, kDialogButtonActiveTextColor)) << width;
        delete button;
    }
}

TEST_F(OvalButton, ANarrowButtonHasNoMiddleAndItsCapsOverlap) {
    OvalButtonPane *const button = New(10, 20, 20);
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)), Traced(*button, [] {
                  Draw1Icon(kFaceFamily, 0, 20, 10);
                  Draw1Icon(kFaceFamily, 2, 24, 10);
              }));
}

TEST_F(OvalButton, IsDrawnWithThePressedFaceAndItsTextOnePixelLowerWhileDown) {
    OvalButtonPane *const button = New(10, 20, 80);
    button->Depress();
    EXPECT_EQ(DrawingOf(*button), Expected(*button, 80, true, kDialogButtonActiveTextColor));
}

TEST_F(OvalButton, IsDrawnPressedAtAnyWidth) {
    for (short width : {-10, 16, 31, 33, 64, 95}) {
        OvalButtonPane *const button = New(10, 20, width);
        button->Depress();
        EXPECT_EQ(DrawingOf(*button), Expected(*button, width, true, kDialogButtonActiveTextColor)) << width;
        delete button;
    }
}

TEST_F(OvalButton, AClipSurroundsTheMiddleEvenWhenItIsEmpty) {
    OvalButtonPane *const button = New(10, 20, -10);
    Lines const clips = Only("WithClipRect", DrawingOf(*button));
    EXPECT_EQ(clips, Traced(*button, [] { WithClipRect const clip(Rect{10, 36, 29, -6}); }));
    EXPECT_EQ(clips.size(), 1u);
}

TEST_F(OvalButton, IsDrawnAtItsPlaceInALayoutWhereverItsBoxIs) {
    // Leaves its box where it was.
    class Unsettled : public OvalButtonPane {
    public:
        explicit Unsettled(glogRec *owner) { InitOvalButtonPane(owner, Point{10, 20}, 80, 1, 0); }
        void UpdateLayoutRect() override {}
    };
    Unsettled *const button = new Unsettled(glog);
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect box = {0, 0, 200, 300};
    column->SetBox(&box);
    column->SetUseLayout(true);
    column->Add(button, 0);
    ASSERT_EQ(button->GetLayoutRect()->GetBorderRect(), (Rect{0, 0, 19, 80}));
    ASSERT_EQ(BoxOf(*button), (Rect{10, 20, 29, 100}));
    EXPECT_EQ(DrawingOf<OvalButtonPane>(*button),
              Expected(*button, Rect{0, 0, 19, 80}, false, kDialogButtonActiveTextColor));
}

TEST_F(OvalButton, IsDrawnWithInactiveTextWhenDisabled) {
    OvalButtonPane *const button = New(10, 20, 80, 1);
    EXPECT_EQ(DrawingOf(*button), Expected(*button, 80, false, kDialogButtonInactiveTextColor));
}

TEST_F(OvalButton, OtherModesLookEnabled) {
    OvalButtonPane *const button = New(10, 20, 80, 2);
    EXPECT_EQ(DrawingOf(*button), Expected(*button, 80, false, kDialogButtonActiveTextColor));
}

TEST_F(OvalButton, LeavesTheColoursOfThePortAsTheyWere) { EXPECT_TRUE(KeepsColors(*New(10, 20, 80))); }

TEST_F(OvalButton, AClickShowsThePressedFaceThenTheNormalOne) {
    New(10, 20, 80);
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 1);
    Lines const caps = Only("Draw1Icon", desktop.TakeDrawing());
    ASSERT_EQ(caps.size(), 12u); // two redraws of two caps and four middle pieces
    EXPECT_NE(caps[0].find("\"icon\":3"), std::string::npos);
    EXPECT_NE(caps[6].find("\"icon\":0"), std::string::npos);
}

TEST_F(OvalButton, AClickRepaintsTheButtonAlone) {
    New(10, 20, 80);
    Show();
    desktop.Play("click 30 15");
    std::vector<Rect> const presented = desktop.TakePresented(glog);
    ASSERT_FALSE(presented.empty());
    for (Rect const &r : presented)
        EXPECT_EQ(r, (Rect{10, 20, 29, 100}));
}

TEST_F(OvalButton, AReleaseOutsideGivesMinusOne) {
    New(10, 20, 80);
    Show();
    EXPECT_EQ(ResultOfClick("press 30 15\nwait 0.3\nmove 5 5\nrelease"), -1);
}

TEST_F(OvalButton, ANewTextIsNotSeenUntilThePaneRepaints) {
    OvalButtonPane *const button = New(10, 20, 80);
    Show();
    button->SetButtonText(Text("Anew"));
    EXPECT_TRUE(LabelOf(*button) == Text("Anew"));
    EXPECT_FALSE(IsRedrawn());
    button->Inval();
    EXPECT_TRUE(IsRedrawn());
    EXPECT_EQ(DrawingOf(*button), Expected(*button, 80, false, kDialogButtonActiveTextColor));
}

TEST_F(OvalButton, IsMadeFromASheet) {
    TestItem item;
    item.Box("BoundsRect", {12, 14, 99, 84}).Integer("TextNum", 2).Integer("Mode", 1);
    OvalButtonPane *const button = OvalButtonPane::NewOvalButtonPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*button), (Rect{12, 14, 31, 84}));
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 2));
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 0);
}

TEST_F(OvalButton, IsMadeFromASheetWithoutBoundsAtZero) {
    TestItem item;
    OvalButtonPane *const button = OvalButtonPane::NewOvalButtonPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*button), (Rect{0, 0, 19, 0}));
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 0));
}

TEST_F(OvalButton, IsNotMadeFromASheetWithoutAGlog) {
    TestItem item;
    EXPECT_EQ(OvalButtonPane::NewOvalButtonPane(nullptr, item.Sheet()), nullptr);
}

TEST_F(OvalButton, TakesPlaceWidthTextAndModeOneByOne) {
    class Direct : public OvalButtonPane {
    public:
        OvalButtonPane *Init(glogRec *owner) { return InitOvalButtonPane(owner, Point{5, 6}, 40, 3, 1); }
    };
    Direct *const button = new Direct;
    EXPECT_EQ(button->Init(glog), button);
    EXPECT_EQ(BoxOf(*button), (Rect{5, 6, 24, 46}));
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 3));
    EXPECT_EQ(button->Flash(0), -1);
    Direct loose;
    EXPECT_EQ(loose.Init(nullptr), nullptr);
}

TEST_F(OvalButton, ASheetWithoutItemFailsAnAssertion) {
    GlogStyleSheet empty;
    EXPECT_THROW(OvalButtonPane::NewOvalButtonPane(glog, &empty), BrokenInvariant);
}

TEST_F(OvalButton, TakesItsLayoutPropertiesFromTheGlogsSheet) {
    boost::shared_ptr<XMLLib::ContainerItem> const layout = XMLLib::CreateContainer(Text("Layout"));
    layout->AddSIntItem(Text("Width"), 93);
    boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(Text("Glog"));
    item->AddItem(Text("Layout"), layout);
    glog = desktop.NewGlog(GlogOptions().StyleSheet(std::make_shared<GlogStyleSheet>(item)));
    OvalButtonPane *const button = New(10, 20, 80);
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect box = {0, 0, 200, 300};
    column->SetBox(&box);
    column->SetUseLayout(true);
    column->Add(button, 0);
    Rect const place = button->GetLayoutRect()->GetBorderRect();
    EXPECT_EQ(place.right - place.left, 93);
}
