#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"
#include "host/Coordinate.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

class GlogPaneTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *NewPane(Rect box = {10, 20, 40, 80}, char const *name = "pane") {
        return new ProbePane(glog, box, calls, name);
    }
};

TEST_F(GlogPaneTest, APaneThatIsNotAttachedHasAnEmptyBoxIsVisibleAndHasNoGlog) {
    class Loose : public GlogPane {
        void DrawGuts(OSRgn *) override {}
    } pane;
    EXPECT_EQ(pane.GetBounds(), (Rect{0, 0, 0, 0}));
    EXPECT_TRUE(pane.GetVisibility());
    EXPECT_FALSE(pane.IsActive());
    EXPECT_FALSE(pane.IsSelected());
    EXPECT_EQ(pane.GetID(), 0);
    EXPECT_EQ(pane.GetGlog(), nullptr);
    EXPECT_EQ(pane.GlogPaneInit(nullptr, 3), nullptr);
    pane.Inval();
    pane.Prepare();
}

TEST_F(GlogPaneTest, InitMakesThePaneAnItemOfTheGlogWithALayoutRect) {
    ProbePane *pane = NewPane();
    EXPECT_EQ(pane->GetGlog(), glog);
    EXPECT_EQ(CountGlogItems(glog), 1);
    EXPECT_EQ(GetGlogItem(glog, 1), pane);
    EXPECT_NE(pane->GetLayoutRect().get(), nullptr);
    EXPECT_FALSE(pane->IsInLayout());
    EXPECT_EQ(pane->GetLayoutRect()->GetBorderRect(), (Rect{10, 20, 40, 80}));
}

TEST_F(GlogPaneTest, InitTakesTheBoxThatTheGlogDescribesForTheNumber) {
    class Plain : public GlogPane {
        void DrawGuts(OSRgn *) override {}
    };
    Glog::From(glog).DescribeItem(7, {1, 2, 3, 4});
    Plain *described = new Plain, *other = new Plain;
    described->GlogPaneInit(glog, 7);
    other->GlogPaneInit(glog, 8);
    EXPECT_EQ(described->GetBounds(), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(other->GetBounds(), (Rect{0, 0, 0, 0}));
}

TEST_F(GlogPaneTest, ItemsGoByTheirNumberAndElseByTheirPlace) {
    ProbePane *first = NewPane(), *second = NewPane();
    EXPECT_EQ(GetGlogItem(glog, 2), second);
    first->SetID(2);
    EXPECT_EQ(GetGlogItem(glog, 2), first);
    EXPECT_EQ(GetGlogItem(glog, 0), nullptr);
    EXPECT_EQ(GetGlogItem(glog, 3), nullptr);
}

TEST_F(GlogPaneTest, TheDestructorTakesThePaneOutOfItsGlog) {
    ProbePane *pane = NewPane();
    glog->SetCurItem(pane);
    delete pane;
    EXPECT_EQ(CountGlogItems(glog), 0);
    EXPECT_EQ(glog->GetCurItem(), nullptr);
}

TEST_F(GlogPaneTest, SetBoxTellsOfAPositionChangeOnlyWhenTheBoxChanged) {
    ProbePane *pane = NewPane();
    calls.clear();
    Rect box{10, 20, 40, 80};
    pane->SetBox(&box);
    EXPECT_TRUE(calls.empty());
    box.right = 90;
    pane->SetBox(&box);
    EXPECT_EQ(calls, Calls{"pane: PanePositionChanged"});
    EXPECT_EQ(pane->ItemWidth(), 70);
    EXPECT_EQ(pane->ItemHeight(), 30);
}

TEST_F(GlogPaneTest, OffsetMovesTheBox) {
    ProbePane *pane = NewPane();
    pane->Offset({5, -3});
    EXPECT_EQ(BoxOf(*pane), (Rect{15, 17, 45, 77}));
}

TEST_F(GlogPaneTest, BottomAndRightEdgesLieOutside) {
    ProbePane *pane = NewPane();
    EXPECT_TRUE(pane->Contains({10, 20}));
    EXPECT_TRUE(pane->Contains({39, 79}));
    EXPECT_FALSE(pane->Contains({40, 79}));
    EXPECT_FALSE(pane->Contains({39, 80}));
    Rect touching{40, 20, 50, 80}, crossing{39, 79, 50, 90};
    EXPECT_FALSE(pane->Intersects(&touching, 0));
    EXPECT_TRUE(pane->Intersects(&crossing, 0));
}

TEST_F(GlogPaneTest, EveryPaneIsStartedOnceJustAfterItLearnsItsPosition) {
    NewPane();
    calls.clear();
    desktop.FinishGlog(glog);
    EXPECT_EQ(calls, (Calls{"pane: PanePositionChanged", "pane: GlogItemInit"}));
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(Count(calls, "pane: GlogItemInit"), 1);
}

TEST_F(GlogPaneTest, InvalDamagesTheDrawRectangleOfAVisiblePane) {
    ProbePane *pane = NewPane();
    Show();
    pane->Inval();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{10, 20, 40, 80}}));
}

