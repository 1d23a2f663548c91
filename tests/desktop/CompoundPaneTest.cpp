#include "host/Coordinate.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

class CompoundPaneTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbeContainer *container = new ProbeContainer(glog, {20, 30, 120, 230});
    ProbePane *NewPane(Rect box = {10, 10, 30, 60}, char const *name = "pane") {
        return new ProbePane(glog, box, calls, name);
    }
};

TEST_F(CompoundPaneTest, AddTakesThePaneFromTheTopLevelAndTellsItsIndex) {
    ProbePane *pane = NewPane();
    EXPECT_EQ(CountGlogItems(glog), 2);
    EXPECT_EQ(container->Add(pane, -1), 0);
    EXPECT_EQ(CountGlogItems(glog), 1);
    EXPECT_EQ(container->NumSubpanes(), 1);
    EXPECT_EQ(container->Get(0), pane);
    EXPECT_EQ(container->Find(pane), 0);
    EXPECT_LT(container->Find(container), 0);
    EXPECT_EQ(container->Get(1), nullptr);
    EXPECT_EQ(Count(calls, "pane: ContainmentChanged"), 1);
}

TEST_F(CompoundPaneTest, AddAtAPositionMovesTheOthersBack) {
    ProbePane *a = NewPane(), *b = NewPane(), *c = NewPane();
    container->Add(a, -1);
    container->Add(b, -1);
    EXPECT_EQ(container->Add(c, 1), 1);
    EXPECT_EQ(container->Get(2), b);
    EXPECT_LT(container->Add(nullptr, -1), 0);
    EXPECT_LT(container->Add(container, -1), 0);
}

TEST_F(CompoundPaneTest, AddDoesNotSettleTheLayoutOfAGlogThatIsStillBeingMade) {
    container->SetUseLayout(true);
    ProbePane *const first = NewPane();
    container->Add(first, -1);
    container->Add(NewPane(), -1);
    EXPECT_EQ(BoxOf(*first), (Rect{10, 10, 30, 60}));
    Show();
    EXPECT_EQ(BoxOf(*first), (Rect{0, 0, 20, 50}));
}

TEST_F(CompoundPaneTest, DelDeletesAndDelGutsCanKeepThePaneAlive) {
    ProbePane *kept = NewPane({0, 0, 5, 5}, "kept");
    container->Add(kept, -1);
    container->Add(NewPane({0, 0, 5, 5}, "deleted"), -1);
    container->Del(1);
    EXPECT_EQ(Count(calls, "deleted: gone"), 1);
    container->DelGuts(0, true);
    EXPECT_EQ(Count(calls, "kept: gone"), 0);
    EXPECT_EQ(container->NumSubpanes(), 0);
    EXPECT_EQ(container->Add(kept, -1), 0);
    container->Del(7);
    EXPECT_EQ(container->NumSubpanes(), 1);
}

TEST_F(CompoundPaneTest, TheContainerDeletesItsSubpanesWithItself) {
    container->Add(NewPane(), -1);
    delete container;
    EXPECT_EQ(Count(calls, "pane: gone"), 1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(CompoundPaneTest, ASubpanesCoordinatesCountFromTheTopLeftOfTheContent) {
    ProbePane *pane = NewPane();
    container->Add(pane, -1);
    Point p{10, 10};
    pane->GlogOffset(&p);
    EXPECT_EQ(p, (Point{30, 40}));
    container->scroll = {5, 7};
    OS::Point const inWindow = Coordinate::PaneToWindow(*pane, OS::Point(10, 10));
    EXPECT_EQ(inWindow.x, 33);
    EXPECT_EQ(inWindow.y, 25);
}

TEST_F(CompoundPaneTest, ClicksArriveInTheContentsCoordinatesAtTheTopmostSubpane) {
    ProbePane *below = NewPane({10, 10, 30, 60}, "below"), *above = NewPane({20, 20, 50, 90}, "above");
    container->Add(below, -1);
    container->Add(above, -1);
    above->clickResult = 1;
    Show();
    EXPECT_EQ(ResultOfClick("click 55 45"), 1);
    EXPECT_EQ(Count(calls, "above: click 25 25"), 1);
    EXPECT_EQ(Count(calls, "below: click 25 25"), 0);
    above->SetVisibility(0);
    ResultOfClick("click 55 45");
    EXPECT_EQ(Count(calls, "below: click 25 25"), 1);
}

TEST_F(CompoundPaneTest, TheHitIsThatOfTheInnermostPane) {
    ProbePane *pane = NewPane();
    container->Add(pane, -1);
    container->SetID(4);
    pane->SetID(9);
    pane->clickResult = 2;
    int item = 0, value = 0;
    desktop.SetHitHandler([&](glogRec *, int i, int v) { item = i, value = v; });
    Show();
    desktop.Play("click 45 35");
    EXPECT_EQ(item, 9);
    EXPECT_EQ(value, 2);
}

TEST_F(CompoundPaneTest, SubpanesAreClippedToTheContainer) {
    ProbePane *pane = NewPane({90, 190, 190, 290});
    container->Add(pane, -1);
    Show();
    pane->Inval();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{110, 220, 120, 230}}));
}

