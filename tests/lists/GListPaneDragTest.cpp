// A press that is held and moved: over rows, off the list, and over a cell that works as a button.
#include "host/CIdleChore.h"
#include "host/VelaDrawing.h"
#include "tests/lists/ListTest.h"
#include <algorithm>
#include <functional>
#include <limits>

namespace {

class GListPaneDragTest : public ListTest {
protected:
    typedef std::vector<int> Rows;

    GListPane *Shown(int rows, GListSelectionMode mode, Rows const &selected = Rows()) {
        GListPane *const list = Filled(rows, mode);
        for (int row : selected)
            list->SelectItem(row);
        Show();
        return list;
    }
    // A step of a script at a height of the first column.
    static std::string V(char const *step, int v) {
        return std::string(step) + " 40 " + std::to_string(v) + "\n";
    }
    static std::string Press(int place, char const *modifiers = "") {
        return "wait 1\npress " + At(place) + " " + modifiers + "\n"; // no double click
    }
    static std::string Move(int place, int column = 0) { return "move " + At(place, column) + "\n"; }
    static std::string Wait(double seconds) { return "wait " + std::to_string(seconds) + "\n"; }
    // Off the list's ends.
    static std::string Above() { return V("move", 5); }
    static std::string Below() { return V("move", 140); }
};

std::string const kRelease = "release\n";

} // namespace

// One row

namespace {

// Counts the times at which whoever follows the mouse goes round.
class CountingChore : public CIdleChore {
public:
    CountingChore()
        : CIdleChore(0, kNoInitialDelay) {
        Assign();
    }
    int count = 0;

private:
    void DoIdle() override { ++count; }
};

// Runs once, in the middle of a press.
class OneChore : public CIdleChore {
public:
    OneChore(int ticks, std::function<void()> const &action_)
        : CIdleChore(ticks, kInitialDelay)
        , action(action_) {
        Assign();
    }

private:
    void DoIdle() override {
        Cancel();
        action();
    }
    std::function<void()> const action;
};

} // namespace

TEST_F(GListPaneDragTest, WhileTheMouseRestsOnARowNothingWakes) {
    Shown(5, kListSelectOne);
    CountingChore chore;
    desktop.Play(Press(1) + Wait(10) + kRelease);
    int const resting = chore.count;
    desktop.Play(Press(3) + Wait(20) + kRelease);
    EXPECT_EQ(chore.count, 2 * resting) << "longer is no more often";
}

TEST_F(GListPaneDragTest, WhileTheMouseRestsOutsideOfTheColumnNothingWakes) {
    Shown(5, kListSelectOne);
    CountingChore chore;
    desktop.Play(Press(1) + Move(3, 1) + Wait(10) + kRelease);
    int const resting = chore.count;
    desktop.Play(Press(1) + Move(3, 1) + Wait(20) + kRelease);
    EXPECT_EQ(chore.count, 2 * resting);
}

TEST_F(GListPaneDragTest, RowsThatMoveUnderAMouseAtRestAreFollowed) {
    GListPane *const list = Shown(100, kListSelectOne);
    Rows before, after;
    OneChore moving(66, [&] { // 1.1 seconds: the press is after one
        list->SetScrollPosition(7);
        before = SelectedRows(*list);
    });
    OneChore looking(70, [&] { after = SelectedRows(*list); });
    desktop.Play(Press(1) + Wait(1) + kRelease);
    EXPECT_EQ(before, Rows{1});
    EXPECT_EQ(after, Rows{8}) << "at the next of the times at which a list looks";
    EXPECT_EQ(SelectedRows(*list), Rows{8});
}

TEST_F(GListPaneDragTest, AfterARestADragOffTheListScrollsAsOften) {
    GListPane *const list = Shown(100, kListSelectOne);
    desktop.Play(Press(1) + Wait(3) + Below() + Wait(0.5) + kRelease);
    int const rested = list->GetScrollPos();
    list->SetScrollPosition(0);
    desktop.Play(Press(1) + Below() + Wait(0.5) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), rested);
    EXPECT_GT(rested, 5);
}

TEST_F(GListPaneDragTest, TheOneRowFollowsTheMouse) {
    GListPane *const list = Shown(5, kListSelectOne);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(Press(1) + Move(3) + Move(2) + kRelease); }),
              (Log{"1*", "1", "3*", "2*", "3"}));
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(listener.Take(), (Log{"done", "done"})) << "rows are not told of";
}

