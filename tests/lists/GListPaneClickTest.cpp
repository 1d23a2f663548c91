// Clicks: what they select, what they are reported as.
#include "host/EventRecordAdapter.h"
#include "tests/lists/ListTest.h"
#include <limits>

namespace {

int const kNowhere = std::numeric_limits<int>::min();
enum Answers { kHandled = -1, kNoRowHit = 0, kClick = 1, kDoubleClick = 2, kForOwner = 3 };

class GListPaneClickTest : public ListTest {
protected:
    typedef std::vector<int> Rows;

    // The list's answer to a click on a place, with modifiers behind it.
    int ClickOn(std::string const &place, std::string const &modifiers = "") {
        return ResultOfClick("click " + place + " " + modifiers);
    }
    // A list of five rows in the active window, of which these are selected.
    GListPane *Shown(GListSelectionMode mode, Rows const &rows = Rows()) {
        GListPane *const list = Filled(5, mode);
        for (int row : rows)
            list->SelectItem(row);
        Show();
        return list;
    }
    struct Place {
        int line, column;
        bool operator==(Place const &o) const { return line == o.line && column == o.column; }
        friend std::ostream &operator<<(std::ostream &out, Place const &p) {
            return out << "line " << p.line << " column " << p.column;
        }
    };
    static Place Clicked(GListPane &list) {
        Place place = {0, 0};
        list.GetClickParameters(place.line, place.column);
        return place;
    }
    static Log Cleared() {
        return {"deselect 4", "deselect 3", "deselect 2", "deselect 1", "deselect 0", "done"};
    }
    static Log Joined(Log a, Log const &b) {
        a.insert(a.end(), b.begin(), b.end());
        return a;
    }
};

std::string const kBelowTheRows = "50 110"; // of five rows

} // namespace

// One row

TEST_F(GListPaneClickTest, AClickSelectsTheOneRow) {
    GListPane *const list = Shown(kListSelectOne);
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(listener.Take(), (Log{"done", "done"})) << "of the deselecting, and of the click";
    EXPECT_EQ(Clicked(*list), (Place{kNowhere, kNowhere}));
}

TEST_F(GListPaneClickTest, AClickOnTheSelectedRowLeavesItSelected) {
    GListPane *const list = Shown(kListSelectOne);
    ClickOn(At(2));
    desktop.Play("wait 2");
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

TEST_F(GListPaneClickTest, ModifiersDoNotMatterToOneRow) {
    for (char const *modifier : {"shift", "command", "option"}) {
        GListPane *const list = Shown(kListSelectOne);
        list->SetSelRange(1, 1);
        EXPECT_EQ(ClickOn(At(3), modifier), kHandled);
        EXPECT_EQ(SelectedRows(*list), Rows{3}) << modifier;
        delete list;
    }
}

TEST_F(GListPaneClickTest, AClickDrawsTheRowsThatChange) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelRange(1, 1);
    EXPECT_EQ(RowsDrawnBy([&] { ClickOn(At(3)); }), (Log{"1", "3*"}));
}

// Several rows

TEST_F(GListPaneClickTest, AClickReplacesTheSelection) {
    GListPane *const list = Shown(kListSelectSeveral, {0, 1});
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(listener.Take(), Joined(Cleared(), {"select 2", "done"}));
}

TEST_F(GListPaneClickTest, AClickOnASelectedRowSelectsItAlone) {
    GListPane *const list = Shown(kListSelectSeveral, {1, 2});
    ClickOn(At(2));
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

TEST_F(GListPaneClickTest, WithCommandAClickTogglesItsRow) {
    GListPane *const list = Shown(kListSelectSeveral, {0, 1});
    EXPECT_EQ(ClickOn(At(2), "command"), kHandled);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
    EXPECT_EQ(listener.Take(), (Log{"select 2", "done"}));
    ClickOn(At(1), "command");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 2}));
    EXPECT_EQ(listener.Take(), (Log{"deselect 1", "done"}));
    EXPECT_EQ(list->NumSelected(), 2) << "flags are 0 or 1 again";
}

TEST_F(GListPaneClickTest, WithShiftAClickExtendsFromTheNextSelectedRowBehindIt) {
    GListPane *const list = Shown(kListSelectSeveral, {0, 3});
    EXPECT_EQ(ClickOn(At(1), "shift"), kHandled);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2, 3}));
    EXPECT_EQ(listener.Take(), (Log{"select 2 tracking", "select 1 tracking", "done"}));
}

