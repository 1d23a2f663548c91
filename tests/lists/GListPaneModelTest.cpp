// Rows and columns, and where they lie.
#include "host/TarnError.h"
#include "tests/frame/Allocations.h"
#include "tests/lists/ListTest.h"
#include <limits>

namespace {

int const kMost = std::numeric_limits<int>::max(), kLeast = std::numeric_limits<int>::min();
Rect const kNoBox = {-1, -1, -1, -1};

class GListPaneModelTest : public ListTest {
protected:
    struct Hit {
        bool isCell;
        int line, column;
        bool operator==(Hit const &o) const {
            return isCell == o.isCell && line == o.line && column == o.column;
        }
        friend std::ostream &operator<<(std::ostream &out, Hit const &hit) {
            return out << (hit.isCell ? "cell " : "no cell ") << hit.line << " " << hit.column;
        }
    };
    // Whether the action fails as it should when so many uses of memory succeed and the next one does not.
    static bool FailsWithoutMemory(long successes, std::function<void()> const &action) {
        Allocations::FailAfter const fail(successes);
        try {
            action();
        } catch (TarnError const &) {
            return fail.HasFailed();
        }
        return false;
    }
    static Hit HitAt(GListPane &list, int h, int v) {
        Hit hit = {false, -100, -100};
        hit.isCell = list.CheckHit({static_cast<short>(v), static_cast<short>(h)}, &hit.line, &hit.column);
        return hit;
    }
};

} // namespace

// What shows

TEST_F(GListPaneModelTest, CountsRowsThatShowInPartAndAsAWhole) {
    GListPane *const list = NewList(Record()); // 98 pixels inside the frame
    EXPECT_EQ(list->GetNumDisplayed(), 7);
    EXPECT_EQ(list->NumFullyDisplayedLines(), 6);
}

TEST_F(GListPaneModelTest, ARowOfWhichAPixelShowsCounts) {
    struct {
        short height;
        int displayed, whole;
    } const cases[] = {{1, 0, 0},  {2, 0, 0},  {3, 1, 0},  {17, 1, 0},
                       {18, 1, 1}, {19, 2, 1}, {98, 6, 6}, {99, 7, 6}};
    for (auto const &c : cases) {
        glistResRec record = Record();
        record.bounds.bottom = static_cast<short>(kTop + c.height);
        GListPane *const list = NewList(record);
        EXPECT_EQ(list->GetNumDisplayed(), c.displayed) << c.height;
        EXPECT_EQ(list->NumFullyDisplayedLines(), c.whole) << c.height;
    }
}

TEST_F(GListPaneModelTest, ASmallListHasNoFrame) {
    glistResRec record = Record();
    record.style = glistResRec::kSmallStyle;
    record.lineHeight = 20;
    GListPane *const list = NewList(record);
    EXPECT_EQ(list->GetNumDisplayed(), 5);
    EXPECT_EQ(list->NumFullyDisplayedLines(), 5);
}

TEST_F(GListPaneModelTest, TheOffsetOfTheFirstRowTakesRoom) {
    glistResRec record = Record();
    record.firstLineOffset = 40;
    GListPane *const list = NewList(record); // 58 pixels
    EXPECT_EQ(list->GetNumDisplayed(), 4);
    EXPECT_EQ(list->NumFullyDisplayedLines(), 3);
}

TEST_F(GListPaneModelTest, WithoutALineHeightNothingShows) {
    for (short height : {short(0), short(-3)}) {
        glistResRec record = Record();
        record.lineHeight = height;
        GListPane *const list = Equipped(NewList(record), 10);
        EXPECT_EQ(list->GetNumDisplayed(), 0);
        EXPECT_EQ(list->NumFullyDisplayedLines(), 0);
        EXPECT_EQ(HitAt(*list, 40, 50), (Hit{false, -2, 0}));
        EXPECT_EQ(list->GetMaxScrollValue(nullptr), 10);
        EXPECT_EQ(list->GetThumbRatio(nullptr), 0.0);
        list->SetScrollPosition(3);
        list->PageTillVisible(9);
        Show();
        EXPECT_EQ(ResultOfClick("click 50 50"), 3) << "below the last row";
        EXPECT_EQ(drawer.TakeRows(), Log());
    }
}

