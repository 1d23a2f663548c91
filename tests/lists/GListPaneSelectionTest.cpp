// What is selected, and who is told, without the mouse.
#include "host/TarnError.h"
#include "tests/lists/ListTest.h"
#include <limits>

namespace {

int const kMost = std::numeric_limits<int>::max(), kLeast = std::numeric_limits<int>::min();
int const kRowsOut[] = {-1, 5, kMost, kLeast}; // of five

class GListPaneSelectionTest : public ListTest {
protected:
    GListPane *Selected(GListSelectionMode mode, std::vector<int> const &rows) {
        GListPane *const list = Filled(5, mode);
        for (int row : rows)
            list->SelectItem(row);
        listener.Take();
        return list;
    }
    typedef std::vector<int> Rows;
};

GListSelectionMode const kUnknown = static_cast<GListSelectionMode>(77);

} // namespace

// Asking

TEST_F(GListPaneSelectionTest, OneRowIsTheFirstOfTheRange) {
    GListPane *const list = Filled(5);
    list->SetSelRange(2, 4);
    EXPECT_EQ(SelectedRows(*list), Rows{2});
    EXPECT_EQ(list->NumSelected(), 1);
    EXPECT_FALSE(list->SelModeDiscontig());
    int line = -7;
    EXPECT_TRUE(list->GetFirstSelectedItem(line));
    EXPECT_EQ(line, 2);
}

TEST_F(GListPaneSelectionTest, NoRowIsBelowZero) {
    GListPane *const list = Filled(5);
    for (int none : {-1, -2, kLeast}) {
        list->SetSelRange(none, none);
        int line = 99;
        EXPECT_FALSE(list->GetFirstSelectedItem(line));
        EXPECT_EQ(line, none) << "written also then";
        EXPECT_EQ(list->NumSelected(), 0);
        EXPECT_EQ(SelectedRows(*list), Rows());
    }
}

TEST_F(GListPaneSelectionTest, SeveralRowsHaveAFlagEach) {
    for (GListSelectionMode mode : {kListSelectSeveral, kListSelectToggle}) {
        GListPane *const list = Selected(mode, {3, 1});
        EXPECT_TRUE(list->SelModeDiscontig());
        EXPECT_EQ(SelectedRows(*list), (Rows{1, 3}));
        EXPECT_EQ(list->NumSelected(), 2);
        int line = -7;
        EXPECT_TRUE(list->GetFirstSelectedItem(line));
        EXPECT_EQ(line, 1);
        EXPECT_EQ(list->GetFirstSelectedItem(), -1) << "the range is not used";
    }
}

TEST_F(GListPaneSelectionTest, WithoutFlagsSetNothingIsWritten) {
    int line = 99;
    EXPECT_FALSE(Filled(5, kListSelectSeveral)->GetFirstSelectedItem(line));
    EXPECT_FALSE(Filled(5, kListSelectByCode)->GetFirstSelectedItem(line));
    EXPECT_EQ(line, 99);
}

TEST_F(GListPaneSelectionTest, OtherModesKeepARangeButSelectNothing) {
    for (GListSelectionMode mode : {kListSelectByCode, kUnknown}) {
        GListPane *const list = Filled(5, mode);
        list->SetSelRange(1, 3);
        int first = 0, last = 0;
        list->GetSelRange(first, last);
        EXPECT_EQ(first, 1);
        EXPECT_EQ(last, 3);
        EXPECT_EQ(list->NumSelected(), 0);
        EXPECT_EQ(SelectedRows(*list), Rows());
    }
}

TEST_F(GListPaneSelectionTest, RowsThatThereAreNotAreNotSelected) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral}) {
        GListPane *const list = Filled(5, mode);
        list->SetSelRange(7, 7);
        for (int row : kRowsOut)
            EXPECT_FALSE(list->CheckSel(row));
        EXPECT_FALSE(list->CheckSel(7));
    }
}