TEST_F(GListPaneDragTest, EachRowIsAStepOfTracking) {
    Shown(5, kListSelectOne);
    ListHooks hooks;
    desktop.Play(Press(1) + Wait(0.5) + Move(3) + Move(3) + V("move", 70) + Move(2) + kRelease);
    EXPECT_EQ(hooks.steps, 3);
    EXPECT_EQ(hooks.otherSteps, 0);
}

TEST_F(GListPaneDragTest, OffTheRowsNoneIsSelected) {
    GListPane *const list = Shown(5, kListSelectOne);
    desktop.Play(Press(1) + Below() + kRelease);
    EXPECT_EQ(list->GetFirstSelectedItem(), -2);
    EXPECT_EQ(list->NumSelected(), 0);
    int line = 0;
    EXPECT_FALSE(list->GetFirstSelectedItem(line));
    desktop.Play(Press(1) + Above() + kRelease);
    EXPECT_EQ(list->GetFirstSelectedItem(), -1);
}

TEST_F(GListPaneDragTest, BackOnTheRowsOneIsSelectedAgain) {
    GListPane *const list = Shown(5, kListSelectOne);
    desktop.Play(Press(1) + Below() + Wait(0.2) + Move(4) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{4});
}

TEST_F(GListPaneDragTest, OutsideOfTheColumnThatSelectsNothingHappens) {
    GListPane *const list = Shown(5, kListSelectOne);
    desktop.Play(Press(1) + Move(3, 1) + Wait(0.2) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    desktop.Play(Press(1) + "move 100 140\nwait 0.5\n" + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{1}) << "nor is it left";
}

TEST_F(GListPaneDragTest, WhereAllColumnsSelectTheColumnDoesNotCount) {
    GListPane *const list = Shown(5, kListSelectOne);
    list->SetSelColumn(GListPane::kAnyColumn);
    desktop.Play(Press(1) + Move(3, 1) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{3});
    desktop.Play(Press(1) + "move 225 60\n" + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

TEST_F(GListPaneDragTest, TheLastPlaceIsReportedToTheOwner) {
    glistResRec record = Record();
    record.selReturn = true;
    GListPane *const list = Equipped(NewList(record), 5);
    Show();
    int line = 0, column = 0;
    desktop.Play(Press(1) + Move(3) + kRelease);
    list->GetClickParameters(line, column);
    EXPECT_EQ(line, 3);
    EXPECT_EQ(column, 0);
    desktop.Play(Press(1) + Move(2, 2) + kRelease);
    list->GetClickParameters(line, column);
    EXPECT_EQ(line, 2);
    EXPECT_EQ(column, 2) << "also of another column";
}

// Several rows

TEST_F(GListPaneDragTest, RowsThatAreDraggedOverAreSelected) {
    GListPane *const list = Shown(5, kListSelectSeveral, {0});
    desktop.Play(Press(1) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3}));
    EXPECT_EQ(listener.Take(), (Log{"deselect 4", "deselect 3", "deselect 2", "deselect 1", "deselect 0",
                                    "done", "select 1", "select 2 tracking", "select 3 tracking", "done"}));
    EXPECT_EQ(list->NumSelected(), 3);
}

TEST_F(GListPaneDragTest, RowsThatTheDragLeavesAgainBecomeWhatTheyWere) {
    GListPane *const list = Shown(6, kListSelectSeveral, {3});
    desktop.Play(Press(2, "command") + Move(5) + Move(1) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3}));
    EXPECT_EQ(listener.Take(),
              (Log{"select 2", "select 4 tracking", "select 5 tracking", "deselect 5 tracking",
                   "deselect 4 tracking", "select 1 tracking", "done"}));
}

TEST_F(GListPaneDragTest, ADragFromASelectedRowDeselects) {
    GListPane *const list = Shown(6, kListSelectSeveral, {2, 3, 5});
    desktop.Play(Press(2, "command") + Move(5) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{5});
    EXPECT_EQ(listener.Take(),
              (Log{"deselect 2", "deselect 3 tracking", "deselect 5 tracking", "select 5 tracking", "done"}));
    EXPECT_EQ(list->NumSelected(), 1);
}

TEST_F(GListPaneDragTest, FlagsTellOfTheGestureWhileItRuns) {
    GListPane *const list = Shown(6, kListSelectSeveral, {3});
    int nonZero = -1;
    listener.onCall = [&](std::string const &call) {
        if (call == "deselect 3 tracking")
            nonZero = list->NumSelected();
    };
    list->SelectItem(2);
    desktop.Play(Press(2, "command") + Move(3) + kRelease);
    EXPECT_EQ(nonZero, 2) << "rows that are deselected for the time being have a flag too";
    EXPECT_EQ(list->NumSelected(), 0);
}