TEST_F(GlogPaneTest, AHiddenPaneIsNeitherDamagedNorDrawn) {
    ProbePane *pane = NewPane();
    pane->SetVisibility(0);
    Show();
    EXPECT_EQ(Count(calls, "pane: draw"), 0);
    pane->Inval();
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(GlogPaneTest, HideErasesAndShowDrawsAgain) {
    ProbePane *pane = NewPane();
    Show();
    pane->Hide();
    calls.clear();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{10, 20, 40, 80}}));
    EXPECT_TRUE(calls.empty());
    pane->Show();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{10, 20, 40, 80}}));
    EXPECT_EQ(calls, Calls{"pane: draw"});
    pane->Show();
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(GlogPaneTest, InvalOnAGlogThatIsNotShownLeavesNothingMoreThanTheFirstUpdateDraws) {
    ProbePane *pane = NewPane();
    pane->Inval();
    pane->Prepare();
    Show();
    EXPECT_EQ(Count(calls, "pane: draw"), 1);
}

TEST_F(GlogPaneTest, EraseFillsTheRectangleWithTheGroundOfTheWindow) {
    ProbePane *pane = NewPane();
    Show();
    RGBColor const ground = glog->GetContentColor();
    SetBackgroundColor(ground);
    pane->Prepare();
    pane->Erase();
    desktop.ProcessEvents(0);
    Surface const *picture = desktop.Picture(glog);
    EXPECT_EQ(picture->Row(15)[30], picture->Row(5)[5]);
}

TEST_F(GlogPaneTest, PrepareMakesTheWindowsPortCurrentAndClipsToThePane) {
    ProbePane *pane = NewPane();
    Show();
    pane->Prepare();
    EXPECT_EQ(OSPort::GetCurrent(), glog->GetPort());
    Rect beyond{0, 0, 200, 320};
    desktop.TakePresented(glog);
    GrayForeColor(0);
    VelaDrawing::PaintRect(&beyond);
    desktop.ProcessEvents(0);
    EXPECT_EQ(desktop.TakePresented(glog), (std::vector<Rect>{{10, 20, 40, 80}}));
}

TEST_F(GlogPaneTest, DrawingIsClippedToTheUpdateRegionEvenAfterAnotherPrepare) {
    ProbePane *pane = NewPane({0, 0, 200, 320});
    Show();
    pane->onDraw = [&](OSRgn *) {
        pane->Prepare();
        GrayForeColor(0);
        Rect const all{0, 0, 200, 320};
        VelaDrawing::PaintRect(&all);
    };
    pane->Prepare();
    Rect const part{50, 60, 70, 90};
    VelaDrawing::InvalRect(&part);
    UpdateGlog(glog);
    Surface const *picture = desktop.Picture(glog);
    EXPECT_EQ(picture->Row(55)[65], 0xFF000000u);
    EXPECT_NE(picture->Row(40)[65], 0xFF000000u);
}

TEST_F(GlogPaneTest, APanesDrawingStartsFromTheSamePortStateWhateverTheOneBeforeLeft) {
    ProbePane *first = NewPane({0, 0, 10, 10}, "first");
    ProbePane *second = NewPane({20, 0, 30, 10}, "second");
    first->onDraw = [](OSRgn *) {
        GrayForeColor(80);
        VelaDrawing::TextSize(40);
    };
    RGBColor fore{1, 1, 1};
    short size = 0;
    second->onDraw = nullptr;
    Show();
    second->onDraw = [&](OSRgn *) { size = VelaDrawing::GetPortTextSize(OSPort::GetCurrent()); };
    first->Inval();
    second->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(size, 12);
    (void)fore;
}

TEST_F(GlogPaneTest, SelectMakesAPaneThatBecomesTheGopherCurrentAndUnselectsTheFormerOne) {
    ProbePane *one = NewPane({0, 0, 9, 9}, "one"), *two = NewPane({0, 0, 9, 9}, "two");
    one->becomesGopher = two->becomesGopher = true;
    one->Select(true);
    EXPECT_EQ(glog->GetCurItem(), one);
    calls.clear();
    two->Select(true);
    EXPECT_EQ(glog->GetCurItem(), two);
    EXPECT_FALSE(one->IsSelected());
    EXPECT_EQ(calls, (Calls{"two: Select", "one: Unselect"}));
    two->Select(false);
    EXPECT_EQ(glog->GetCurItem(), two) << "Select(false) leaves the current item as it is";
}