TEST_F(GListPaneModelTest, AnotherLineHeightCountsAnewAndDrawsAll) {
    GListPane *const list = Filled(20);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->SetLineHeight(33); }), (Log{"0", "1", "2"}));
    EXPECT_EQ(list->GetLineHeight(), 33);
    EXPECT_EQ(list->GetNumDisplayed(), 3);
    EXPECT_EQ(list->NumFullyDisplayedLines(), 2);
    list->SetLineHeight(kMost);
    EXPECT_EQ(list->GetLineHeight(), 32767);
    EXPECT_EQ(list->GetNumDisplayed(), 1);
}

TEST_F(GListPaneModelTest, TheFirstAndLastRowAreThoseThatShow) {
    GListPane *const list = Filled(100);
    int first = 0, last = 0;
    list->GetFirstAndLast(&first, &last);
    EXPECT_EQ(first, 0);
    EXPECT_EQ(last, 6);
    list->SetScrollPosition(94);
    list->GetFirstAndLast(&first, &last);
    EXPECT_EQ(first, 94);
    EXPECT_EQ(last, 99);
    list->SetNumItems(0);
    list->GetFirstAndLast(&first, &last);
    EXPECT_EQ(first, 0);
    EXPECT_EQ(last, -1);
}

// Boxes

TEST_F(GListPaneModelTest, RowsLieBelowEachOtherInsideTheFrame) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(RowBox(*list, 0), (Rect{21, 31, 37, 229}));
    EXPECT_EQ(RowBox(*list, 6), (Rect{117, 31, 133, 229})) << "the part that does not show counts in";
    list->SetScrollPosition(10);
    EXPECT_EQ(RowBox(*list, 12), (Rect{53, 31, 69, 229}));
}

TEST_F(GListPaneModelTest, RowsOfASmallListTakeTheWholeBox) {
    glistResRec record = Record();
    record.style = glistResRec::kSmallStyle;
    record.firstLineOffset = 5;
    GListPane *const list = Equipped(NewList(record), 100);
    EXPECT_EQ(RowBox(*list, 1), (Rect{41, 30, 57, 230}));
}

// Kept: coordinates are 16 bits wide.
TEST_F(GListPaneModelTest, RowsBeyondTheCoordinatesWrapAround) {
    glistResRec record = Record();
    record.bounds = {32000, 30, 32767, 230};
    record.style = glistResRec::kSmallStyle;
    record.lineHeight = 500;
    GListPane *const list = Equipped(NewList(record), 10);
    EXPECT_EQ(RowBox(*list, 0), (Rect{32000, 30, 32500, 230}));
    EXPECT_EQ(RowBox(*list, 1), (Rect{32500, 30, 33000 - 65536, 230}));
}

TEST_F(GListPaneModelTest, RowsOutOfViewHaveNoBox) {
    GListPane *const list = Filled(100);
    list->SetScrollPosition(10);
    for (int row : {9, 17, -1, kMost, kLeast}) {
        Rect box = {1, 2, 3, 4};
        EXPECT_FALSE(list->GetRowBox(row, box)) << row;
        EXPECT_EQ(box, kNoBox) << row;
        EXPECT_FALSE(list->GetCellBox(row, 0, box)) << row;
        EXPECT_EQ(box, kNoBox) << row;
    }
}

// Places go on to the bottom: what is not there yet has one too.
TEST_F(GListPaneModelTest, ARowBehindTheLastHasABoxWhileItWouldShow) {
    GListPane *const list = Filled(2);
    EXPECT_EQ(RowBox(*list, 6).top, 117);
}

TEST_F(GListPaneModelTest, ACellHasTheEdgesOfItsColumnAsTheyStand) {
    GListPane *const list = Filled(100);
    Rect box;
    ASSERT_TRUE(list->GetCellBox(1, 2, box));
    EXPECT_EQ(box, (Rect{37, 120, 53, 190}));
}