// Single rows

TEST_F(GListPaneSelectionTest, SelectingTellsOfTheChangeAndThenOfItsEnd) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SelectItem(2);
    EXPECT_EQ(listener.Take(), (Log{"select 2", "done"}));
    list->SelectItem(2);
    EXPECT_EQ(listener.Take(), (Log{"done"})) << "no change";
    list->DeselectItem(2);
    EXPECT_EQ(listener.Take(), (Log{"deselect 2", "done"}));
    list->DeselectItem(2);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
}

TEST_F(GListPaneSelectionTest, InModesWithoutFlagsOnlyTheEndIsTold) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectByCode, kUnknown}) {
        GListPane *const list = Filled(5, mode);
        list->SetSelRange(1, 1);
        list->SelectItem(2);
        list->DeselectItem(1);
        EXPECT_EQ(listener.Take(), (Log{"done", "done"}));
        EXPECT_EQ(list->GetFirstSelectedItem(), 1);
    }
}

TEST_F(GListPaneSelectionTest, RowsThatThereAreNotCannotBeSelected) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    for (int row : kRowsOut) {
        list->SelectItem(row);
        list->DeselectItem(row);
        list->DoSelect(row, 1, false);
        list->InvertItem(row);
    }
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(listener.Take(), Log(8, "done"));
}

TEST_F(GListPaneSelectionTest, ASelectedRowIsDrawnAnew) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectItem(2); }), (Log{"2*"}));
    EXPECT_EQ(RowsDrawnBy([&] { list->DeselectItem(2); }), (Log{"2"}));
    EXPECT_EQ(RowsDrawnBy([&] { list->DeselectItem(2); }), Log());
}

TEST_F(GListPaneSelectionTest, WhereAllColumnsSelectSelectingDrawsNothing) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SetSelColumn(GListPane::kAnyColumn);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectItem(2); }), Log());
    EXPECT_TRUE(list->CheckSel(2));
}

TEST_F(GListPaneSelectionTest, WhileNotActiveTheInactiveDisplayIsInvalidated) {
    class List : public GListPane {
    public:
        List(glogRec *owner, glistResRec record) { InitGListPane(owner, &record, 0); }
        void InvalInactiveSelectionDisplay() override { ++invalidated; }
        int invalidated = 0;
    };
    List *const list = new List(glog, Record(kListSelectSeveral));
    Equipped(list, 5);
    Show();
    desktop.Play("activate off");
    list->invalidated = 0;
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectItem(2); }), Log());
    EXPECT_EQ(list->invalidated, 1);
    list->SelectItem(2);
    EXPECT_EQ(list->invalidated, 1);
}

TEST_F(GListPaneSelectionTest, AFlagIsStoredAsItIsAndNothingDrawn) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] {
                  list->DoSelect(1, 1, true);
                  list->DoSelect(2, 3, false);
                  list->DoSelect(3, -1, true);
              }),
              Log());
    EXPECT_EQ(listener.Take(), (Log{"select 1 tracking", "select 2", "deselect 3 tracking"}));
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2}));
    EXPECT_EQ(list->NumSelected(), 3) << "every flag but 0 counts";
    int line = 0;
    list->DoSelect(0, -2, false);
    EXPECT_TRUE(list->GetFirstSelectedItem(line));
    EXPECT_EQ(line, 0);
}

TEST_F(GListPaneSelectionTest, WithoutFlagsThereIsNothingToStore) {
    GListPane *const list = Filled(5);
    list->DoSelect(1, 1, false);
    EXPECT_EQ(listener.Take(), Log());
    EXPECT_EQ(SelectedRows(*list), Rows());
}

TEST_F(GListPaneSelectionTest, WithoutAListenerNobodyIsTold) {
    GListPane *const list = Selected(kListSelectSeveral, {1});
    list->SetSelectionListener(nullptr);
    list->SelectItem(2);
    list->SelectAll();
    list->DeselectAll();
    list->SetNumItems(3);
    list->AddItem(1);
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(listener.Take(), Log());
}

