// The list as what a bar scrolls, the wheel, and ways to a row.
#include "desktop/panes/PaneEvents.h"
#include "host/CustomEventHandler.h"
#include "tests/lists/ListTest.h"
#include <cmath>
#include <limits>

namespace {

int const kMost = std::numeric_limits<int>::max(), kLeast = std::numeric_limits<int>::min();

class Turn : public WheelEvent {
public:
    explicit Turn(float delta, int axis = 1)
        : WheelEvent(Point{0, 0}, delta, axis) {}
};

class GListPaneScrollingTest : public ListTest {
protected:
    // A list with its bar beside it.
    GListPane *WithBar(int rows) {
        GListPane *const list = NewList(Record());
        bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect box = {20, 230, 120, 246};
        bar->SetBox(&box);
        list->SetScrollBar(bar);
        list->SetColumnList(ThreeColumns());
        list->SetLineDrawer(&drawer, false);
        list->SetNumItems(rows);
        return list;
    }
    struct Steps {
        int amount, multiplier;
    };
    static Steps Started(GListPane &list, bool byUnit) {
        Steps steps = {-7, -7};
        list.StartScrolling(nullptr, byUnit, steps.amount, steps.multiplier);
        return steps;
    }
    // Where a position leads.
    static int Reached(GListPane &list, int position) {
        list.SetScrollPosition(position);
        return list.GetScrollPos();
    }
    static int Paged(GListPane &list, int from, int first, int last) {
        list.SetScrollPosition(from);
        list.PageTillVisible(first, last);
        return list.GetScrollPos();
    }

    ScrollBarPane *bar = nullptr;
};

} // namespace

TEST_F(GListPaneScrollingTest, WithoutABarItStaysWhereItIs) {
    GListPane *const list = NewList(Record());
    list->SetNumItems(100);
    Show();
    EXPECT_TRUE(InvalidatedBy([&] { list->SetScrollPosition(10); }).empty());
    EXPECT_EQ(list->GetScrollPos(), 0);
    list->ScrollTo(nullptr, 10);
    list->PageTillVisible(50);
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneScrollingTest, WithoutABarItScrollsWhenToldTo) {
    GListPane *const list = NewList(Record());
    list->SetNumItems(100);
    list->SetScrollWithNoBar(true);
    EXPECT_EQ(Reached(*list, 10), 10);
    list->SetScrollWithNoBar(false);
    EXPECT_EQ(Reached(*list, 20), 10);
}

TEST_F(GListPaneScrollingTest, GoesToTheNearestPosition) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Reached(*list, 94), 94);
    EXPECT_EQ(Reached(*list, 95), 94);
    EXPECT_EQ(Reached(*list, kMost), 94);
    EXPECT_EQ(Reached(*list, -1), 0);
    EXPECT_EQ(Reached(*list, kLeast), 0);
}

TEST_F(GListPaneScrollingTest, FewerRowsThanFitDoNotScroll) {
    GListPane *const list = WithBar(4);
    EXPECT_EQ(list->GetMaxScrollValue(bar), -2);
    EXPECT_EQ(Reached(*list, 3), 0);
    EXPECT_EQ(bar->GetRange(), 0);
    EXPECT_EQ(bar->GetPosition(), 0);
}

TEST_F(GListPaneScrollingTest, EveryPositionIsShownOnTheBarAndDrawsTheListAnew) {
    GListPane *const list = WithBar(100);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SetScrollPosition(50); }),
              (Log{"50", "51", "52", "53", "54", "55", "56"}));
    EXPECT_EQ(bar->GetPosition(), 50);
    EXPECT_EQ(bar->GetRange(), 94);
    EXPECT_EQ(RowsDrawnBy([&] { list->SetScrollPosition(50); }).size(), 7u) << "also the same one";
}

TEST_F(GListPaneScrollingTest, ARowThatComesInOrGoesShowsOnTheBar) {
    GListPane *const list = WithBar(100);
    Show();
    Log const all = {"0", "1", "2", "3", "4", "5", "6"};
    EXPECT_EQ(RowsDrawnBy([&] { list->AddItem(50); }), all);
    EXPECT_EQ(bar->GetRange(), 95);
    EXPECT_EQ(RowsDrawnBy([&] { list->DelItem(50); }), all);
    EXPECT_EQ(bar->GetRange(), 94);
    list->SetScrollPosition(94);
    list->DelItem(0);
    EXPECT_EQ(list->GetScrollPos(), 93);
    EXPECT_EQ(bar->GetPosition(), 93);
}

// Kept: only a row that goes invalidates by itself.
TEST_F(GListPaneScrollingTest, WithoutABarARowThatComesInDrawsNothing) {
    GListPane *const list = Filled(3);
    list->SetScrollWithNoBar(false);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->AddItem(0); }), Log());
    EXPECT_EQ(RowsDrawnBy([&] { list->DelItem(0); }), (Log{"0", "1", "2"}));
}