TEST_F(GListPaneModelTest, ACellOfAColumnThatThereIsNotHasNoBox) {
    GListPane *const list = Filled(100);
    Rect box;
    EXPECT_FALSE(list->GetCellBox(1, 3, box));
    EXPECT_EQ(box, kNoBox);
    EXPECT_FALSE(list->GetCellBox(1, -1, box));
    EXPECT_FALSE(NewList(Record())->GetCellBox(0, 0, box)) << "no columns at all";
}

TEST_F(GListPaneModelTest, TheRecordFormWritesTheBoxOfItsRow) {
    GListPane *const list = Filled(100);
    GLGetBoxRec record = {2, kNoBox};
    EXPECT_TRUE(list->GLGetBox(&record));
    EXPECT_EQ(record.box, RowBox(*list, 2));
    record.line = 50;
    EXPECT_FALSE(list->GLGetBox(&record));
    EXPECT_EQ(record.box, kNoBox);
}

// Hits

TEST_F(GListPaneModelTest, FindsTheCellUnderAPoint) {
    GListPane *const list = Filled(100);
    EXPECT_EQ(HitAt(*list, 30, 21), (Hit{true, 0, 0}));
    EXPECT_EQ(HitAt(*list, 89, 36), (Hit{true, 0, 0}));
    EXPECT_EQ(HitAt(*list, 90, 37), (Hit{true, 1, 1}));
    EXPECT_EQ(HitAt(*list, 219, 119), (Hit{true, 6, 2}));
    list->SetScrollPosition(10);
    EXPECT_EQ(HitAt(*list, 40, 40), (Hit{true, 11, 0}));
}

TEST_F(GListPaneModelTest, TheFrameAndTheOffsetLieAboveTheRows) {
    glistResRec record = Record();
    record.firstLineOffset = 5;
    GListPane *const list = Equipped(NewList(record), 100);
    EXPECT_EQ(HitAt(*list, 40, 25), (Hit{false, -1, 0}));
    EXPECT_EQ(HitAt(*list, 40, 26), (Hit{true, 0, 0}));
    EXPECT_EQ(HitAt(*list, 40, -300), (Hit{false, -1, 0}));
}

TEST_F(GListPaneModelTest, BelowTheLastRowOrTheListIsMinusTwo) {
    GListPane *const list = Filled(3);
    EXPECT_EQ(HitAt(*list, 40, 68), (Hit{true, 2, 0}));
    EXPECT_EQ(HitAt(*list, 40, 69), (Hit{false, -2, 0}));
    list->SetNumItems(100);
    EXPECT_EQ(HitAt(*list, 40, 120), (Hit{true, 6, 0})) << "the bottom edge itself is not beyond";
    EXPECT_EQ(HitAt(*list, 40, 121), (Hit{false, -2, 0}));
}

TEST_F(GListPaneModelTest, BesideTheColumnsThereIsARowButNoColumn) {
    GListPane *const list = Filled(3);
    EXPECT_EQ(HitAt(*list, 220, 40), (Hit{false, 1, -1}));
    EXPECT_EQ(HitAt(*list, 29, 40), (Hit{false, 1, -1}));
    EXPECT_EQ(HitAt(*list, 230, 40), (Hit{false, 1, -1}));
}

TEST_F(GListPaneModelTest, NoColumnGoesBeyondTheListsRightSide) {
    GListPane *const list = Filled(3);
    boost::shared_ptr<ColumnList> const wide = ThreeColumns();
    wide->SetBothEdges(2, 120, 500);
    list->SetColumnList(wide);
    EXPECT_EQ(HitAt(*list, 229, 40), (Hit{true, 1, 2}));
    EXPECT_EQ(HitAt(*list, 230, 40), (Hit{false, 1, -1}));
}