// All rows

TEST_F(GListPaneSelectionTest, SelectingAllTellsOfTheOthersFromTheLastRow) {
    GListPane *const list = Selected(kListSelectSeveral, {1, 3});
    list->SelectAll();
    EXPECT_EQ(listener.Take(), (Log{"select 4", "select 2", "select 0", "done"}));
    EXPECT_EQ(list->NumSelected(), 5);
}

TEST_F(GListPaneSelectionTest, SelectingAllLeavesOtherFlagsAlone) {
    GListPane *const list = Filled(3, kListSelectSeveral);
    list->DoSelect(1, -1, false);
    listener.Take();
    list->SelectAll();
    EXPECT_EQ(listener.Take(), (Log{"select 2", "select 0", "done"}));
    EXPECT_FALSE(list->CheckSel(1));
}

TEST_F(GListPaneSelectionTest, WithoutAListenerAllAreSelectedAndDrawnJustTheSame) {
    GListPane *const list = Filled(100, kListSelectSeveral);
    list->SelectItem(1);
    list->SetSelectionListener(nullptr);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectAll(); }), (Log{"0*", "2*", "3*", "4*", "5*", "6*"}));
    EXPECT_EQ(list->NumSelected(), 100);
    EXPECT_TRUE(list->CheckSel(99));
    list->SetScrollPosition(50);
    list->DeselectAll();
    EXPECT_EQ(list->NumSelected(), 0);
    list->SetNumItems(0);
    list->SelectAll();
    EXPECT_EQ(list->NumSelected(), 0);
}

TEST_F(GListPaneSelectionTest, InModesWithoutFlagsSelectingAllIsOnlyItsEnd) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectByCode}) {
        GListPane *const list = Filled(5, mode);
        list->SelectAll();
        EXPECT_EQ(listener.Take(), (Log{"done"}));
        EXPECT_EQ(SelectedRows(*list), Rows());
    }
}

TEST_F(GListPaneSelectionTest, SelectingAllDrawsTheRowsThatChange) {
    GListPane *const list = Filled(100, kListSelectSeveral);
    list->SelectItem(1);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectAll(); }), (Log{"0*", "2*", "3*", "4*", "5*", "6*"}));
}

TEST_F(GListPaneSelectionTest, SelectingAllKeepsTheColorsOfThePort) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    Show();
    SaveColorRec const tinted = {{1, 2, 3}, {4, 5, 6}};
    list->Prepare();
    SetColors(&tinted);
    list->SelectAll();
    list->DeselectItem(2);
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, tinted);
}

// Told of every row, selected or not.
TEST_F(GListPaneSelectionTest, DeselectingAllTellsOfEveryRowFromTheLast) {
    GListPane *const list = Selected(kListSelectToggle, {1});
    list->DeselectAll();
    EXPECT_EQ(listener.Take(),
              (Log{"deselect 4", "deselect 3", "deselect 2", "deselect 1", "deselect 0", "done"}));
    EXPECT_EQ(list->NumSelected(), 0);
}

TEST_F(GListPaneSelectionTest, DeselectingAllClearsTheRangeInOtherModes) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectByCode, kUnknown}) {
        GListPane *const list = Filled(5, mode);
        list->SetSelRange(1, 3);
        list->DeselectAll();
        int first = 0, last = 0;
        list->GetSelRange(first, last);
        EXPECT_EQ(first, -1);
        EXPECT_EQ(last, -1);
        EXPECT_EQ(listener.Take(), (Log{"done"}));
    }
}

