#include "buttons/FrameButtonPane.h"
#include "host/CompoundPane.h"
#include "host/EnumToStringMap.h"
#include "host/Icons.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"

namespace {

short const kNoteFamily = 1821;
short const kFaceFamily = 1608;
short const kTransportFamily = 2000;

gfbResRec RecordOf(short family) {
    gfbResRec record = {};
    record.kind = gfbResRec::kKind;
    record.origin = {40, 30};
    record.family = family;
    record.icon = 2;
    record.gutsOrigin = {1, 8};
    record.downOffset = 3;
    record.hiliteWhenDown = 1;
    return record;
}

class Listener : public GlogButtonPaneListener {
public:
    void GlogButtonPressed(GlogButtonPane *) override { ++presses; }
    int presses = 0;
};

class FrameButton : public PaneTest {
protected:
    FrameButtonPane *New(short family) {
        gfbResRec record = RecordOf(family);
        return FrameButtonPane::NewFrameButtonPane(glog, &record);
    }
    bool IsRedrawn() {
        desktop.TakeDrawing();
        UpdateGlog(glog);
        return !Only("Draw1Icon", desktop.TakeDrawing()).empty();
    }
};

// A face of its own, noted by its place.
class FacedButton : public FrameButtonPane {
public:
    static FacedButton *New(glogRec *owner, short family) {
        gfbResRec record = RecordOf(family);
        FacedButton *const button = new FacedButton;
        button->InitFrameButtonPane(owner, &record);
        return button;
    }
    void DoDrawButtonFace(short h, short v) override { faces.push_back({v, h}); }
    std::vector<Point> faces;
};

} // namespace

TEST_F(FrameButton, ItsBoxIsTheFaceAndTheDownOffsetFromTheOrigin) {
    EXPECT_EQ(BoxOf(*New(kNoteFamily)), (Rect{40, 30, 40 + 3 + 16, 30 + 3 + 24}));
}

TEST_F(FrameButton, ItsBoxWrapsAtSixteenBits) {
    gfbResRec record = RecordOf(kNoteFamily);
    record.origin = {32760, 32760};
    FrameButtonPane *const button = FrameButtonPane::NewFrameButtonPane(glog, &record);
    EXPECT_EQ(BoxOf(*button), (Rect{32760, 32760, -32757, -32749}));
}

TEST_F(FrameButton, IsNotMadeWithoutAGlog) {
    gfbResRec record = RecordOf(kNoteFamily);
    EXPECT_EQ(FrameButtonPane::NewFrameButtonPane(nullptr, &record), nullptr);
}

TEST_F(FrameButton, StartsOffAndEnabledUnderNumberZero) {
    FrameButtonPane *const button = New(kNoteFamily);
    EXPECT_EQ(button->GetState(), 0);
    EXPECT_EQ(button->GetID(), 0);
    EXPECT_EQ(button->Flash(0), 1);
}

TEST_F(FrameButton, TheMarkFamilyShowsTheStockFaceWithTheIconOnTop) {
    FrameButtonPane *const button = New(kNoteFamily);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  Draw1Icon(kFaceFamily, 69, 30, 40);
                  GrayForeColor(0);
                  Draw1Icon(kNoteFamily, 2, 38, 41);
              }));
}

TEST_F(FrameButton, TheStockFaceShowsTheState) {
    FrameButtonPane *const button = New(kNoteFamily);
    button->SetState(1);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  Draw1Icon(kFaceFamily, 70, 30, 40);
                  GrayForeColor(0);
                  Draw1Icon(kNoteFamily, 2, 38, 41);
              }));
}

TEST_F(FrameButton, TheStockFaceOfAButtonThatIsNotEnabledHidesTheStateAndGraysTheIcon) {
    FrameButtonPane *const button = New(kNoteFamily);
    button->SetState(1);
    for (unsigned char mode : {1, 2}) {
        button->SetMode(mode);
        EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                      Draw1Icon(kFaceFamily, 71, 30, 40);
                      GrayForeColor(50);
                      Draw1Icon(kNoteFamily, 2, 38, 41);
                  }));
    }
}

TEST_F(FrameButton, TheStockFaceStaysWhileTheButtonIsDown) {
    FrameButtonPane *const button = New(kNoteFamily);
    Lines const up = DrawingOf(*button);
    button->Depress();
    EXPECT_EQ(DrawingOf(*button), up);
}

TEST_F(FrameButton, AnyOtherFamilyIsItsOwnFaceAndIsDrawnTwice) {
    FrameButtonPane *const button = New(kTransportFamily);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  GrayForeColor(0);
                  Draw1Icon(kTransportFamily, 2, 38, 41);
                  GrayForeColor(0);
                  Draw1Icon(kTransportFamily, 2, 38, 41);
              }));
}