TEST_F(GListPaneDragTest, ARowIsOnlyReachedSomePixelsInside) {
    GListPane *const list = Shown(6, kListSelectSeveral);
    desktop.Play(Press(2) + V("move", 72) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{2}) << "row 3 begins at 69";
    desktop.Play(Press(2) + V("move", 73) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3}));
    desktop.Play(Press(2) + V("move", 50) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows{2}) << "row 1 ends at 53";
    desktop.Play(Press(2) + V("move", 49) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2}));
    desktop.Play(Press(2) + V("move", 86) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3})) << "past row 3, at the near edge of row 4";
}

TEST_F(GListPaneDragTest, TheRowsOfADragAreDrawnAsTheyChange) {
    Shown(6, kListSelectSeveral);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(Press(1) + Move(3) + Move(2) + kRelease); }),
              (Log{"1*", "2*", "3*", "3"}));
}

TEST_F(GListPaneDragTest, WithShiftADragExtendsFromTheAnchorAndOnlyAdds) {
    GListPane *const list = Shown(7, kListSelectSeveral, {1, 2});
    desktop.Play(Press(4, "shift") + Move(5) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3}));
    EXPECT_EQ(listener.Take(), (Log{"select 3 tracking", "select 4 tracking", "select 5 tracking",
                                    "deselect 5 tracking", "deselect 4 tracking", "done"}));
}

TEST_F(GListPaneDragTest, WhereAClickTogglesADragTogglesAllTheSame) {
    GListPane *const list = Shown(6, kListSelectToggle, {0, 2});
    desktop.Play(Press(2) + Move(0) + kRelease);
    EXPECT_EQ(SelectedRows(*list), Rows());
    desktop.Play(Press(2) + Move(0) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
}

TEST_F(GListPaneDragTest, WhereAClickTogglesADragWithCommandDeselects) {
    GListPane *const list = Shown(6, kListSelectToggle, {0});
    desktop.Play(Press(2, "command") + Move(4) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 4, 5}));
    EXPECT_EQ(listener.Take(),
              (Log{"select 5", "select 4", "select 3", "select 2", "select 1", "done", "deselect 2",
                   "deselect 3 tracking", "deselect 4 tracking", "select 4 tracking", "done"}));
    EXPECT_EQ(list->NumSelected(), 4);
}

TEST_F(GListPaneDragTest, WhereAClickTogglesADragWithOptionSelectsAlone) {
    GListPane *const list = Shown(6, kListSelectToggle, {0, 2, 5});
    desktop.Play(Press(2, "option") + Move(4) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3}));
    EXPECT_EQ(listener.Take(),
              (Log{"deselect 5", "deselect 4", "deselect 3", "deselect 2", "deselect 1", "deselect 0", "done",
                   "select 2", "select 3 tracking", "select 4 tracking", "deselect 4 tracking", "done"}));
}

TEST_F(GListPaneDragTest, WhereAClickTogglesADragWithShiftTogglesToo) {
    GListPane *const list = Shown(6, kListSelectToggle, {0, 3});
    desktop.Play(Press(2, "shift") + Move(4) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 2, 3, 4}));
    EXPECT_EQ(listener.Take(), (Log{"select 2", "select 4 tracking", "done"}));
}

TEST_F(GListPaneDragTest, WithShiftAndCommandADragToggles) {
    GListPane *const list = Shown(6, kListSelectSeveral, {0, 3});
    desktop.Play(Press(2, "shift command") + Move(4) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 2, 3, 4}));
    EXPECT_EQ(listener.Take(), (Log{"select 2", "select 4 tracking", "done"}));
    desktop.Play(Press(2, "shift command") + Move(5) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 4}));
}

TEST_F(GListPaneDragTest, WithOptionADragReplaces) {
    GListPane *const list = Shown(6, kListSelectSeveral, {0, 3, 5});
    desktop.Play(Press(2, "option") + Move(4) + Move(3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3}));
}