TEST_F(GListPaneClickTest, WithShiftAndNothingBehindItExtendsFromTheRowBefore) {
    GListPane *const list = Shown(kListSelectSeveral, {0, 1});
    ClickOn(At(4), "shift");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2, 3, 4}));
    EXPECT_EQ(listener.Take(), (Log{"select 2 tracking", "select 3 tracking", "select 4 tracking", "done"}));
}

TEST_F(GListPaneClickTest, WithShiftAndNothingSelectedExtendsFromTheFirstRow) {
    GListPane *const list = Shown(kListSelectSeveral);
    ClickOn(At(2), "shift");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
    EXPECT_EQ(listener.Take(), (Log{"select 0 tracking", "select 1 tracking", "select 2 tracking", "done"}));
}

// Kept: the row that a selection extends from is taken as selected already.
TEST_F(GListPaneClickTest, WithShiftAndNothingSelectedAClickOnTheFirstRowSelectsNothing) {
    GListPane *const list = Shown(kListSelectSeveral);
    EXPECT_EQ(ClickOn(At(0), "shift"), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows());
    EXPECT_EQ(listener.Take(), (Log{"done"}));
}

TEST_F(GListPaneClickTest, WithShiftARowIsReachedOnlySomePixelsInsideAlsoByThePress) {
    GListPane *const list = Shown(kListSelectSeveral, {0});
    ClickOn("40 56", "shift"); // row 2 begins at 53
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1}));
    ClickOn("40 57", "shift");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
    list->DeselectAll();
    list->SelectItem(4);
    ClickOn("40 66", "shift"); // it ends at 69
    EXPECT_EQ(SelectedRows(*list), (Rows{3, 4}));
    ClickOn("40 65", "shift");
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 3, 4}));
}

TEST_F(GListPaneClickTest, WithShiftASelectedRowStaysAsItIs) {
    GListPane *const list = Shown(kListSelectSeveral, {2});
    ClickOn(At(2), "shift");
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(listener.Take(), (Log{"done"}));
}

TEST_F(GListPaneClickTest, WithShiftAndCommandAClickToggles) {
    GListPane *const list = Shown(kListSelectSeveral, {0});
    ClickOn(At(2), "shift command");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 2}));
}

TEST_F(GListPaneClickTest, WithOptionAClickReplacesTheSelection) {
    GListPane *const list = Shown(kListSelectSeveral, {0, 1});
    ClickOn(At(2), "option");
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

// Toggling

TEST_F(GListPaneClickTest, AClickTogglesAndClearsNothing) {
    GListPane *const list = Shown(kListSelectToggle, {0});
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 2}));
    EXPECT_EQ(listener.Take(), (Log{"select 2", "done"}));
    ClickOn(At(0));
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

TEST_F(GListPaneClickTest, WhereAClickTogglesOptionClearsFirst) {
    GListPane *const list = Shown(kListSelectToggle, {0, 2});
    ClickOn(At(2), "option");
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(listener.Take(), Joined(Cleared(), {"select 2", "done"}));
}

TEST_F(GListPaneClickTest, WhereAClickTogglesCommandSelectsAllFirst) {
    GListPane *const list = Shown(kListSelectToggle, {0});
    ClickOn(At(2), "command");
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 3, 4}));
    EXPECT_EQ(listener.Take(),
              (Log{"select 4", "select 3", "select 2", "select 1", "done", "deselect 2", "done"}));
}

TEST_F(GListPaneClickTest, WhereAClickTogglesOptionBeatsCommandAndShiftDoesNothing) {
    GListPane *const list = Shown(kListSelectToggle, {0});
    ClickOn(At(2), "option command");
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    ClickOn(At(4), "shift");
    EXPECT_EQ(SelectedRows(*list), (Rows{2, 4}));
}

// No selecting

TEST_F(GListPaneClickTest, AListWithoutSelectionByTheMouseTakesTheClickAndDoesNothing) {
    GListPane *const list = Shown(kListSelectByCode);
    list->SetSelRange(1, 2);
    EXPECT_EQ(ClickOn(At(3)), kHandled);
    EXPECT_EQ(ClickOn(kBelowTheRows), kHandled);
    EXPECT_EQ(list->GetFirstSelectedItem(), 1);
    EXPECT_EQ(listener.Take(), Log());
}

TEST_F(GListPaneClickTest, InModeOneAClickOnlyEnds) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelMode(kListSelectNothing);
    listener.Take();
    EXPECT_EQ(ClickOn(At(3)), kHandled);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
    EXPECT_EQ(SelectedRows(*list), Rows());
}