TEST_F(CompoundPaneTest, OnlySubpanesThatMeetTheUpdateRegionAreDrawn) {
    container->Add(NewPane({0, 0, 20, 20}, "near"), -1);
    container->Add(NewPane({60, 100, 80, 120}, "far"), -1);
    Show();
    calls.clear();
    container->Get(0)->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(calls, Calls{"near: draw"});
}

TEST_F(CompoundPaneTest, AContainerErasesUnlessToldNotTo) {
    Show();
    container->Inval();
    desktop.TakeDrawing();
    UpdateGlog(glog);
    EXPECT_EQ(Only("EraseRect", desktop.TakeDrawing()).size(), 1u);
    container->SetNoErase(1);
    container->Inval();
    UpdateGlog(glog);
    EXPECT_TRUE(Only("EraseRect", desktop.TakeDrawing()).empty());
}

TEST_F(CompoundPaneTest, VisibilityOfTheContainerCountsForItsSubpanes) {
    ProbePane *pane = NewPane();
    container->Add(pane, -1);
    Show();
    calls.clear();
    container->Hide();
    EXPECT_FALSE(pane->GetVisibility());
    EXPECT_EQ(calls, Calls{"pane: ContainerChangedVisibility"});
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(Count(calls, "pane: draw"), 0);
}

TEST_F(CompoundPaneTest, ActivationAndPositionAreForwarded) {
    container->Add(NewPane(), -1);
    desktop.FinishGlog(glog);
    calls.clear();
    Rect moved{21, 30, 121, 230};
    container->SetBox(&moved);
    EXPECT_EQ(calls, Calls{"pane: PanePositionChanged"});
    calls.clear();
    container->Activate();
    container->Deactivate();
    EXPECT_EQ(calls, (Calls{"pane: Activate", "pane: Deactivate"}));
}

TEST_F(CompoundPaneTest, FindByIDLooksThroughTheSubpanes) {
    ProbePane *pane = NewPane();
    container->Add(pane, -1);
    pane->SetID(12);
    EXPECT_EQ(container->FindByID(12), pane);
    EXPECT_EQ(container->FindByID(13), nullptr);
    EXPECT_EQ(GetGlogItem(glog, 12), pane);
}

TEST_F(CompoundPaneTest, ASubpaneMayDeleteItsNeighbourWhileItHandlesAClick) {
    ProbePane *pane = NewPane({0, 0, 20, 20}, "pane");
    ProbePane *neighbour = NewPane({30, 30, 50, 50}, "neighbour");
    container->Add(pane, -1);
    container->Add(neighbour, -1);
    pane->onClick = [&](EventRecordAdapter *) { container->Del(1); };
    pane->clickResult = 1;
    Show();
    EXPECT_EQ(ResultOfClick("click 35 25"), 1);
    EXPECT_EQ(Count(calls, "neighbour: gone"), 1);
}

TEST_F(CompoundPaneTest, APaneMayDeleteItselfWhileItHandlesAClick) {
    ProbePane *pane = NewPane({0, 0, 20, 20}, "pane");
    container->Add(pane, -1);
    pane->clickResult = -1;
    pane->onClick = [&](EventRecordAdapter *) { container->Del(0); };
    Show();
    EXPECT_EQ(ResultOfClick("click 35 25"), -1);
    EXPECT_EQ(container->NumSubpanes(), 0);
}

TEST_F(CompoundPaneTest, ASubpaneMayRemoveItsNeighbourWhileItIsActivated) {
    class Remover : public ProbePane {
    public:
        Remover(glogRec *glog, Calls &calls, CompoundPane *container_)
            : ProbePane(glog, {0, 0, 5, 5}, calls, "remover")
            , container_of(container_) {}
        void Activate() override { container_of->Del(1); }
        CompoundPane *container_of;
    };
    container->Add(new Remover(glog, calls, container), -1);
    container->Add(NewPane({0, 0, 5, 5}, "removed"), -1);
    container->Activate();
    EXPECT_EQ(Count(calls, "removed: gone"), 1);
    EXPECT_EQ(Count(calls, "removed: Activate"), 0);
}