TEST_F(GListPaneDragTest, OutsideOfTheColumnThatSelectsNothingHappensToSeveralRows) {
    for (GListSelectionMode mode : {kListSelectSeveral, kListSelectToggle}) {
        GListPane *const list = Shown(100, mode);
        desktop.Play(Press(1) + Move(2) + Move(5, 1) + Wait(0.2) + "move 100 140\nwait 0.5\n" + kRelease);
        EXPECT_EQ(SelectedRows(*list), (Rows{1, 2})) << mode;
        EXPECT_EQ(list->GetScrollPos(), 0) << mode;
        list->DeselectAll();
        desktop.Play(Press(1) + Move(5, 1) + Wait(0.2) + Move(3) + kRelease);
        EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3})) << "back in it the drag goes on";
        delete list;
    }
}

// Kept: only the one row that moves is a step.
TEST_F(GListPaneDragTest, WhereSeveralRowsAreSelectedNoStepOfTrackingIsTold) {
    for (GListSelectionMode mode : {kListSelectSeveral, kListSelectToggle}) {
        GListPane *const list = Shown(100, mode);
        ListHooks hooks;
        desktop.Play(Press(1) + Wait(0.2) + Move(3) + Below() + Wait(0.3) + Move(2) + kRelease);
        EXPECT_EQ(hooks.steps, 0) << mode;
        EXPECT_EQ(hooks.otherSteps, 0) << mode;
        delete list;
    }
}

TEST_F(GListPaneDragTest, OfSeveralRowsTheOneThatTheDragHasReachedIsReported) {
    glistResRec record = Record(kListSelectSeveral);
    record.selReturn = true;
    GListPane *const list = Equipped(NewList(record), 100);
    Show();
    int line = 0, column = 0;
    EXPECT_EQ(ResultOfClick(Press(1) + V("move", 72) + kRelease), 3);
    list->GetClickParameters(line, column);
    EXPECT_EQ(line, 2) << "row 3, which begins at 69, is not reached yet";
    EXPECT_EQ(ResultOfClick(Press(3) + Below() + kRelease), 3);
    list->GetClickParameters(line, column);
    EXPECT_EQ(line, 6) << "the last one that showed";
    EXPECT_EQ(column, 0);
}

TEST_F(GListPaneDragTest, WhereAllColumnsSelectRowsChangeWithoutBeingDrawn) {
    GListPane *const list = Shown(6, kListSelectSeveral);
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(Press(1) + Move(3) + kRelease); }), Log());
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3}));
}

TEST_F(GListPaneDragTest, TheColorsOfThePortSurviveAGesture) {
    GListPane *const list = Shown(6, kListSelectSeveral);
    SaveColorRec const tinted = {{1, 2, 3}, {4, 5, 6}};
    list->Prepare();
    SetColors(&tinted);
    EventRecordAdapter event;
    event.where = {60, 40};
    desktop.Script("release");
    (list->*&Opened<GListPane>::HandleClick)(&event);
    list->Prepare();
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, tinted);
}

// Off the list

TEST_F(GListPaneDragTest, BelowTheListItScrollsARowAtOnceAndThenEveryThreeTicks) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    desktop.Play(Press(3) + Below() + Wait(0.04) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 1);
    EXPECT_EQ(SelectedRows(*list), (Rows{3, 4, 5, 6}));
    list->SetScrollPosition(0);
    desktop.Play(Press(3) + Below() + Wait(0.52) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 11);
    EXPECT_EQ(SelectedRows(*list).back(), 16);
    EXPECT_EQ(SelectedRows(*list).size(), 14u);
}

TEST_F(GListPaneDragTest, MovementsInBetweenDoNotMakeItFaster) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    std::string script = Press(3) + Below();
    for (int i = 0; i < 26; ++i)
        script += Wait(0.02) + V("move", 140 + i % 2);
    desktop.Play(script + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 11);
}

TEST_F(GListPaneDragTest, AboveTheListItScrollsToTheFirstRowAndStops) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    list->SetScrollPosition(3);
    desktop.Play(Press(2) + Above() + Wait(1) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 0);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2, 3, 4, 5}));
}

TEST_F(GListPaneDragTest, AtTheFirstRowADragOffTheTopSelectsUpToIt) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    desktop.Play(Press(2) + Above() + Wait(0.3) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
}

TEST_F(GListPaneDragTest, BelowTheListItScrollsToTheLastRow) {
    GListPane *const list = Shown(10, kListSelectSeveral);
    desktop.Play(Press(4) + Below() + Wait(2) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 4);
    EXPECT_EQ(SelectedRows(*list), (Rows{4, 5, 6, 7, 8, 9}));
}

