#include "scrolling/ScrollPane.h"
#include "host/PaneWatch.h"
#include "host/UIEvent.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/desktop/ProbePane.h"
#include <limits>
#include <utility>

namespace {

Rect const kView = {20, 30, 120, 230}; // 200 x 100
Rect const kUpright = {20, 230, 120, 246};
Rect const kLevel = {120, 30, 136, 230};

class ScrollPaneTest : public PaneTest {
protected:
    ScrollPaneTest() {
        Rect view = kView, upright = kUpright, level = kLevel;
        pane->SetBox(&view);
        v->SetBox(&upright);
        h->SetBox(&level);
    }
    void TakeBars() {
        pane->SetHScrollBar(h);
        pane->SetVScrollBar(v);
    }
    // A virtual area of 1000 x 500.
    void TakeArea() {
        pane->SetVirtualWidth(1000);
        pane->SetVirtualHeight(500);
    }
    // Where a point of the view lies in the virtual area, from its top left.
    Point PlaceInArea() {
        Point p = {kView.top, kView.left};
        pane->LocalOffset(&p);
        return p;
    }

    Calls &calls = FreshCalls();
    ScrollPane *pane = new ScrollPane(glog);
    ScrollBarPane *h = new ScrollBarPane(glog, ScrollBarPane::kHorizontalBar, 0, 0);
    ScrollBarPane *v = new ScrollBarPane(glog, 0, 0, 0);
};

} // namespace

TEST_F(ScrollPaneTest, AddsItsOperationsAfterThoseOfAContainer) {
    class Added : public CompoundPane {
    public:
        virtual void First() {}
    };
    ExpectInOrder(PlaceOf(&Added::First), &ScrollPane::GetMaxHScrollValue, &ScrollPane::GetMaxVScrollValue,
                  &ScrollPane::GetScrollDelta, &ScrollPane::SetHScrollPos, &ScrollPane::SetVScrollPos);
}

TEST_F(ScrollPaneTest, BeginsAtTheTopLeftWithAnAreaOfItsBox) {
    EXPECT_EQ(PlaceInArea(), (Point{0, 0}));
    EXPECT_EQ(pane->GetMaxHScrollValue(), 0);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 0);
}

TEST_F(ScrollPaneTest, AnAreaOfTheBoxLeavesTheBarsDead) {
    TakeBars();
    pane->SetHScrollPos(0);
    pane->SetVScrollPos(0);
    EXPECT_EQ(pane->GetThumbRatio(h), 1.0);
    EXPECT_EQ(pane->GetThumbRatio(v), 1.0);
    EXPECT_EQ(h->GetRange(), 0);
    EXPECT_EQ(v->GetRange(), 0);
}

TEST_F(ScrollPaneTest, TheLargestPositionShowsTheAreasEnd) {
    TakeArea();
    EXPECT_EQ(pane->GetMaxHScrollValue(), 800);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 400);
}

TEST_F(ScrollPaneTest, TheAreaIsNeverSmallerThanTheBox) {
    pane->SetVirtualWidth(10);
    pane->SetVirtualHeight(-5);
    EXPECT_EQ(pane->GetMaxHScrollValue(), 0);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 0);
}

TEST_F(ScrollPaneTest, PositionsAreKeptWithinTheArea) {
    TakeArea();
    pane->SetVScrollPos(-3);
    EXPECT_EQ(PlaceInArea().v, 0);
    pane->SetVScrollPos(401);
    EXPECT_EQ(PlaceInArea().v, 400);
    pane->SetHScrollPos(123);
    EXPECT_EQ(PlaceInArea(), (Point{400, 123}));
    pane->SetHScrollPos(std::numeric_limits<int>::max());
    EXPECT_EQ(PlaceInArea().h, 800);
    pane->SetHScrollPos(std::numeric_limits<int>::min());
    EXPECT_EQ(PlaceInArea().h, 0);
}

TEST_F(ScrollPaneTest, APositionIsShownOnItsBar) {
    TakeBars();
    TakeArea();
    pane->SetVScrollPos(70);
    EXPECT_EQ(v->GetPosition(), 70);
    EXPECT_EQ(v->GetRange(), 400);
    pane->SetHScrollPos(90);
    EXPECT_EQ(h->GetPosition(), 90);
    EXPECT_EQ(h->GetRange(), 800);
}