TEST_F(GListPaneClickTest, InModeOneAClickBelowTheRowsIsForTheOwnerAndTellsNobody) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelMode(kListSelectNothing);
    listener.Take();
    EXPECT_EQ(ClickOn(kBelowTheRows), kForOwner);
    EXPECT_EQ(listener.Take(), Log());
    EXPECT_EQ(Clicked(*list), (Place{-1, -1}));
}

TEST_F(GListPaneClickTest, InAnUnknownModeAClickOnlyEnds) {
    GListPane *const list = Shown(static_cast<GListSelectionMode>(77));
    list->SetSelRange(1, 2);
    EXPECT_EQ(ClickOn(At(3)), kHandled);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
    EXPECT_EQ(list->GetFirstSelectedItem(), 1) << "it is not cleared before either";
}

TEST_F(GListPaneClickTest, AClickInAnotherColumnIsReported) {
    GListPane *const list = Shown(kListSelectSeveral, {0});
    list->SetSelColumn(1);
    EXPECT_EQ(ClickOn(At(2, 2)), kClick);
    EXPECT_EQ(SelectedRows(*list), Rows{0});
    EXPECT_EQ(listener.Take(), (Log{"click column 2 line 2"}));
    EXPECT_EQ(Clicked(*list), (Place{2, 2}));
    EXPECT_EQ(ClickOn(At(2, 1)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(Clicked(*list), (Place{kNowhere, kNowhere})) << "each click begins anew";
}

TEST_F(GListPaneClickTest, AClickWithOneOfItsKeysIsReported) {
    glistResRec record = Record(kListSelectSeveral);
    record.selKeyMask = 0x0900; // command, option
    GListPane *const list = Equipped(NewList(record), 5);
    Show();
    EXPECT_EQ(ClickOn(At(1), "command"), kClick);
    EXPECT_EQ(ClickOn(At(2), "option"), kClick);
    EXPECT_EQ(listener.Take(), (Log{"click column 0 line 1", "click column 0 line 2"}));
    EXPECT_EQ(ClickOn(At(3), "shift"), kHandled);
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(ClickOn(At(1), "command"), kHandled) << "where all columns select the keys do not count";
}

TEST_F(GListPaneClickTest, ADoubleClickIsReported) {
    GListPane *const list = Shown(kListSelectOne);
    EXPECT_EQ(ResultOfClick("doubleclick " + At(2)), kDoubleClick);
    EXPECT_EQ(listener.Take(), (Log{"done", "done", "double click column 0 line 2"}));
    EXPECT_EQ(SelectedRows(*list), Rows{2}) << "by its first click";
    EXPECT_EQ(Clicked(*list), (Place{2, 0}));
}

TEST_F(GListPaneClickTest, WhereAllColumnsSelectADoubleClickSelects) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(ResultOfClick("doubleclick " + At(2)), kHandled);
    EXPECT_EQ(listener.Take(), (Log{"done", "done", "done", "done"}));
}

TEST_F(GListPaneClickTest, AsksOnceForEachClickWhetherItIsDouble) {
    Shown(kListSelectOne);
    ListHooks hooks;
    ClickOn(At(2));
    ClickOn(At(1, 1));
    EXPECT_EQ(hooks.asked, 2);
}

TEST_F(GListPaneClickTest, ADoubleClickIsOneOnTheSameCellOnly) {
    GListPane *const list = Shown(kListSelectOne);
    ListHooks hooks;
    ClickOn(At(4, 1));
    hooks.isDouble = true;
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(ClickOn(At(2)), kDoubleClick);
    EXPECT_EQ(ClickOn(At(3)), kHandled) << "another row";
    EXPECT_EQ(ClickOn(At(3, 1)), kClick) << "another column";
    EXPECT_EQ(ClickOn(At(3, 1)), kDoubleClick);
    EXPECT_EQ(ClickOn(At(3, 1)), kDoubleClick) << "also a third time, as long as the application says so";
    hooks.isDouble = false;
    EXPECT_EQ(ClickOn(At(3, 1)), kClick);
    EXPECT_EQ(SelectedRows(*list), Rows{3});
}

// The place of the click before is that of any list.
TEST_F(GListPaneClickTest, TheSameCellOfAnotherListMakesADoubleClick) {
    Shown(kListSelectOne);
    glistResRec record = Record();
    record.bounds = {130, 30, 180, 230};
    Equipped(NewList(record), 5);
    ListHooks hooks;
    ClickOn(At(2));
    hooks.isDouble = true;
    EXPECT_EQ(ClickOn("40 165"), kDoubleClick) << "row 2 of the other one";
}

TEST_F(GListPaneClickTest, AClickThatHitsNothingIsNotTheOneBefore) {
    Shown(kListSelectOne);
    ListHooks hooks;
    ClickOn(At(2, 1));
    hooks.isDouble = true;
    ClickOn("225 60");
    EXPECT_EQ(hooks.asked, 1);
    EXPECT_EQ(ClickOn(At(2, 1)), kDoubleClick);
}

TEST_F(GListPaneClickTest, AFilterKeepsAClickFromSelecting) {
    class List : public GListPane {
    public:
        List(glogRec *owner, glistResRec record) { InitGListPane(owner, &record, 0); }
        bool ClickSelectFilter(EventRecordAdapter *event, int line, int column) const override {
            asked =
                std::to_string(line) + " " + std::to_string(column) + " at " + std::to_string(event->where.h);
            return line == 1;
        }
        mutable std::string asked;
    };
    List *const list = new List(glog, Record());
    Equipped(list, 5);
    Show();
    EXPECT_EQ(ClickOn("95 30"), kClick) << "another column, for which it is asked too";
    EXPECT_EQ(list->asked, "0 1 at 95");
    EXPECT_EQ(ClickOn(At(1)), kClick);
    EXPECT_EQ(listener.Take(), (Log{"click column 1 line 0", "click column 0 line 1"}));
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(ClickOn(At(1)), kClick);
    EXPECT_EQ(ClickOn(At(2)), kHandled);
}

TEST_F(GListPaneClickTest, WithoutAListenerClicksAreReportedByTheirAnswerAlone) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelectionListener(nullptr);
    EXPECT_EQ(ClickOn(At(2, 1)), kClick);
    EXPECT_EQ(Clicked(*list), (Place{2, 1}));
    EXPECT_EQ(ClickOn(At(3)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{3});
}

// Outside of the cells

TEST_F(GListPaneClickTest, AClickBelowTheRowsDeselectsAll) {
    GListPane *const list = Shown(kListSelectSeveral, {1});
    EXPECT_EQ(ClickOn(kBelowTheRows), kForOwner);
    EXPECT_EQ(SelectedRows(*list), Rows());
    EXPECT_EQ(listener.Take(), Cleared());
    EXPECT_EQ(Clicked(*list), (Place{-1, -1}));
}

TEST_F(GListPaneClickTest, AClickBelowTheRowsCountsBesideTheColumnsToo) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelRange(1, 1);
    EXPECT_EQ(ClickOn("225 110"), kForOwner);
    EXPECT_EQ(SelectedRows(*list), Rows());
}