TEST_F(GListPaneModelTest, TheFirstOfColumnsThatOverlapIsHit) {
    GListPane *const list = Filled(3);
    boost::shared_ptr<ColumnList> const columns = ThreeColumns();
    columns->SetBothEdges(1, 30, 120);
    list->SetColumnList(columns);
    EXPECT_EQ(HitAt(*list, 75, 40), (Hit{true, 1, 0}));
}

TEST_F(GListPaneModelTest, WithoutColumnsARowIsHitButNoCell) {
    GListPane *const list = NewList(Record());
    list->SetNumItems(3);
    EXPECT_EQ(HitAt(*list, 40, 40), (Hit{false, 1, -1}));
    list->SetColumnList(boost::make_shared<ColumnList>(static_cast<short>(0)));
    EXPECT_EQ(HitAt(*list, 40, 40), (Hit{false, 1, -1}));
}

TEST_F(GListPaneModelTest, AHeightAloneFindsTheRow) {
    GListPane *const list = Filled(3);
    EXPECT_EQ(list->CheckHitV(20), -1);
    EXPECT_EQ(list->CheckHitV(53), 2);
    EXPECT_EQ(list->CheckHitV(69), -2);
    EXPECT_EQ(list->CheckHitV(kMost), -2);
    EXPECT_EQ(list->CheckHitV(kLeast), -1);
}

// Number of rows

TEST_F(GListPaneModelTest, ANewCountInModesWithFlagsDeselectsEveryRowFromTheLast) {
    GListPane *const list = Filled(2, kListSelectSeveral);
    list->SelectItem(1);
    listener.Take();
    list->SetNumItems(3);
    EXPECT_EQ(list->GetNumItems(), 3);
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(listener.Take(), (Log{"deselect 2", "deselect 1", "deselect 0"}));
}

TEST_F(GListPaneModelTest, ANewCountInOtherModesKeepsTheSelectionEvenBeyondTheEnd) {
    GListPane *const list = Filled(10);
    list->SetSelRange(8, 8);
    list->SetNumItems(3);
    EXPECT_EQ(list->GetFirstSelectedItem(), 8);
    EXPECT_FALSE(list->CheckSel(8));
    EXPECT_EQ(listener.Take(), Log());
    list->SetNumItems(9);
    EXPECT_TRUE(list->CheckSel(8));
}

TEST_F(GListPaneModelTest, ACountBelowZeroIsNone) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral}) {
        GListPane *const list = Filled(5, mode);
        list->SetNumItems(kLeast);
        EXPECT_EQ(list->GetNumItems(), 0);
    }
}

TEST_F(GListPaneModelTest, FewerRowsBringThePositionBackIntoRange) {
    GListPane *const list = Filled(100);
    list->SetScrollPosition(50);
    list->SetNumItems(20);
    EXPECT_EQ(list->GetScrollPos(), 14);
}

TEST_F(GListPaneModelTest, ModesWithoutFlagsTakeAsManyRowsAsAnIntCounts) {
    GListPane *const list = Filled(0);
    list->SetNumItems(kMost);
    Show();
    EXPECT_EQ(list->GetMaxScrollValue(nullptr), kMost - 6);
    list->SetScrollPosition(kMost);
    EXPECT_EQ(list->GetScrollPos(), kMost - 6);
    EXPECT_EQ(RowsDrawnBy([&] { list->Inval(); }).front(), std::to_string(kMost - 6));
    EXPECT_EQ(HitAt(*list, 40, 40), (Hit{true, kMost - 5, 0}));
    EXPECT_EQ(HitAt(*list, 40, 120), (Hit{false, -2, 0}));
    list->SetSelRange(kMost - 1, kMost - 1);
    EXPECT_TRUE(list->CheckSel(kMost - 1));
    list->AddItem(kMost);
    EXPECT_EQ(list->GetNumItems(), kMost) << "there is no number for another";
    list->DelItem(kMost - 1);
    EXPECT_EQ(list->GetNumItems(), kMost - 1);
    int first = 0, last = 0;
    list->GetFirstAndLast(&first, &last);
    EXPECT_EQ(last, kMost - 2);
    list->InvalCol(1);
    list->PageTillVisible(0, kMost);
    list->PageTillVisible(kMost);
    EXPECT_EQ(list->GetScrollPos(), kMost - 7);
    list->PageTillVisible(kLeast);
    EXPECT_EQ(list->GetScrollPos(), 0);
}