TEST_F(ScrollPaneTest, SettingAPositionInvalidatesThePaneAndTellsTheSubpanes) {
    ProbePane *const inside = new ProbePane(glog, {0, 0, 20, 20}, calls, "inside");
    pane->Add(inside, -1);
    TakeArea();
    Show();
    calls.clear();
    pane->SetVScrollPos(0); // also when it has not changed
    EXPECT_EQ(calls, Calls{"inside: PanePositionChanged"});
    EXPECT_EQ(Repainted(), std::vector<Rect>{kView});
    pane->SetHScrollPos(5);
    EXPECT_EQ(Repainted(), std::vector<Rect>{kView});
}

TEST_F(ScrollPaneTest, SubpanesAreSeenAndClickedWhereTheyHaveScrolledTo) {
    ProbePane *const inside = new ProbePane(glog, {200, 300, 220, 340}, calls, "inside");
    pane->Add(inside, -1);
    TakeArea();
    pane->SetVScrollPos(190);
    pane->SetHScrollPos(280);
    Show();
    calls.clear();
    desktop.Play("click 55 35");
    EXPECT_EQ(Count(calls, "inside: click 305 205"), 1);
}

TEST_F(ScrollPaneTest, WithoutBarsItMovesByPositionsAlone) {
    TakeArea();
    pane->HScroll(10);
    pane->VScroll(10);
    EXPECT_EQ(PlaceInArea(), (Point{0, 0}));
    pane->SetVScrollPos(10);
    EXPECT_EQ(PlaceInArea(), (Point{10, 0}));
}

TEST_F(ScrollPaneTest, ScrollsByPixelsAlongAnAxisWithABar) {
    TakeBars();
    TakeArea();
    pane->HScroll(30);
    pane->VScroll(50);
    pane->VScroll(-20);
    EXPECT_EQ(PlaceInArea(), (Point{30, 30}));
    pane->VScroll(std::numeric_limits<int>::max());
    EXPECT_EQ(PlaceInArea().v, 400);
}

TEST_F(ScrollPaneTest, ABarThatIsTakenHearsOfNoPositionYet) {
    TakeArea();
    pane->SetVScrollPos(70);
    pane->SetVScrollBar(v);
    EXPECT_EQ(v->GetClient(), pane);
    EXPECT_EQ(v->GetRange(), 0);
    pane->SetVScrollPos(71);
    EXPECT_EQ(v->GetPosition(), 71);
}

TEST_F(ScrollPaneTest, AnotherBarLeavesTheFormerOneWithoutAClient) {
    TakeBars();
    ScrollBarPane *const other = new ScrollBarPane(glog, 0, 0, 0);
    pane->SetVScrollBar(other);
    EXPECT_EQ(v->GetClient(), nullptr);
    EXPECT_EQ(other->GetClient(), pane);
    pane->SetHScrollBar(nullptr);
    EXPECT_EQ(h->GetClient(), nullptr);
}

TEST_F(ScrollPaneTest, TakingItsOwnBarAgainChangesNothing) {
    TakeBars();
    h->SetClient(nullptr);
    pane->SetHScrollBar(h);
    EXPECT_EQ(h->GetClient(), nullptr);
}

TEST_F(ScrollPaneTest, ABarThatIsGoneIsForgotten) {
    TakeBars();
    TakeArea();
    delete v;
    delete h;
    pane->SetVScrollPos(10);
    pane->VScroll(10);
    EXPECT_EQ(PlaceInArea().v, 10);
}

TEST_F(ScrollPaneTest, ItsBarsHaveNoClientOnceItIsGone) {
    TakeBars();
    delete pane;
    EXPECT_EQ(h->GetClient(), nullptr);
    EXPECT_EQ(v->GetClient(), nullptr);
}