TEST_F(GListPaneDragTest, BelowTheLastRowInTheListNothingScrolls) {
    GListPane *const list = Shown(4, kListSelectSeveral);
    desktop.Play(Press(1) + V("move", 110) + Wait(0.5) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3}));
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneDragTest, InTheFrameAboveTheRowsNothingScrolls) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    list->SetScrollPosition(10);
    desktop.Play(Press(2) + V("move", 20) + Wait(0.5) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 10);
    EXPECT_EQ(SelectedRows(*list), (Rows{9, 10, 11, 12})) << "but the row before counts as reached";
}

TEST_F(GListPaneDragTest, WithoutABarOrLeaveNothingScrolls) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    list->SetScrollWithNoBar(false);
    desktop.Play(Press(2) + Below() + Wait(0.5) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 0);
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3, 4, 5, 6}));
}

TEST_F(GListPaneDragTest, WithoutASelectedRowItScrollsWhileTheMouseRests) {
    GListPane *const list = Shown(100, kListSelectOne);
    desktop.Play(Press(3) + Below() + Wait(0.52) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 11);
    EXPECT_EQ(list->GetFirstSelectedItem(), -2);
}

TEST_F(GListPaneDragTest, AboveTheListTheOneRowScrolls) {
    GListPane *const list = Shown(100, kListSelectOne);
    list->SetScrollPosition(50);
    desktop.Play(Press(3) + Above() + Wait(0.52) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 39);
    EXPECT_EQ(list->GetFirstSelectedItem(), -1);
    EXPECT_EQ(list->NumSelected(), 0);
}

// Kept: scrolling does not ask for the mode.
TEST_F(GListPaneDragTest, InModeOneADragOffTheListScrolls) {
    GListPane *const list = Shown(100, kListSelectOne);
    list->SetSelMode(kListSelectNothing);
    listener.Take();
    desktop.Play(Press(3) + Below() + Wait(0.52) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 11);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
}

// Lower than a row, so the list can be scrolled until its last row has left it.
TEST_F(GListPaneDragTest, AtTheGreatestRowADragBelowStaysThere) {
    int const most = std::numeric_limits<int>::max();
    glistResRec record = Record();
    record.bounds = {20, 30, 32, 230};
    GListPane *const list = Equipped(NewList(record), most);
    list->SetScrollPosition(most - 1);
    Show();
    desktop.Play("wait 1\npress 40 25\n" + Below() + Wait(0.5) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), most);
}

// Kept: a pass that scrolls leaves the row before it as the one that was dealt with last.
TEST_F(GListPaneDragTest, BackOnTheRowThatItLeftTheListFromADragGoesOnAtTheNextRow) {
    GListPane *const list = Shown(7, kListSelectSeveral);
    list->SetScrollPosition(0);
    desktop.Play(Press(4) + Below() + Move(3) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 1);
    EXPECT_EQ(SelectedRows(*list), (Rows{4, 5, 6})) << "place 3 is row 4 now";
    desktop.Play(Press(3) + Below() + Move(3) + Move(2) + kRelease);
    EXPECT_EQ(SelectedRows(*list), (Rows{3, 4}));
}

// Kept: what comes too early counts as dealt with, and off the rows there is no other row to come to.
TEST_F(GListPaneDragTest, WithoutASelectedRowAMovementTooEarlyEndsTheScrolling) {
    GListPane *const list = Shown(100, kListSelectOne);
    desktop.Play(Press(3) + Below() + Wait(0.02) + V("move", 141) + Wait(0.5) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 1);
    desktop.Play(Press(3) + Below() + Wait(0.02) + V("move", 141) + Wait(0.5) + Move(4) + Below() +
                 Wait(0.04) + kRelease);
    EXPECT_EQ(list->GetScrollPos(), 3) << "until it has been on a row again";
}

TEST_F(GListPaneDragTest, ScrollingShowsOnTheBarAndIsDrawnAtOnce) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
    Rect box = {20, 230, 120, 246};
    bar->SetBox(&box);
    list->SetScrollBar(bar);
    list->SetNumItems(100);
    Show();
    desktop.Play(Press(3) + Below() + Wait(0.12));
    EXPECT_EQ(bar->GetPosition(), 3);
    Log const drawn = drawer.TakeRows();
    auto const selected = std::find(drawn.begin(), drawn.end(), "8*"),
               next = std::find(drawn.begin(), drawn.end(), "9");
    EXPECT_LT(selected - drawn.begin(), next - drawn.begin()) << "in the pass that selects it";
    EXPECT_EQ(drawn.back(), "9") << "what has come into view last";
}