TEST_F(GListPaneSelectionTest, DeselectingAllDrawsWhatWasSelectedAndMarked) {
    GListPane *const list = Selected(kListSelectSeveral, {1, 4});
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->DeselectAll(); }), (Log{"1", "4"}));
    EXPECT_EQ(RowsDrawnBy([&] {
                  list->InvertItemRect(2, false);
                  list->DeselectAll();
                  list->InvalRow(2);
              }),
              (Log{"2"}));
}

TEST_F(GListPaneSelectionTest, DeselectingAllWhileNotActiveDrawsNothing) {
    GListPane *const list = Selected(kListSelectSeveral, {1, 4});
    Show();
    desktop.Play("activate off");
    EXPECT_EQ(RowsDrawnBy([&] { list->DeselectAll(); }), Log());
}

TEST_F(GListPaneSelectionTest, SelectingAllWhileNotActiveDrawsNothing) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    Show();
    desktop.Play("activate off");
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectAll(); }), Log());
    EXPECT_EQ(list->NumSelected(), 5);
    list->SetSelectionListener(nullptr);
    EXPECT_EQ(RowsDrawnBy([&] {
                  list->DeselectAll();
                  list->SelectAll();
              }),
              Log());
}

TEST_F(GListPaneSelectionTest, WhereAllColumnsSelectSelectingAllDrawsNothing) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SetSelColumn(GListPane::kAnyColumn);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SelectAll(); }), Log());
    EXPECT_EQ(list->NumSelected(), 5);
}

// Whoever hears of a row sees it changed, and those that come after it not yet.
TEST_F(GListPaneSelectionTest, AllRowsChangeOneByOne) {
    GListPane *const list = Filled(3, kListSelectSeveral);
    std::vector<Rows> seen;
    listener.onCall = [&](std::string const &) { seen.push_back(SelectedRows(*list)); };
    list->SelectAll();
    EXPECT_EQ(seen, (std::vector<Rows>{{2}, {1, 2}, {0, 1, 2}, {0, 1, 2}}));
    seen.clear();
    list->DeselectAll();
    EXPECT_EQ(seen, (std::vector<Rows>{{0, 1}, {0}, {}, {}}));
}

// The range

TEST_F(GListPaneSelectionTest, SettingTheRangeTellsNobodyAndDrawsBothRows) {
    GListPane *const list = Filled(5);
    list->SetSelRange(1, 1);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SetSelRange(3, 3); }), (Log{"1", "3*"}));
    EXPECT_EQ(listener.Take(), Log());
}

TEST_F(GListPaneSelectionTest, OneRowHasARangeOfThatRow) {
    GListPane *const list = Filled(5);
    list->SetSelRange(1, 4);
    int first = 0, last = 0;
    list->GetSelRange(first, last);
    EXPECT_EQ(first, 1);
    EXPECT_EQ(last, 1);
}

// Modes

TEST_F(GListPaneSelectionTest, AnotherModeDeselectsAllInTheFormerOne) {
    GListPane *const list = Selected(kListSelectSeveral, {1});
    list->SetSelMode(kListSelectOne);
    EXPECT_EQ(listener.Take(),
              (Log{"deselect 4", "deselect 3", "deselect 2", "deselect 1", "deselect 0", "done"}));
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectOne);
    list->SetSelRange(2, 2);
    list->SetSelMode(kListSelectToggle);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(list->GetFirstSelectedItem(), -1);
    list->SelectItem(4);
    EXPECT_TRUE(list->CheckSel(4)) << "there is a flag for every row";
}

TEST_F(GListPaneSelectionTest, TheSameModeDeselectsAllToo) {
    GListPane *const list = Selected(kListSelectSeveral, {1});
    list->SetSelMode(kListSelectSeveral);
    EXPECT_EQ(list->NumSelected(), 0);
    list->SelectItem(1);
    EXPECT_EQ(list->NumSelected(), 1);
}