TEST_F(ScrollPaneTest, AnswersEachBarForItsAxis) {
    TakeBars();
    TakeArea();
    EXPECT_EQ(pane->GetMaxScrollValue(h), 800);
    EXPECT_EQ(pane->GetMaxScrollValue(v), 400);
    EXPECT_DOUBLE_EQ(pane->GetThumbRatio(h), 0.2);
    EXPECT_DOUBLE_EQ(pane->GetThumbRatio(v), 0.2);
}

TEST_F(ScrollPaneTest, AnswersZeroToOtherBarsAndWithoutBars) {
    TakeArea();
    EXPECT_EQ(pane->GetMaxScrollValue(v), 0);
    EXPECT_EQ(pane->GetThumbRatio(v), 0.0);
    EXPECT_EQ(pane->GetMaxScrollValue(nullptr), 0);
    EXPECT_EQ(pane->GetThumbRatio(nullptr), 0.0);
    pane->SetHScrollBar(h);
    EXPECT_EQ(pane->GetMaxScrollValue(v), 0);
    EXPECT_EQ(pane->GetThumbRatio(v), 0.0);
}

TEST_F(ScrollPaneTest, AnyBarButTheHorizontalOneMovesTheVerticalPosition) {
    TakeArea();
    pane->SetHScrollBar(h);
    pane->ScrollTo(h, 40);
    pane->ScrollTo(v, 60);
    EXPECT_EQ(PlaceInArea(), (Point{60, 40}));
    int amount = 5, multiplier = 3;
    pane->Scroll(h, amount, multiplier);
    pane->Scroll(v, amount, multiplier);
    EXPECT_EQ(PlaceInArea(), (Point{75, 55}));
}

TEST_F(ScrollPaneTest, AScrollDoesNotRaiseTheMultiplier) {
    TakeArea();
    int amount = 5, multiplier = 2;
    pane->Scroll(v, amount, multiplier);
    EXPECT_EQ(amount, 5);
    EXPECT_EQ(multiplier, 2);
}

TEST_F(ScrollPaneTest, AnArrowScrollsTenPixelsAndAPageNineTenthsOfTheBox) {
    TakeBars();
    TakeArea();
    int amount = 0, multiplier = 0;
    pane->StartScrolling(v, true, amount, multiplier);
    EXPECT_EQ(amount, 10);
    EXPECT_EQ(multiplier, 1);
    pane->StartScrolling(v, false, amount, multiplier);
    EXPECT_EQ(amount, 90);
    pane->StartScrolling(h, false, amount, multiplier);
    EXPECT_EQ(amount, 180);
    Rect odd = {20, 30, 127, 230};
    pane->SetBox(&odd);
    pane->StartScrolling(nullptr, false, amount, multiplier);
    EXPECT_EQ(amount, 96); // 96.3
}

TEST_F(ScrollPaneTest, ArrowsAndPagesOfItsBarsMoveIt) {
    TakeBars();
    TakeArea();
    v->ScrollOneUnit(true);
    v->ScrollPage(true);
    h->ScrollToEnd(true);
    EXPECT_EQ(PlaceInArea(), (Point{100, 800}));
    h->ScrollOneUnit(false);
    EXPECT_EQ(PlaceInArea(), (Point{100, 790}));
    EXPECT_EQ(h->GetPosition(), 790);
}

TEST_F(ScrollPaneTest, AGrowingBoxTakesTheAreaAlong) {
    TakeArea();
    Rect large = {20, 30, 620, 1130};
    pane->SetBox(&large);
    EXPECT_EQ(pane->GetMaxHScrollValue(), 0);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 0);
    Rect view = kView;
    pane->SetBox(&view); // the area stays what it has become
    EXPECT_EQ(pane->GetMaxHScrollValue(), 900);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 500);
}

TEST_F(ScrollPaneTest, AnotherBoxBringsThePositionsBackIntoTheArea) {
    TakeBars();
    TakeArea();
    pane->SetVScrollPos(400);
    pane->SetHScrollPos(800);
    Rect larger = {20, 30, 220, 330}; // 300 x 200
    pane->SetBox(&larger);
    EXPECT_EQ(PlaceInArea(), (Point{300, 700}));
    EXPECT_EQ(v->GetPosition(), 300);
    EXPECT_EQ(v->GetRange(), 300);
    EXPECT_EQ(h->GetRange(), 700);
}