TEST_F(GListPaneScrollingTest, GoingToAPageNeitherDrawsNorShowsOnTheBar) {
    GListPane *const list = WithBar(100);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { EXPECT_TRUE(list->ScrollToPage(3)); }), Log());
    EXPECT_EQ(list->GetScrollPos(), 14);
    EXPECT_EQ(bar->GetPosition(), 0);
    EXPECT_FALSE(list->ScrolledToEnd());
}

TEST_F(GListPaneScrollingTest, APageBehindTheLastRowIsTheEnd) {
    GListPane *const list = WithBar(14); // seven of them show
    EXPECT_TRUE(list->ScrollToPage(2));
    EXPECT_FALSE(list->ScrolledToEnd());
    EXPECT_FALSE(list->ScrollToPage(3));
    EXPECT_TRUE(list->ScrolledToEnd());
}

TEST_F(GListPaneScrollingTest, ItsRatioIsTheRowsThatFitOverAllRows) {
    GListPane *const list = WithBar(100);
    EXPECT_DOUBLE_EQ(list->GetThumbRatio(bar), 0.06);
    list->SetNumItems(3);
    EXPECT_DOUBLE_EQ(list->GetThumbRatio(bar), 2.0);
}

TEST_F(GListPaneScrollingTest, WithoutRowsItsBarIsDeadWhateverTheRatio) {
    GListPane *const list = WithBar(0);
    EXPECT_TRUE(std::isinf(list->GetThumbRatio(bar)));
    EXPECT_EQ(bar->GetRange(), 0);
    list->SetLineHeight(0);
    EXPECT_TRUE(std::isnan(list->GetThumbRatio(bar)));
    EXPECT_EQ(bar->GetRange(), 0);
    Show();
    EXPECT_EQ(ResultOfClick("click 238 110"), -1) << "a dead bar takes the press and does nothing";
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneScrollingTest, AnArrowMovesARowAndAPageAllButTwo) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Started(*list, true).amount, 1);
    EXPECT_EQ(Started(*list, false).amount, 5);
    EXPECT_EQ(Started(*list, false).multiplier, 1);
    EXPECT_EQ(Started(*list, true).multiplier, 1);
    for (int height : {33, 50, 98, 200}) { // 3, 2, 1 rows
        list->SetLineHeight(height);
        EXPECT_EQ(Started(*list, false).amount, 1) << height;
    }
    list->SetLineHeight(25); // 4 rows
    EXPECT_EQ(Started(*list, false).amount, 2);
}

TEST_F(GListPaneScrollingTest, ItsBarMovesIt) {
    GListPane *const list = WithBar(100);
    bar->ScrollOneUnit(true);
    EXPECT_EQ(list->GetScrollPos(), 1);
    bar->ScrollPage(true);
    EXPECT_EQ(list->GetScrollPos(), 6);
    bar->ScrollToEnd(true);
    EXPECT_EQ(list->GetScrollPos(), 94);
    bar->ScrollPage(false);
    EXPECT_EQ(list->GetScrollPos(), 89);
}

TEST_F(GListPaneScrollingTest, AStepIgnoresTheMultiplier) {
    GListPane *const list = Filled(100);
    int amount = 3, multiplier = 4;
    list->Scroll(nullptr, amount, multiplier);
    EXPECT_EQ(list->GetScrollPos(), 3);
    EXPECT_EQ(amount, 3);
    EXPECT_EQ(multiplier, 4);
    amount = kMost;
    list->Scroll(nullptr, amount, multiplier);
    EXPECT_EQ(list->GetScrollPos(), 94);
    amount = kLeast;
    list->Scroll(nullptr, amount, multiplier);
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneScrollingTest, AnArrowRepeatsEveryFiveTicks) {
    EXPECT_EQ(Filled(100)->GetArrowScrollDelay(), 5);
}

TEST_F(GListPaneScrollingTest, AnotherBoxBringsThePositionBackIntoRange) {
    GListPane *const list = WithBar(100);
    list->SetScrollPosition(94);
    Rect larger = {20, 30, 182, 230}; // ten rows
    list->SetBox(&larger);
    EXPECT_EQ(list->GetScrollPos(), 90);
    EXPECT_EQ(bar->GetRange(), 90);
}

TEST_F(GListPaneScrollingTest, TheOffsetOfTheFirstRowCanLeaveNoRoomForRows) {
    glistResRec record = Record();
    record.firstLineOffset = 30000;
    GListPane *const list = Equipped(NewList(record), kMost);
    EXPECT_LT(list->NumFullyDisplayedLines(), 0);
    EXPECT_EQ(list->GetMaxScrollValue(nullptr), kMost);
    EXPECT_EQ(Reached(*list, kMost), kMost);
    Show();
    EXPECT_EQ(drawer.TakeRows(), Log());
    EXPECT_EQ(ResultOfClick("click 60 60"), 0);
}

// The wheel