TEST_F(FrameButton, AnyOtherFamilyIsGrayInAButtonThatIsNotEnabled) {
    FrameButtonPane *const button = New(kTransportFamily);
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  GrayForeColor(50);
                  Draw1Icon(kTransportFamily, 2, 38, 41);
                  GrayForeColor(50);
                  Draw1Icon(kTransportFamily, 2, 38, 41);
              }));
}

TEST_F(FrameButton, FamilyZeroShowsOnlyTheFace) {
    FrameButtonPane *const button = New(0);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  GrayForeColor(0);
                  Draw1Icon(0, 2, 38, 41);
              }));
}

TEST_F(FrameButton, ANegativeFamilyShowsOnlyTheFace) {
    FacedButton *const button = FacedButton::New(glog, -5);
    EXPECT_TRUE(Only("Draw1Icon", DrawingOf(*button)).empty());
    EXPECT_EQ(button->faces.size(), 1u);
}

TEST_F(FrameButton, ASubclassDrawsItsFaceAtTheGutsOriginUnderTheIcon) {
    FacedButton *const button = FacedButton::New(glog, kTransportFamily);
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)),
              Traced(*button, [] { Draw1Icon(kTransportFamily, 2, 38, 41); }));
    EXPECT_EQ(button->faces, (std::vector<Point>{{41, 38}}));
}

TEST_F(FrameButton, TheFaceIsAnOperationBehindThoseOfTheBase) {
    // The base's HandleClick, which answers for the pane, takes a place here as well.
    ExpectInOrder(kAfterDestructor, &GlogButtonPane::Depress, &GlogButtonPane::Release,
                  &GlogButtonPane::GetButtonText, &Opened<FrameButtonPane>::HandleClick,
                  &FrameButtonPane::DoDrawButtonFace);
    EXPECT_EQ(PlaceOf(&FrameButtonPane::Depress), PlaceOf(&GlogButtonPane::Depress));
    EXPECT_EQ(PlaceOf(&FrameButtonPane::Release), PlaceOf(&GlogButtonPane::Release));
}

TEST_F(FrameButton, IsDrawnAtItsPlaceInALayoutWhereverItsBoxIs) {
    // Leaves its box where it was.
    class Unsettled : public FrameButtonPane {
    public:
        Unsettled(glogRec *owner, short family) {
            gfbResRec record = RecordOf(family);
            InitFrameButtonPane(owner, &record);
        }
        void UpdateLayoutRect() override {}
    };
    for (short family : {kNoteFamily, kTransportFamily}) {
        Unsettled *const button = new Unsettled(glog, family);
        CompoundPane *const column = new CompoundPane;
        column->CompoundPaneInit(glog, 1);
        Rect box = {0, 0, 200, 300};
        column->SetBox(&box);
        column->SetUseLayout(true);
        column->Add(button, 0);
        ASSERT_EQ(button->GetLayoutRect()->GetBorderRect(), (Rect{0, 0, 19, 27}));
        ASSERT_EQ(BoxOf(*button), (Rect{40, 30, 59, 57}));
        EXPECT_EQ(Only("Draw1Icon", DrawingOf<FrameButtonPane>(*button)), Traced(*button, [family] {
                      if (family == kNoteFamily)
                          Draw1Icon(kFaceFamily, 69, 0, 0);
                      else
                          Draw1Icon(family, 2, 8, 1);
                      Draw1Icon(family, 2, 8, 1);
                  }));
        delete column;
    }
}

TEST_F(FrameButton, ASubclassHasNoFaceToDrawWithTheStockFace) {
    FacedButton *const button = FacedButton::New(glog, kNoteFamily);
    DrawingOf(*button);
    EXPECT_TRUE(button->faces.empty());
}