TEST_F(GListPaneSelectionTest, FromOneModeOfSeveralRowsToTheOtherNothingStaysSelected) {
    GListPane *const list = Selected(kListSelectSeveral, {1});
    list->SetSelMode(kListSelectToggle);
    EXPECT_EQ(list->NumSelected(), 0);
    list->SelectItem(4);
    EXPECT_EQ(SelectedRows(*list), Rows{4});
}

TEST_F(GListPaneSelectionTest, InModeOneNothingIsSelectedAndNothingTold) {
    GListPane *const list = Filled(5);
    list->SetSelMode(kListSelectNothing);
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectNothing);
    listener.Take();
    list->SetSelRange(2, 3);
    list->DeselectAll();
    EXPECT_EQ(listener.Take(), Log());
    int first = 0, last = 0;
    list->GetSelRange(first, last);
    EXPECT_EQ(first, 2) << "not cleared either";
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(SelectedRows(*list), Rows());
}

// Marks

TEST_F(GListPaneSelectionTest, AMarkIsSetTakenAwayAndNotNeededByASelectedRow) {
    GListPane *const list = Selected(kListSelectSeveral, {1});
    Show();
    auto const drawn = [&](int row) {
        list->UpdateListLine(row);
        return drawer.TakeRows();
    };
    list->InvertItemRect(3, false);
    list->InvertItemRect(2, false);
    list->InvertItemRect(4, false);
    EXPECT_EQ(drawn(2), (Log{"2*"}));
    EXPECT_EQ(drawn(4), (Log{"4*"}));
    list->InvertItemRect(3, false);
    EXPECT_EQ(drawn(3), (Log{"3"}));
    EXPECT_EQ(drawn(2), (Log{"2*"}));
    list->InvertItemRect(1, false);
    list->DeselectItem(1);
    EXPECT_EQ(RowsDrawnBy([&] { list->InvalRow(1); }), (Log{"1"})) << "it was selected, so there is no mark";
}

TEST_F(GListPaneSelectionTest, AMarkInvalidatesItsRowIfAskedTo) {
    GListPane *const list = Filled(100);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertItemRect(2, false); }), Log());
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertItemRect(3, true); }), (Log{"3*"}));
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertItemRect(50, true); }), Log()) << "it does not show";
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertItem(1); }), (Log{"1*"}));
    list->SetSelColumn(GListPane::kAnyColumn);
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertItem(1); }), Log());
}

TEST_F(GListPaneSelectionTest, SelectedRowsAreInvalidatedTogether) {
    GListPane *const list = Filled(100, kListSelectSeveral);
    for (int row : {0, 2, 50})
        list->SelectItem(row);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertSelection(); }), (Log{"0*", "2*"}));
    GListPane *const ranged = Filled(5, kListSelectByCode);
    ranged->SetSelRange(1, 3);
    EXPECT_EQ(RowsDrawnBy([&] { ranged->InvertSelection(); }), Log());
}

TEST_F(GListPaneSelectionTest, RowsWithoutASelectingFlagAreNotInvalidatedTogether) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->DoSelect(1, -1, false);
    list->DoSelect(2, 3, false);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->InvertSelection(); }), (Log{"2*"}));
}

TEST_F(GListPaneSelectionTest, AMarkGoesWithTheSelectionAlsoWhileNotActive) {
    GListPane *const list = Filled(5);
    Show();
    desktop.Play("activate off");
    EXPECT_EQ(RowsDrawnBy([&] {
                  list->InvertItemRect(2, false);
                  list->DeselectAll();
                  list->InvalRow(2);
              }),
              (Log{"2"}));
}

TEST_F(GListPaneSelectionTest, TheSelectionSurvivesScrolling) {
    GListPane *const list = Filled(100, kListSelectSeveral);
    list->SelectItem(2);
    Show();
    list->SetScrollPosition(50);
    UpdateGlog(glog);
    list->SetScrollPosition(0);
    EXPECT_EQ(RowsDrawnBy([&] { list->InvalRow(2); }), (Log{"2*"}));
}