TEST_F(GListPaneModelTest, ARowThatComesInMovesTheFlagsBehindIt) {
    GListPane *const list = Filled(3, kListSelectSeveral);
    list->SelectItem(0);
    list->SelectItem(1);
    listener.Take();
    list->AddItem(1);
    EXPECT_EQ(list->GetNumItems(), 4);
    EXPECT_EQ(SelectedRows(*list), (std::vector<int>{0, 2}));
    EXPECT_EQ(listener.Take(), (Log{"deselect 1"}));
}

TEST_F(GListPaneModelTest, ARowThatComesInMovesTheRangeBehindIt) {
    GListPane *const list = Filled(10, kListSelectByCode);
    struct {
        int at, first, last;
    } const cases[] = {{2, 5, 8}, {4, 5, 8}, {5, 4, 8}, {7, 4, 8}, {8, 4, 7}};
    for (auto const &c : cases) {
        list->SetSelRange(4, 7);
        list->AddItem(c.at);
        int first = 0, last = 0;
        list->GetSelRange(first, last);
        EXPECT_EQ(first, c.first) << c.at;
        EXPECT_EQ(last, c.last) << c.at;
    }
    EXPECT_EQ(listener.Take(), Log());
}

TEST_F(GListPaneModelTest, ARowBeyondTheEndsComesInAtTheEnd) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral}) {
        GListPane *const list = Filled(2, mode);
        list->AddItem(kLeast);
        list->AddItem(kMost);
        EXPECT_EQ(list->GetNumItems(), 4);
    }
}

TEST_F(GListPaneModelTest, ARangeAtTheEndOfAnIntStaysThere) {
    GListPane *const list = Filled(2);
    list->SetSelRange(kMost, kMost);
    list->AddItem(0);
    EXPECT_EQ(list->GetFirstSelectedItem(), kMost);
}

TEST_F(GListPaneModelTest, ARowThatGoesMovesTheFlagsBehindItAndTellsNobody) {
    GListPane *const list = Filled(4, kListSelectSeveral);
    list->SelectItem(1);
    list->SelectItem(3);
    listener.Take();
    list->DelItem(1);
    EXPECT_EQ(list->GetNumItems(), 3);
    EXPECT_EQ(SelectedRows(*list), (std::vector<int>{2}));
    EXPECT_EQ(listener.Take(), Log());
}

// Kept: rows behind the one that goes keep their number in the selection, though AddItem moves it.
TEST_F(GListPaneModelTest, ARowThatGoesLeavesTheSelectedNumberAlone) {
    GListPane *const list = Filled(5);
    list->SetSelRange(3, 3);
    list->DelItem(1);
    EXPECT_EQ(list->GetFirstSelectedItem(), 3);
    list->DelItem(3);
    int first = 0, last = 0;
    list->GetSelRange(first, last);
    EXPECT_EQ(first, -1);
    EXPECT_EQ(last, -1);
}

TEST_F(GListPaneModelTest, ARangeIsCutAtTheLastRow) {
    GListPane *const list = Filled(6, kListSelectByCode);
    list->SetSelRange(2, 5);
    list->DelItem(0);
    int first = 0, last = 0;
    list->GetSelRange(first, last);
    EXPECT_EQ(first, 2);
    EXPECT_EQ(last, 4);
    list->DelItem(2);
    list->GetSelRange(first, last);
    EXPECT_EQ(last, 3) << "the first row of a range is not looked at";
    EXPECT_EQ(first, 2);
}

TEST_F(GListPaneModelTest, OneRowIgnoresTheEndOfItsRange) {
    GListPane *const list = Filled(6);
    Show();
    desktop.Play("click " + At(2));
    int first = 0, last = 0;
    list->GetSelRange(first, last);
    ASSERT_EQ(first, 2);
    ASSERT_EQ(last, -1) << "a click leaves the end where it was";
    list->DelItem(2);
    list->GetSelRange(first, last);
    EXPECT_EQ(first, -1);
    EXPECT_EQ(last, -1);
}