TEST_F(ScrollPaneTest, AnotherBoxSetsTheVerticalPositionFirst) {
    class Noting : public ScrollPane {
    public:
        using ScrollPane::ScrollPane;
        void SetHScrollPos(int position) override {
            order += 'h';
            ScrollPane::SetHScrollPos(position);
        }
        void SetVScrollPos(int position) override {
            order += 'v';
            ScrollPane::SetVScrollPos(position);
        }
        std::string order;
    };
    Noting *const noting = new Noting(glog);
    Rect box = kView;
    noting->SetBox(&box);
    EXPECT_EQ(noting->order, "vh");
}

TEST_F(ScrollPaneTest, ASubpaneThatHearsOfANewBoxMayDeleteIt) {
    class Deleting : public ProbePane {
    public:
        using ProbePane::ProbePane;
        void PanePositionChanged() override { delete std::exchange(victim, nullptr); }
        GlogPane *victim = nullptr;
    };
    Deleting *const inside = new Deleting(glog, {0, 0, 20, 20}, calls, "inside");
    pane->Add(inside, -1);
    inside->victim = pane;
    PaneWatch const watch(pane);
    Rect box = {20, 30, 90, 130};
    pane->SetBox(&box);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollPaneTest, TheTopStaysWhenTheHeightChanges) {
    TakeArea();
    pane->SetVirtualHeight(900);
    EXPECT_EQ(PlaceInArea().v, 0);
}

TEST_F(ScrollPaneTest, TheBottomStaysWhenTheHeightChanges) {
    TakeArea();
    pane->SetVScrollPos(400);
    pane->SetVirtualHeight(900);
    EXPECT_EQ(PlaceInArea().v, 800);
    pane->SetVirtualHeight(300);
    EXPECT_EQ(PlaceInArea().v, 200);
}

TEST_F(ScrollPaneTest, TheMiddleOfTheViewStaysWhenTheHeightChanges) {
    TakeArea();
    pane->SetVScrollPos(200); // the middle at 250 of 500
    pane->SetVirtualHeight(1000);
    EXPECT_EQ(PlaceInArea().v, 450);
    pane->SetVirtualHeight(333); // the middle at 166.5
    EXPECT_EQ(PlaceInArea().v, 116);
}

TEST_F(ScrollPaneTest, TheMiddleOfTheViewStaysWhenTheWidthChanges) {
    TakeArea();
    pane->SetHScrollPos(400);
    pane->SetVirtualWidth(2000);
    EXPECT_EQ(PlaceInArea().h, 900);
    pane->SetHScrollPos(1800);
    pane->SetVirtualWidth(700);
    EXPECT_EQ(PlaceInArea().h, 500);
}

TEST_F(ScrollPaneTest, AViewNearTheTopOfAShrinkingAreaComesToItsTop) {
    TakeArea();
    pane->SetVScrollPos(10); // the middle at 60 of 500
    pane->SetVirtualHeight(150);
    EXPECT_EQ(PlaceInArea().v, 0); // 18 - 50
}

TEST_F(ScrollPaneTest, TheSameSizeIsNoChange) {
    TakeArea();
    Show();
    pane->SetVirtualHeight(500);
    pane->SetVirtualWidth(1000);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollPaneTest, AWheelNotchScrollsFivePixels) {
    TakeBars();
    TakeArea();
    Show();
    desktop.Play("wheel 100 60 0 -2");
    EXPECT_EQ(PlaceInArea(), (Point{10, 0}));
    desktop.Play("wheel 100 60 -3 0");
    EXPECT_EQ(PlaceInArea(), (Point{10, 15}));
    desktop.Play("wheel 100 60 0 1");
    EXPECT_EQ(PlaceInArea(), (Point{5, 15}));
}

TEST_F(ScrollPaneTest, WithoutBarsTheWheelIsTakenAndDoesNothing) {
    TakeArea();
    Show();
    desktop.Play("wheel 100 60 0 -2");
    EXPECT_EQ(PlaceInArea(), (Point{0, 0}));
}