TEST_F(GListPaneClickTest, BelowTheRowsClicksWithShiftOrCommandChangeNothing) {
    GListPane *const list = Shown(kListSelectSeveral, {1});
    EXPECT_EQ(ClickOn(kBelowTheRows, "shift"), kNoRowHit);
    EXPECT_EQ(ClickOn(kBelowTheRows, "command"), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    EXPECT_EQ(listener.Take(), Log());
    EXPECT_EQ(Clicked(*list), (Place{kNowhere, kNowhere}));
    EXPECT_EQ(ClickOn(kBelowTheRows, "option"), kForOwner);
}

TEST_F(GListPaneClickTest, WhereAClickTogglesOneBelowTheRowsChangesNothing) {
    GListPane *const list = Shown(kListSelectToggle, {1});
    EXPECT_EQ(ClickOn(kBelowTheRows), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
}

TEST_F(GListPaneClickTest, TheClickThatActivatesTheWindowDoesNotClearTheSelection) {
    GListPane *const list = Shown(kListSelectSeveral, {1});
    desktop.Play("activate off\nwait 1");
    EXPECT_EQ(ResultOfClick("activate on\nclick " + kBelowTheRows), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    desktop.Play("wait 1");
    EXPECT_EQ(ClickOn(kBelowTheRows), kForOwner);
    EXPECT_EQ(SelectedRows(*list), Rows());
}

TEST_F(GListPaneClickTest, WhatHappensBelowTheRowsCanBeChanged) {
    class List : public GListPane {
    public:
        List(glogRec *owner, glistResRec record) { InitGListPane(owner, &record, 0); }
        void ClickBelowLastItem() override { SetClickParameters(5, 6); }
    };
    List *const list = new List(glog, Record());
    Equipped(list, 5);
    list->SetSelRange(1, 1);
    Show();
    EXPECT_EQ(ClickOn(kBelowTheRows), kForOwner);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    EXPECT_EQ(Clicked(*list), (Place{5, 6}));
}

TEST_F(GListPaneClickTest, AClickAboveTheRowsOrBesideTheColumnsHitsNothing) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelRange(1, 1);
    EXPECT_EQ(ClickOn("50 20"), kNoRowHit) << "the frame";
    EXPECT_EQ(ClickOn("225 60"), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    EXPECT_EQ(listener.Take(), Log());
}

TEST_F(GListPaneClickTest, WhereAllColumnsSelectAClickBesideThemDoesToo) {
    GListPane *const list = Shown(kListSelectOne);
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(ClickOn("225 60"), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(ClickOn("50 20"), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(ClickOn("225 110"), kForOwner) << "but below the rows there is none";
    EXPECT_EQ(SelectedRows(*list), Rows());
}

TEST_F(GListPaneClickTest, WithoutColumnsNoCellIsHit) {
    GListPane *const list = NewList(Record());
    list->SetNumItems(5);
    Show();
    EXPECT_EQ(ClickOn(At(2)), kNoRowHit);
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(ClickOn(At(2)), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
}

// What the owner hears

TEST_F(GListPaneClickTest, TheEndOfASelectingClickIsReportedIfTheRecordSaysSo) {
    glistResRec record = Record();
    record.selReturn = true;
    GListPane *const list = Equipped(NewList(record), 5);
    Show();
    EXPECT_EQ(ClickOn(At(2)), kForOwner);
    EXPECT_EQ(Clicked(*list), (Place{2, 0}));
}

TEST_F(GListPaneClickTest, WhereAllColumnsSelectTheReportedColumnMayBeNone) {
    glistResRec record = Record();
    record.selReturn = true;
    GListPane *const list = Equipped(NewList(record), 5);
    list->SetSelColumn(GListPane::kAnyColumn);
    Show();
    EXPECT_EQ(ClickOn("225 60"), kForOwner);
    EXPECT_EQ(Clicked(*list), (Place{2, -1}));
}

TEST_F(GListPaneClickTest, ParametersCanBeSet) {
    GListPane *const list = Filled(5);
    list->SetClickParameters(7, 8);
    EXPECT_EQ(Clicked(*list), (Place{7, 8}));
}

// Control

namespace {

class SecondaryList : public GListPane {
public:
    SecondaryList(glogRec *owner, glistResRec record, int answer_)
        : answer(answer_) {
        InitGListPane(owner, &record, 0);
    }
    int HandleSecondaryButtonClick(EventRecordAdapter *) override {
        ++asked;
        return answer;
    }
    int asked = 0, answer;
};

} // namespace

TEST_F(GListPaneClickTest, WithControlAClickIsFirstThatOfTheSecondaryButton) {
    SecondaryList *const list = new SecondaryList(glog, Record(), 7);
    Equipped(list, 5);
    Show();
    EXPECT_EQ(ClickOn(At(2), "control"), 7);
    EXPECT_EQ(SelectedRows(*list), Rows());
    list->answer = 0;
    EXPECT_EQ(ClickOn(At(2), "control"), kHandled);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(list->asked, 2);
    ClickOn(At(3));
    EXPECT_EQ(list->asked, 2);
}

TEST_F(GListPaneClickTest, AListThatTheSecondaryButtonTakesOutOfItsWindowIsNotClearedByIt) {
    class Leaving : public GListPane {
    public:
        Leaving(glogRec *owner, glistResRec record) { InitGListPane(owner, &record, 0); }
        int HandleSecondaryButtonClick(EventRecordAdapter *) override {
            SetGlog(nullptr);
            return 0;
        }
    };
    Leaving *const list = new Leaving(glog, Record());
    Equipped(list, 5);
    list->SetSelRange(1, 1);
    Show();
    EventRecordAdapter event;
    event.where = {110, 50};
    event.modifiers = 0x1000;
    EXPECT_EQ((list->*&Opened<GListPane>::HandleClick)(&event), kNoRowHit);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    delete list;
}

TEST_F(GListPaneClickTest, AlsoAListWithoutSelectionByTheMouseHearsOfTheSecondaryButton) {
    SecondaryList *const list = new SecondaryList(glog, Record(kListSelectByCode), 7);
    Equipped(list, 5);
    Show();
    EXPECT_EQ(ClickOn(At(2), "control"), 7);
    list->answer = 0;
    EXPECT_EQ(ClickOn(At(2), "control"), kHandled);
}