TEST_F(GListPaneModelTest, ARowThatThereIsNotCannotGo) {
    GListPane *const list = Filled(3, kListSelectSeveral);
    for (int row : {-1, 3, kMost, kLeast})
        list->DelItem(row);
    EXPECT_EQ(list->GetNumItems(), 3);
}

TEST_F(GListPaneModelTest, ARowThatGoesDrawsTheListAnewAlsoWithoutABar) {
    GListPane *const list = Filled(3);
    list->SetScrollWithNoBar(false);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->DelItem(0); }), (Log{"0", "1"}));
}

TEST_F(GListPaneModelTest, TheMarkOfARowThatGoesGoesToo) {
    GListPane *const list = Filled(3);
    Show();
    list->InvertItemRect(1, false);
    list->DelItem(1);
    UpdateGlog(glog);
    EXPECT_EQ(drawer.TakeRows(), (Log{"0", "1"}));
}

// Kept: marks behind the row that goes keep their number.
TEST_F(GListPaneModelTest, MarksOfOtherRowsStayAtTheirNumbers) {
    GListPane *const list = Filled(5);
    Show();
    list->InvertItemRect(3, false);
    list->DelItem(1);
    UpdateGlog(glog);
    EXPECT_EQ(drawer.TakeRows(), (Log{"0", "1", "2", "3*"}));
}

TEST_F(GListPaneModelTest, ARowThatComesInIsThereWhenItIsToldOf) {
    GListPane *const list = Filled(3, kListSelectSeveral);
    list->SelectItem(1);
    listener.Take();
    std::vector<int> selected;
    int rows = 0;
    listener.onCall = [&](std::string const &) {
        rows = list->GetNumItems();
        selected = SelectedRows(*list);
    };
    list->AddItem(1);
    EXPECT_EQ(rows, 4);
    EXPECT_EQ(selected, std::vector<int>{2});
}

TEST_F(GListPaneModelTest, RowsOfANewCountAreDeselectedOneByOne) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SelectAll();
    listener.Take();
    std::vector<int> selected; // how many, at each call
    listener.onCall = [&](std::string const &) { selected.push_back(list->NumSelected()); };
    list->SetNumItems(4);
    EXPECT_EQ(selected, (std::vector<int>{3, 2, 1, 0}));
}

TEST_F(GListPaneModelTest, WithoutMemoryForFlagsNothingChanges) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SelectItem(1);
    listener.Take();
    for (long successes : {0L, 1L})
        EXPECT_TRUE(FailsWithoutMemory(successes, [&] { list->SetNumItems(20000); }));
    EXPECT_TRUE(FailsWithoutMemory(0, [&] { list->AddItem(0); }));
    EXPECT_EQ(list->GetNumItems(), 5);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>{1});
    EXPECT_EQ(listener.Take(), Log());
    list->AddItem(0);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>{2}) << "there is a flag for every row";
}

TEST_F(GListPaneModelTest, WithoutMemoryForFlagsTheModeStays) {
    GListPane *const list = Filled(5);
    list->SetSelectionListener(nullptr); // whose notes need memory
    EXPECT_TRUE(FailsWithoutMemory(0, [&] { list->SetSelMode(kListSelectSeveral); }));
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectOne);
    list->SetSelRange(3, 3);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>{3});
    list->AddItem(0);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>{4});
}

TEST_F(GListPaneModelTest, FromOneModeWithFlagsToTheOtherNoMemoryIsNeeded) {
    GListPane *const list = Filled(5, kListSelectSeveral);
    list->SelectItem(1);
    list->SetSelectionListener(nullptr);
    EXPECT_FALSE(FailsWithoutMemory(0, [&] { list->SetSelMode(kListSelectToggle); }));
    EXPECT_EQ(list->GetResInfo().selMode, kListSelectToggle);
    EXPECT_EQ(list->NumSelected(), 0);
    list->SelectItem(4);
    EXPECT_EQ(SelectedRows(*list), std::vector<int>{4});
}