TEST_F(GListPaneDragTest, AScriptThatEndsReleasesTheButton) {
    GListPane *const list = Shown(100, kListSelectSeveral);
    desktop.Play(Press(3) + Move(4));
    EXPECT_EQ(SelectedRows(*list), (Rows{3, 4}));
    EXPECT_EQ(listener.Take().back(), "done");
}

// A cell as a button

namespace {

class TrackingColumn : public GListPaneDragTest {
protected:
    // Clicks outside of the column that selects track their cell.
    GListPane *Tracking(int rows) {
        GListPane *const list = Shown(rows, kListSelectOne);
        listener.onCall = [this, list](std::string const &call) {
            if (call.find("click") == 0)
                results.push_back(list->TrackCol(2, 1));
        };
        return list;
    }
    std::vector<bool> results;
};

std::string const kPressCell = "wait 1\npress 100 60\n"; // row 2, column 1

} // namespace

TEST_F(TrackingColumn, APressThatEndsInTheCellCounts) {
    Tracking(5);
    desktop.Play(kPressCell + "move 149 68\n" + kRelease);
    desktop.Play(kPressCell + "move 150 68\nmove 110 60\n" + kRelease);
    EXPECT_EQ(results, (std::vector<bool>{true, true}));
}

TEST_F(TrackingColumn, APressThatEndsElsewhereDoesNot) {
    Tracking(5);
    for (char const *place : {"91 69", "151 60", "90 60", "100 52"})
        desktop.Play(kPressCell + "move " + place + "\n" + kRelease);
    EXPECT_EQ(results, (std::vector<bool>{false, false, false, false}));
}

TEST_F(TrackingColumn, ItsRowShowsAsSelectedAndEachMovementIsAStep) {
    Tracking(5);
    ListHooks hooks;
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(kPressCell + "move 101 60\nmove 102 60\n" + kRelease); }),
              (Log{"2*"}));
    EXPECT_EQ(hooks.steps, 2);
}

// The mark has gone with the drawing, so crossing the edge sets it again.
TEST_F(TrackingColumn, CrossingTheEdgeDrawsTheRowAnew) {
    Tracking(5);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(kPressCell + "move 40 60\nmove 100 60\n" + kRelease); }),
              (Log{"2*", "2*", "2*"}));
}

// A row that is selected has no mark, and looks as it does without the press.
TEST_F(TrackingColumn, ASelectedRowIsNotMarkedByTrackingItsCell) {
    GListPane *const list = Tracking(5);
    list->SetSelRange(2, 2);
    UpdateGlog(glog);
    EXPECT_EQ(RowsDrawnBy([&] { desktop.Play(kPressCell + "move 40 60\nmove 100 60\n" + kRelease); }),
              (Log{"2*", "2*", "2*"}));
    EXPECT_EQ(RowsDrawnBy([&] {
                  list->SetSelRange(-1, -1);
                  list->InvalRow(2);
              }),
              (Log{"2"}))
        << "nothing is left of it";
}

TEST_F(TrackingColumn, TheCellEndsWithItsRow) {
    GListPane *const list = Tracking(5);
    boost::shared_ptr<ColumnList> const columns = ThreeColumns();
    columns->SetBothEdges(1, 60, 600);
    list->SetColumnList(columns);
    desktop.Play(kPressCell + "move 228 60\n" + kRelease);
    desktop.Play(kPressCell + "move 229 60\n" + kRelease);
    EXPECT_EQ(results, (std::vector<bool>{true, false}));
}

TEST_F(TrackingColumn, ACellThatDoesNotShowIsNotTracked) {
    GListPane *const list = Shown(100, kListSelectOne);
    EXPECT_FALSE(list->TrackCol(50, 1));
    EXPECT_FALSE(list->TrackCol(-1, 1));
    EXPECT_FALSE(list->TrackCol(2, 3));
    EXPECT_FALSE(list->TrackCol(2, -1));
    EXPECT_FALSE(NewList(Record())->TrackCol(0, 0));
}

TEST_F(TrackingColumn, KeepsTheColorsOfThePort) {
    GListPane *const list = Shown(5, kListSelectOne);
    SaveColorRec const tinted = {{1, 2, 3}, {4, 5, 6}};
    list->Prepare();
    SetColors(&tinted);
    desktop.Script("release");
    list->TrackCol(2, 1);
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, tinted);
}