TEST_F(CompoundPaneTest, ASubpaneMayDeleteTheContainerWhileItIsTold) {
    class Deleter : public ProbePane {
    public:
        Deleter(glogRec *glog, Calls &calls, CompoundPane *container_)
            : ProbePane(glog, {0, 0, 5, 5}, calls, "deleter")
            , whole(container_) {}
        void Activate() override { delete whole; }
        CompoundPane *whole;
    };
    container->Add(new Deleter(glog, calls, container), -1);
    container->Add(NewPane({0, 0, 5, 5}, "second"), -1);
    container->Activate();
    EXPECT_EQ(Count(calls, "second: gone"), 1);
    EXPECT_EQ(Count(calls, "second: Activate"), 0);
}

// Counts how often it is asked where it draws; the box may be another one than was set.
class AskedPane : public ProbePane {
public:
    using ProbePane::ProbePane;
    Rect GetDrawRectangle() override {
        ++asked;
        return calculated ? elsewhere : ProbePane::GetDrawRectangle();
    }
    int asked = 0;
    bool calculated = false;
    Rect elsewhere = {50, 10, 60, 60};
};

class DrawnSubpanes : public CompoundPaneTest {
protected:
    DrawnSubpanes() {
        container->Add(inSight, -1);
        container->Add(outOfSight, -1);
        Show();
        calls.clear();
    }
    // Draws what lies at these rows of the container.
    void Redraw(short top, short bottom) {
        container->Prepare();
        Rect const rows = {static_cast<short>(20 + top), 30, static_cast<short>(20 + bottom), 230};
        VelaDrawing::InvalRect(&rows);
        UpdateGlog(glog);
    }
    bool Drawn(char const *name) {
        bool const drawn = Count(calls, std::string(name) + ": draw") > 0;
        calls.clear();
        return drawn;
    }

    AskedPane *inSight = new AskedPane(glog, {10, 10, 20, 60}, calls, "in sight");
    AskedPane *outOfSight = new AskedPane(glog, {30, 10, 40, 60}, calls, "out of sight");
};

TEST_F(DrawnSubpanes, ThoseOutOfSightAreNotAskedAnything) {
    Redraw(10, 15);
    outOfSight->asked = 0;
    Redraw(12, 18);
    EXPECT_TRUE(Drawn("in sight"));
    EXPECT_FALSE(Drawn("out of sight"));
    EXPECT_EQ(outOfSight->asked, 0);
}

TEST_F(DrawnSubpanes, OneThatHasMovedIsDrawnInItsNewPlace) {
    Redraw(10, 15);
    Rect box = {12, 10, 22, 60};
    outOfSight->SetBox(&box);
    calls.clear();
    Redraw(10, 15);
    EXPECT_TRUE(Drawn("out of sight"));
}

TEST_F(DrawnSubpanes, OneThatIsHiddenIsNotDrawnUntilItIsShown) {
    Redraw(10, 15);
    inSight->SetVisibility(0);
    calls.clear();
    Redraw(10, 15);
    EXPECT_FALSE(Drawn("in sight"));
    inSight->SetVisibility(1);
    Redraw(10, 15);
    EXPECT_TRUE(Drawn("in sight"));
}

TEST_F(DrawnSubpanes, OneThatComesIsDrawn) {
    Redraw(10, 15);
    container->Add(NewPane({10, 70, 20, 90}, "late"), -1);
    UpdateGlog(glog);
    calls.clear();
    Redraw(10, 15);
    EXPECT_TRUE(Drawn("late"));
}

TEST_F(DrawnSubpanes, OneThatCalculatesItsPlaceIsDrawnThereOnceItInvalidatesItself) {
    Redraw(50, 55);
    EXPECT_FALSE(Drawn("out of sight"));
    outOfSight->calculated = true;
    outOfSight->Inval();
    UpdateGlog(glog);
    calls.clear();
    Redraw(50, 55);
    EXPECT_TRUE(Drawn("out of sight"));
}

TEST_F(DrawnSubpanes, InALayoutTheyAreDrawnWhereItHasThem) {
    Redraw(10, 15);
    container->SetUseLayout(true);
    UpdateGlog(glog);
    calls.clear();
    Redraw(0, 5);
    EXPECT_TRUE(Drawn("in sight"));
    Redraw(12, 15);
    EXPECT_TRUE(Drawn("out of sight"));
}

} // namespace