TEST_F(GListPaneScrollingTest, AWheelNotchIsARow) {
    GListPane *const list = Filled(100);
    Show();
    desktop.Play("wheel 100 60 0 -3");
    EXPECT_EQ(list->GetScrollPos(), 3);
    desktop.Play("wheel 100 60 0 1");
    EXPECT_EQ(list->GetScrollPos(), 2);
    desktop.Play("wheel 100 60 0 -900");
    EXPECT_EQ(list->GetScrollPos(), 94);
}

TEST_F(GListPaneScrollingTest, PartsOfANotchAreCut) {
    GListPane *const list = Filled(100);
    Show();
    desktop.Play("wheel 100 60 0 -1.9");
    EXPECT_EQ(list->GetScrollPos(), 1);
    desktop.Play("wheel 100 60 0 0.9");
    EXPECT_EQ(list->GetScrollPos(), 1);
}

TEST_F(GListPaneScrollingTest, AWheelAcrossIsLeftToOthers) {
    GListPane *const list = Filled(100);
    Show();
    desktop.Play("wheel 100 60 -3 0");
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneScrollingTest, TheWheelCanBeInhibited) {
    GListPane *const list = Filled(100);
    Show();
    list->SetInhibitScrolling(true);
    EXPECT_TRUE(list->GetInhibitScrolling());
    desktop.Play("wheel 100 60 0 -3");
    EXPECT_EQ(list->GetScrollPos(), 0);
    list->SetInhibitScrolling(false);
    desktop.Play("wheel 100 60 0 -3");
    EXPECT_EQ(list->GetScrollPos(), 3);
}

TEST_F(GListPaneScrollingTest, ACopyOfAWheelHandlerWorksForTheSameList) {
    GListPane *const list = Filled(100);
    Turn turn(-2);
    CustomEventHandler *const handler = list->CanHandleCustomEvent(&turn);
    ASSERT_NE(handler, nullptr);
    CustomEventHandler *const copy = handler->Clone();
    ASSERT_NE(copy, nullptr);
    ::operator delete(handler);
    EXPECT_TRUE(copy->HandleEvent(&turn));
    Turn across(-2, 0);
    EXPECT_FALSE(copy->HandleEvent(&across));
    ::operator delete(copy);
    EXPECT_EQ(list->GetScrollPos(), 2);
}

TEST_F(GListPaneScrollingTest, TurnsBeyondAllNumbersEndAtAnEnd) {
    GListPane *const list = Filled(100);
    for (float delta : {-1e30f, -std::numeric_limits<float>::infinity()}) {
        list->SetScrollPosition(50);
        Turn turn(delta);
        list->DispatchCustomEvent(&turn);
        EXPECT_EQ(list->GetScrollPos(), 94);
    }
    for (float delta : {1e30f, std::numeric_limits<float>::infinity()}) {
        list->SetScrollPosition(50);
        Turn turn(delta);
        list->DispatchCustomEvent(&turn);
        EXPECT_EQ(list->GetScrollPos(), 0);
    }
    list->SetScrollPosition(50);
    Turn turn(std::numeric_limits<float>::quiet_NaN());
    list->DispatchCustomEvent(&turn);
    EXPECT_EQ(list->GetScrollPos(), 50);
}

// Ways to a row: six rows fit

TEST_F(GListPaneScrollingTest, ARowThatShowsStaysWhereItIs) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Paged(*list, 20, 20, 20), 20);
    EXPECT_EQ(Paged(*list, 20, 25, 25), 20);
}

TEST_F(GListPaneScrollingTest, ARowBelowComesToTheTopWithOneRowOfAir) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Paged(*list, 20, 26, 26), 25) << "it shows in part only";
    EXPECT_EQ(Paged(*list, 20, 50, 50), 49);
    EXPECT_EQ(Paged(*list, 20, 50, 54), 49);
    EXPECT_EQ(Paged(*list, 20, 50, 55), 50) << "no room for air";
    EXPECT_EQ(Paged(*list, 20, 50, 70), 50);
}

TEST_F(GListPaneScrollingTest, ARowAboveComesToTheBottomWithOneRowOfAir) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Paged(*list, 20, 19, 19), 15);
    EXPECT_EQ(Paged(*list, 50, 10, 14), 10);
    EXPECT_EQ(Paged(*list, 50, 10, 15), 10);
    EXPECT_EQ(Paged(*list, 50, 10, 30), 25);
    EXPECT_EQ(Paged(*list, 50, 0, 0), 0);
}

TEST_F(GListPaneScrollingTest, RowsThatFillTheViewStayWhereTheyAre) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(Paged(*list, 20, 15, 30), 20);
    EXPECT_EQ(Paged(*list, 20, 20, 25), 20);
    EXPECT_EQ(Paged(*list, 20, 20, 30), 20);
}

TEST_F(GListPaneScrollingTest, OneRowIsAsGoodAsARange) {
    GListPane *const list = Filled(100);
    list->PageTillVisible(40);
    EXPECT_EQ(list->GetScrollPos(), 39);
}