TEST_F(FrameButton, SetStateKeepsOneForAnyValueButZero) {
    FrameButtonPane *const button = New(kNoteFamily);
    button->SetState(200);
    EXPECT_EQ(button->GetState(), 1);
    button->SetState(0);
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(FrameButton, SetStateRepaintsOnlyAChange) {
    FrameButtonPane *const button = New(kNoteFamily);
    Show();
    button->SetState(0);
    EXPECT_FALSE(IsRedrawn());
    button->SetState(1);
    EXPECT_TRUE(IsRedrawn());
    button->SetState(7);
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(FrameButton, ToggleStateFlipsAndAlwaysRepaints) {
    FrameButtonPane *const button = New(kNoteFamily);
    Show();
    button->ToggleState();
    EXPECT_EQ(button->GetState(), 1);
    EXPECT_TRUE(IsRedrawn());
    button->ToggleState();
    EXPECT_EQ(button->GetState(), 0);
    EXPECT_TRUE(IsRedrawn());
}

TEST_F(FrameButton, TheProcedureVariableSetsTheState) {
    FrameButtonPane *const button = New(kNoteFamily);
    gfbSetState(button, true);
    EXPECT_EQ(button->GetState(), 1);
    gfbSetState(button, false);
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(FrameButton, AHiddenButtonKeepsItsStateAndDrawsNothing) {
    FrameButtonPane *const button = New(kNoteFamily);
    Show();
    button->Hide();
    UpdateGlog(glog);
    button->SetState(1);
    EXPECT_EQ(button->GetState(), 1);
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(FrameButton, AClickGivesOneAndTellsTheListeners) {
    FrameButtonPane *const button = New(kNoteFamily);
    Listener listener;
    listener.DependUpon(button);
    Show();
    EXPECT_EQ(ResultOfClick("click 35 45"), 1);
    EXPECT_EQ(listener.presses, 1);
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(FrameButton, AShiftClickGivesTwo) {
    New(kNoteFamily);
    Show();
    EXPECT_EQ(ResultOfClick("click 35 45 shift"), 2);
    EXPECT_EQ(ResultOfClick("click 35 45 option"), 1);
}

TEST_F(FrameButton, AReleaseOutsideGivesMinusOneWithShiftToo) {
    New(kNoteFamily);
    Show();
    EXPECT_EQ(ResultOfClick("press 35 45\nwait 0.3\nmove 5 5\nrelease"), -1);
    EXPECT_EQ(ResultOfClick("press 35 45 shift\nwait 0.3\nmove 5 5\nrelease"), -1);
}

TEST_F(FrameButton, AClickOnAButtonThatIsNotEnabledFallsThrough) {
    FrameButtonPane *const button = New(kNoteFamily);
    Show();
    button->SetMode(2);
    EXPECT_EQ(ResultOfClick("click 35 45"), 0);
    button->Disable();
    EXPECT_EQ(ResultOfClick("click 35 45 shift"), 0);
}

TEST_F(FrameButton, AListenerMayDeleteTheButton) {
    FrameButtonPane *const button = New(kNoteFamily);
    class Deleter : public GlogButtonPaneListener {
    public:
        void GlogButtonPressed(GlogButtonPane *source) override { delete source; }
    } deleter;
    deleter.DependUpon(button);
    Show();
    EXPECT_EQ(ResultOfClick("click 35 45 shift"), 2);
}

TEST_F(FrameButton, IsMadeFromAnItem) {
    TestItem item;
    item.Spot("Origin", {12, 14}).String("ISetID", "kNoteGlyphs").Integer("IconID", 4);
    item.Spot("GutsOrigin", {1, 8}).Integer("DownOffset", 2).Integer("HiliteWhenDown", 1);
    FrameButtonPane *const button = FrameButtonPane::NewFrameButtonPane(glog, item.Container());
    EXPECT_EQ(BoxOf(*button), (Rect{12, 14, 30, 40}));
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] {
                  Draw1Icon(kFaceFamily, 69, 14, 12);
                  GrayForeColor(0);
                  Draw1Icon(kNoteFamily, 4, 22, 13);
              }));
}

TEST_F(FrameButton, TakesTheIconFamilyOfAnItemByName) {
    ASSERT_EQ(ISetIDMapper::Instance().GetID(Text("kTransportIcons")), kTransportFamily);
    TestItem item;
    item.String("ISetID", "kTransportIcons").Integer("IconID", 1);
    FrameButtonPane *const button = FrameButtonPane::NewFrameButtonPane(glog, item.Container());
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)), Traced(*button, [] {
                  Draw1Icon(kTransportFamily, 1, 0, 0);
                  Draw1Icon(kTransportFamily, 1, 0, 0);
              }));
}

TEST_F(FrameButton, IsMadeFromAnEmptyItemWithZeroForEverything) {
    TestItem item;
    FrameButtonPane *const button = FrameButtonPane::NewFrameButtonPane(glog, item.Container());
    EXPECT_EQ(BoxOf(*button), (Rect{0, 0, 16, 24}));
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)), Traced(*button, [] { Draw1Icon(0, 0, 0, 0); }));
}

TEST_F(FrameButton, IsNotMadeFromAnItemWithoutAGlog) {
    TestItem item;
    EXPECT_EQ(FrameButtonPane::NewFrameButtonPane(nullptr, item.Container()), nullptr);
}

TEST_F(FrameButton, NoItemFailsAnAssertion) {
    EXPECT_THROW(FrameButtonPane::NewFrameButtonPane(glog, boost::shared_ptr<XMLLib::ContainerItem>()),
                 BrokenInvariant);
}