// Columns

TEST_F(GListPaneModelTest, OtherColumnsDrawTheListAnew) {
    GListPane *const list = NewList(Record());
    Show();
    EXPECT_EQ(InvalidatedBy([&] { EXPECT_TRUE(list->SetColumnList(ThreeColumns())); }),
              (std::vector<Rect>{ListBox()}));
    EXPECT_TRUE(InvalidatedBy([&] { EXPECT_FALSE(list->SetColumnList(ThreeColumns())); }).empty());
}

TEST_F(GListPaneModelTest, ColumnsDifferByNumberEdgesAlignmentAndName) {
    GListPane *const list = Filled(3);
    typedef std::function<void(ColumnList &)> Change;
    Change const others[] = {
        [](ColumnList &c) { c.SetBothEdges(0, 1, 60); }, [](ColumnList &c) { c.SetBothEdges(2, 120, 191); },
        [](ColumnList &c) { c.SetAlignment(1, TextSettings::kAlignRight); },
        [](ColumnList &c) { c.SetName(1, Text("x")); }, [](ColumnList &c) { c = ColumnList(2); }};
    for (Change const &change : others) {
        list->SetColumnList(ThreeColumns());
        boost::shared_ptr<ColumnList> const other = ThreeColumns();
        change(*other);
        EXPECT_TRUE(list->SetColumnList(other));
        EXPECT_EQ(list->GetColumnList(), other.get());
    }
    Change const alike[] = {
        [](ColumnList &c) { c.SetColumnMargin(0, 7); },
        [](ColumnList &c) { c.SetHelpTagLoc(0, OS::Help::Placement(1), 0.75); },
    };
    for (Change const &change : alike) {
        list->SetColumnList(ThreeColumns());
        boost::shared_ptr<ColumnList> const other = ThreeColumns();
        change(*other);
        EXPECT_FALSE(list->SetColumnList(other));
        EXPECT_EQ(list->GetColumnList(), other.get()) << "shared all the same";
    }
}

TEST_F(GListPaneModelTest, NoColumnsFailTheAssertionOfTheirPointer) {
    GListPane *const list = NewList(Record());
    EXPECT_THROW(list->InitColumnMapping(), BrokenInvariant);
    list->SetColumnList(ThreeColumns());
    EXPECT_THROW(list->SetColumnList(boost::shared_ptr<ColumnList>()), BrokenInvariant);
    EXPECT_EQ(list->GetColumnList()->GetNumColumns(), 3) << "nothing has changed";
}

TEST_F(GListPaneModelTest, ColumnsAreMappedToThemselvesAtFirst) {
    GListPane *const list = Filled(3);
    for (int column : {0, 1, 2})
        EXPECT_EQ(list->PhysicalToLogicalColumn(column), column);
}

TEST_F(GListPaneModelTest, AMappedColumnStaysUntilTheNextColumns) {
    GListPane *const list = Filled(3);
    list->SetColumnMapping(0, 2);
    EXPECT_EQ(list->PhysicalToLogicalColumn(0), 2);
    list->SetColumnList(ThreeColumns());
    EXPECT_EQ(list->PhysicalToLogicalColumn(0), 0) << "also when they are like those before";
    list->SetColumnMapping(1, 7);
    list->InitColumnMapping();
    EXPECT_EQ(list->PhysicalToLogicalColumn(1), 1);
}

TEST_F(GListPaneModelTest, AColumnThatThereIsNotIsNotMapped) {
    GListPane *const list = Filled(3);
    for (int column : {-1, 3, kMost, kLeast}) {
        list->SetColumnMapping(column, 1);
        EXPECT_EQ(list->PhysicalToLogicalColumn(column), column);
    }
    EXPECT_EQ(NewList(Record())->PhysicalToLogicalColumn(0), 0) << "no columns at all";
}