TEST_F(GlogPaneTest, SelectOfAPaneThatIsNoGopherLeavesTheCurrentItem) {
    ProbePane *one = NewPane({0, 0, 9, 9}, "one"), *two = NewPane({0, 0, 9, 9}, "two");
    glog->SetCurItem(one);
    two->Select(true);
    EXPECT_EQ(glog->GetCurItem(), one);
    EXPECT_TRUE(two->IsSelected());
}

TEST_F(GlogPaneTest, SetCurItemUnselectsTheOldOneThenSelectsTheNewOneUnlessItIsSelected) {
    ProbePane *one = NewPane({0, 0, 9, 9}, "one"), *two = NewPane({0, 0, 9, 9}, "two");
    glog->SetCurItem(one);
    calls.clear();
    glog->SetCurItem(two);
    EXPECT_EQ(calls, (Calls{"one: Unselect", "two: Select"}));
    calls.clear();
    one->SetSelectedFlag(true);
    glog->SetCurItem(one);
    EXPECT_EQ(calls, Calls{"two: Unselect"});
    glog->SetCurItem(nullptr);
    EXPECT_EQ(glog->GetCurItem(), nullptr);
}

TEST_F(GlogPaneTest, SetGlogWithNullDetachesThePaneWhichThenBelongsToTheCaller) {
    ProbePane *pane = NewPane();
    pane->SetGlog(nullptr);
    EXPECT_EQ(CountGlogItems(glog), 0);
    EXPECT_EQ(pane->GetGlog(), nullptr);
    pane->Inval();
    pane->SetGlog(glog);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(GlogPaneTest, ASingleHelpTagIsServedByADefaultHelper) {
    ProbePane *pane = NewPane();
    EXPECT_EQ(pane->GetHelpTagHelper(), nullptr);
    LocalizedStrings::HelpTag const *tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    pane->SetHelpTag(tag);
    ASSERT_NE(pane->GetHelpTagHelper(), nullptr);
    EXPECT_TRUE(pane->GetHelpTagHelper()->IsDefaultHelper());
    LocalizedStrings::HelpTag const *found = nullptr;
    Rect part{10, 20, 40, 80};
    OS::Help::Placement placement = OS::Help::kPlacementForParts;
    double delay = 0.5;
    EXPECT_TRUE(pane->GetHelpTagForPoint({15, 25}, found, part, placement, delay));
    EXPECT_EQ(found, tag);
    pane->SetHelpTagHelper(AutoPtr<HelpTagHelper>());
    EXPECT_EQ(pane->GetHelpTagHelper(), nullptr);
}

TEST_F(GlogPaneTest, TheDefaultsOfTheRestRefuse) {
    class Plain : public GlogPane {
    public:
        using GlogPane::BecomeGopherOnSelect;
        using GlogPane::HandleClick;
        using GlogPane::HandleSecondaryButtonClick;

    private:
        void DrawGuts(OSRgn *) override {}
    } pane;
    EventRecordAdapter event;
    EXPECT_EQ(pane.Key(&event), 0);
    EXPECT_EQ(pane.Tab(1), 3);
    EXPECT_FALSE(pane.CanTabIn());
    EXPECT_FALSE(pane.Selectable());
    EXPECT_TRUE(pane.CanDeselect());
    EXPECT_FALSE(pane.BecomeGopherOnSelect());
    EXPECT_EQ(pane.HandleClick(&event), 0);
    EXPECT_EQ(pane.HandleSecondaryButtonClick(&event), 0);
    EXPECT_EQ(pane.CanHandleCustomEvent(nullptr), nullptr);
    EXPECT_EQ(pane.CastToSelectStringPane(), nullptr);
    EXPECT_EQ(pane.CastToConsoleControlSet(), nullptr);
    EXPECT_EQ(pane.CastToControlItem(), nullptr);
    EXPECT_FALSE(pane.Print(nullptr));
}

class PaneOfThisFile : public ProbePane {
public:
    using ProbePane::ProbePane;
};

TEST_F(GlogPaneTest, ATraceNamesClassesWithoutTheirUnnamedNamespace) {
    PaneOfThisFile *const here = new PaneOfThisFile(glog, {0, 0, 5, 5}, calls);
    EXPECT_EQ(MessageTrace::ClassName(*here), "PaneOfThisFile");
}

} // namespace
