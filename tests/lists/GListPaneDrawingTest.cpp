// What a list draws, and what it marks to be drawn.
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/TextLayout.h"
#include "tests/lists/ListTest.h"
#include <limits>

namespace {

int const kMost = std::numeric_limits<int>::max(), kLeast = std::numeric_limits<int>::min();

// Opens what derived lists may change.
class OpenList : public GListPane {
public:
    OpenList(glogRec *owner, glistResRec record) { InitGListPane(owner, &record, 0); }
    using GListPane::DrawGuts;
};

class GListPaneDrawingTest : public ListTest {
protected:
    OpenList *NewOpen(int rows, int style = glistResRec::kDialogStyle,
                      GListSelectionMode mode = kListSelectOne) {
        glistResRec record = Record(mode);
        record.style = style;
        OpenList *const list = new OpenList(glog, record);
        Equipped(list, rows);
        return list;
    }
    // Rows that are drawn of a region.
    Log RowsIn(OpenList &list, Rect const &r) {
        OSRgn region(r);
        list.Prepare();
        list.DrawVisibleLines(&region);
        return drawer.TakeRows();
    }
    Lines LinesOf(OpenList &list, std::function<void()> const &action) {
        Lines const lines = Traced(list, action);
        drawer.TakeRows();
        return lines;
    }
    static Lines Count(std::string const &operation, Lines const &lines) { return Only(operation, lines); }

    static Rect const kAll;
};

Rect const GListPaneDrawingTest::kAll = ListBox();

// Draws a word, so that rows can be told from grounds in drawing calls.
void DrawWord(Rect const &row) {
    VelaDrawing::MoveTo(row.left, row.bottom);
    DrawString(UString("row", UString::kByteEncoding1));
}

} // namespace

// The whole list

TEST_F(GListPaneDrawingTest, DrawsTheRowsThatShow) {
    OpenList *const list = NewOpen(100);
    list->SetScrollPosition(30);
    Show();
    list->DrawGuts(nullptr);
    EXPECT_EQ(drawer.rows, (Log{"30", "31", "32", "33", "34", "35", "36"}));
    EXPECT_EQ(drawer.boxes.front(), (Rect{21, 31, 37, 229}));
}

TEST_F(GListPaneDrawingTest, AListOfDialogStyleHasAFrameAndAnInnerShadow) {
    OpenList *const list = NewOpen(100);
    list->SetLineDrawer(nullptr, false);
    Show();
    Lines const drawn = DrawingOf(*list);
    EXPECT_EQ(Only("FrameRect", drawn), Traced(*list, [] { VelaDrawing::FrameRect(&kAll); }));
    EXPECT_EQ(Only("Draw1Icon", drawn), Traced(*list, [] { Draw1Icon(1774, 0, 31, 21); }));
    EXPECT_EQ(Only("DrawShadowLine", drawn), Traced(*list, [] {
                  DrawShadowLine({21, 41}, {21, 229});
                  DrawShadowLine({31, 31}, {119, 31});
              }));
}

TEST_F(GListPaneDrawingTest, TheFrameHasTheColorOfScrollBars) {
    OpenList *const list = NewOpen(0);
    list->SetLineDrawer(nullptr, false);
    Show();
    Lines const drawn = DrawingOf(*list);
    Lines const expected = Traced(*list, [] {
        VelaDrawing::PenNormal();
        SetForegroundColor(kScrollBarBorderColor);
        VelaDrawing::FrameRect(&kAll);
    });
    ASSERT_GE(drawn.size(), expected.size());
    EXPECT_EQ(Lines(drawn.begin(), drawn.begin() + static_cast<std::ptrdiff_t>(expected.size())), expected);
}

TEST_F(GListPaneDrawingTest, AListOfDialogStyleLeavesTheClipInsideItsFrame) {
    OpenList *const list = NewOpen(100);
    Show();
    list->Prepare();
    list->DrawVisibleLines(nullptr);
    OSRgn clip;
    VelaDrawing::GetClip(&clip);
    EXPECT_EQ(CarbonUtils::GetRgnBounds(&clip), (Rect{21, 31, 119, 229}));
}

TEST_F(GListPaneDrawingTest, ASmallListHasNeitherFrameNorShadowBesideTheOneBelowItsRows) {
    OpenList *const list = NewOpen(100, glistResRec::kSmallStyle);
    Show();
    Lines const drawn = DrawingOf(*list);
    EXPECT_TRUE(Only("FrameRect", drawn).empty());
    EXPECT_TRUE(Only("Draw1Icon", drawn).empty());
    EXPECT_TRUE(Only("DrawShadowLine", drawn).empty());
}

TEST_F(GListPaneDrawingTest, BelowItsRowsAListOfDialogStyleIsErased) {
    OpenList *const list = NewOpen(2);
    list->SetLineDrawer(nullptr, false);
    Show();
    Rect const rest = {53, 31, 119, 229};
    EXPECT_EQ(Only("EraseRect", DrawingOf(*list)).back(), Traced(*list, [&] {
                                                              list->SetupColors();
                                                              VelaDrawing::EraseRect(&rest);
                                                          }).back());
}

TEST_F(GListPaneDrawingTest, BelowItsRowsASmallListHasAGroundOfItsOwnAndAShadow) {
    OpenList *const list = NewOpen(2, glistResRec::kSmallStyle);
    list->SetLineDrawer(nullptr, false);
    Show();
    Rect const rest = {52, 30, 120, 230};
    Lines const drawn = DrawingOf(*list);
    Lines const expected = Traced(*list, [&] {
        VelaDrawing::RGBForeColor(kListBackgroundColor);
        VelaDrawing::PaintRect(&rest);
        DrawShadowLine({52, 30}, {52, 230});
    });
    EXPECT_EQ(Only("PaintRect", drawn), Only("PaintRect", expected));
    EXPECT_EQ(Only("DrawShadowLine", drawn), Only("DrawShadowLine", expected));
    EXPECT_EQ(Only("EraseRect", drawn).size(), 2u) << "the two rows";
}

TEST_F(GListPaneDrawingTest, RowsThatFillTheListLeaveNoGround) {
    OpenList *const list = NewOpen(7);
    Show();
    EXPECT_EQ(Only("EraseRect", DrawingOf(*list)).size(), 7u);
}

TEST_F(GListPaneDrawingTest, OnlyRowsThatMeetTheRegionAreDrawn) {
    OpenList *const list = NewOpen(100);
    Show();
    EXPECT_EQ(RowsIn(*list, {37, 40, 53, 50}), (Log{"1"}));
    EXPECT_EQ(RowsIn(*list, {36, 40, 54, 50}), (Log{"0", "1", "2"}));
    EXPECT_EQ(RowsIn(*list, {20, 30, 21, 230}), Log()) << "the frame";
}

TEST_F(GListPaneDrawingTest, APartialRepaintDrawsOnlyItsRows) {
    GListPane *const list = Filled(100);
    Show();
    EXPECT_EQ(RowsDrawnBy([&] { list->InvalCol(3, 1); }), (Log{"3"}));
}

TEST_F(GListPaneDrawingTest, KeepsTheColorsOfThePort) {
    EXPECT_TRUE(KeepsColors(*NewOpen(3)));
    EXPECT_TRUE(KeepsColors(*NewOpen(3, glistResRec::kSmallStyle)));
}

TEST_F(GListPaneDrawingTest, AHiddenListDrawsNothing) {
    GListPane *const list = Filled(100);
    Show();
    list->Hide();
    Repainted();
    drawer.TakeRows();
    list->SetScrollPosition(5);
    list->InvalRow(6);
    list->InvertItemRect(6, true);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_EQ(drawer.TakeRows(), Log());
}

TEST_F(GListPaneDrawingTest, DrawsTheInactiveSelectionLastWhileItIsNotActive) {
    class List : public OpenList {
    public:
        using OpenList::OpenList;
        void DrawInactiveSelection() override {
            ++drawn;
            VelaDrawing::LineTo(1, 2);
        }
        int drawn = 0;
    };
    List *const list = new List(glog, Record());
    Equipped(list, 3);
    Show();
    int before = list->drawn;
    list->DrawGuts(nullptr);
    EXPECT_EQ(list->drawn, before);
    desktop.Play("activate off");
    before = list->drawn;
    EXPECT_NE(DrawingOf(*list).back().find("\"LineTo\""), std::string::npos);
    EXPECT_EQ(list->drawn, before + 1);
    list->DrawSelectionWhenInactive();
    list->DrawGuts(nullptr);
    EXPECT_EQ(list->drawn, before + 1);
}

// One row

TEST_F(GListPaneDrawingTest, ARowIsErasedInTheListsColorsAndThenDrawn) {
    OpenList *const list = NewOpen(100);
    drawer.onDraw = [](int, Rect const &row) { DrawWord(row); };
    Show();
    Rect const row = RowBox(*list, 2);
    Lines const drawn = LinesOf(*list, [&] { list->DrawListLine(2, 20000, nullptr); });
    Lines const expected = Traced(*list, [&] {
        list->SetupColors();
        VelaDrawing::EraseRect(&row);
        DrawWord(row);
    });
    ASSERT_GE(drawn.size(), expected.size());
    EXPECT_EQ(Lines(drawn.end() - static_cast<std::ptrdiff_t>(expected.size()), drawn.end()), expected);
}

TEST_F(GListPaneDrawingTest, UpdatingDrawsOneRowAtOnce) {
    OpenList *const list = NewOpen(100);
    Show();
    list->UpdateListLine(3);
    EXPECT_EQ(drawer.TakeRows(), (Log{"3"}));
    list->UpdateListLine(50);
    EXPECT_EQ(drawer.TakeRows(), Log()) << "it does not show";
    EXPECT_TRUE(desktop.TakePresented(glog).empty());
    UpdateGlog(glog);
    EXPECT_FALSE(desktop.TakePresented(glog).empty()) << "what was drawn is presented";
}

TEST_F(GListPaneDrawingTest, ARowIsClippedToWhatShowsOfIt) {
    OpenList *const list = NewOpen(100);
    Rect clip = {0, 0, 0, 0};
    drawer.onDraw = [&clip](int, Rect const &) {
        TempRgn const region;
        VelaDrawing::GetClip(region);
        clip = CarbonUtils::GetRgnBounds(region);
    };
    Show();
    list->UpdateListLine(6);
    EXPECT_EQ(clip, (Rect{117, 31, 119, 229}));
    list->DrawListLine(1, 1, nullptr);
    EXPECT_EQ(clip, (Rect{37, 91, 53, 151}));
    list->DrawListLine(1, 2, nullptr);
    EXPECT_EQ(clip, (Rect{37, 151, 53, 221}));
    OSRgn region(Rect{40, 100, 45, 400});
    list->DrawListLine(1, 20000, &region);
    EXPECT_EQ(clip, (Rect{40, 100, 45, 229}));
    list->DrawListLine(1, 1, &region);
    EXPECT_EQ(clip, (Rect{40, 100, 45, 151}));
}

TEST_F(GListPaneDrawingTest, ARowDoesNotLeaveTheClipNarrowed) {
    OpenList *const list = NewOpen(100);
    Show();
    OSRgn region(Rect{40, 30, 45, 400});
    for (int row : {1, 6, 50}) {
        list->DrawListLine(row, 1, &region);
        TempRgn const clip;
        VelaDrawing::GetClip(clip);
        EXPECT_EQ(CarbonUtils::GetRgnBounds(clip), ListBox()) << row;
    }
}

TEST_F(GListPaneDrawingTest, ColumnsOutsideOfTheListAreNotDrawn) {
    OpenList *const list = NewOpen(100);
    boost::shared_ptr<ColumnList> const columns = ThreeColumns();
    columns->SetBothEdges(2, 300, 400);
    list->SetColumnList(columns);
    Show();
    list->DrawListLine(1, 2, nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
}

TEST_F(GListPaneDrawingTest, ANegativeColumnIsDrawnOverWhatIsThere) {
    OpenList *const list = NewOpen(100);
    list->SetSelColumn(1);
    list->SetSelRange(1, 1);
    Show();
    Lines const over = LinesOf(*list, [&] { list->DrawListLine(1, -1, nullptr); });
    EXPECT_TRUE(Only("EraseRect", over).empty());
    EXPECT_TRUE(Only("PaintRect", over).empty()) << "no highlight";
    Lines const full = LinesOf(*list, [&] { list->DrawListLine(1, 1, nullptr); });
    EXPECT_EQ(Only("EraseRect", full).size(), 1u);
    EXPECT_EQ(Only("PaintRect", full).size(), 1u);
    list->DrawListLine(1, -1, nullptr);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1*"}));
}

TEST_F(GListPaneDrawingTest, AColumnThatThereIsNotIsNotDrawn) {
    OpenList *const list = NewOpen(100);
    Show();
    for (int column : {3, 1000, 19999, -3, -20000, kLeast})
        list->DrawListLine(1, column, nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
    list->DrawListLine(1, kMost, nullptr);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1"})) << "from 20000 on it is the whole row";
}

TEST_F(GListPaneDrawingTest, WithoutColumnsAColumnFailsTheAssertionOfTheirPointer) {
    GListPane *const list = NewList(Record());
    list->SetNumItems(3);
    Show();
    EXPECT_THROW(list->DrawListLine(1, 0, nullptr), BrokenInvariant);
    EXPECT_THROW(list->InvalRow(1), BrokenInvariant);
    EXPECT_THROW(list->InvalCol(1, 0), BrokenInvariant);
    EXPECT_THROW(list->InvalCol(0), BrokenInvariant);
    list->DrawListLine(1, 20000, nullptr);
}

TEST_F(GListPaneDrawingTest, RowsThatCannotBeAreNotDrawn) {
    OpenList *const list = NewOpen(3);
    Show();
    for (int row : {-1, kLeast, kMost, 100})
        list->DrawListLine(row, 20000, nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
}

TEST_F(GListPaneDrawingTest, PagesBeforeTheFirstHaveNoRows) {
    OpenList *const list = NewOpen(100);
    Show();
    list->ScrollToPage(0);
    list->DrawVisibleLines(nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
    list->ScrollToPage(kLeast);
    list->DrawVisibleLines(nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
}

TEST_F(GListPaneDrawingTest, ADrawerMayBeMissing) {
    OpenList *const list = NewOpen(3);
    list->SetLineDrawer(nullptr, false);
    Show();
    list->DrawVisibleLines(nullptr);
    EXPECT_EQ(drawer.TakeRows(), Log());
}

// Highlight

TEST_F(GListPaneDrawingTest, ASelectedRowIsHighlightedInTheColumnThatSelects) {
    OpenList *const list = NewOpen(100);
    list->SetSelColumn(1);
    list->SetSelRange(2, 2);
    Show();
    Rect const cell = {53, 91, 69, 151};
    Lines const drawn = LinesOf(*list, [&] { list->UpdateListLine(2); });
    Lines const expected = Traced(*list, [&] {
        SetUserHiliteColorAsForeColor();
        VelaDrawing::PaintRect(&cell);
    });
    EXPECT_EQ(Only("PaintRect", drawn), Only("PaintRect", expected));
    list->UpdateListLine(2);
    EXPECT_EQ(drawer.TakeRows(), (Log{"2*"}));
}

TEST_F(GListPaneDrawingTest, TheHighlightStaysInsideTheRow) {
    OpenList *const list = NewOpen(100);
    boost::shared_ptr<ColumnList> const columns = ThreeColumns();
    columns->SetBothEdges(0, -50, 500);
    list->SetColumnList(columns);
    Show();
    Rect const row = RowBox(*list, 0);
    EXPECT_EQ(Only("PaintRect", Traced(*list, [&] { list->HiliteColumnRect(row); })),
              Only("PaintRect", Traced(*list, [&] { VelaDrawing::PaintRect(&row); })));
}

TEST_F(GListPaneDrawingTest, TheHighlightLeavesTheColorsAsTheyWere) {
    OpenList *const list = NewOpen(100);
    Show();
    list->Prepare();
    SaveColorRec const tinted = {{1, 2, 3}, {4, 5, 6}};
    SetColors(&tinted);
    list->HiliteColumnRect(RowBox(*list, 0));
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, tinted);
}

TEST_F(GListPaneDrawingTest, AColumnThatThereIsNotHasNoHighlight) {
    OpenList *const list = NewOpen(100);
    list->SetSelRange(0, 0);
    Show();
    for (int column : {3, -1, kMost, kLeast}) {
        list->SetSelColumn(column);
        EXPECT_TRUE(Only("PaintRect", LinesOf(*list, [&] { list->UpdateListLine(0); })).empty()) << column;
    }
}

TEST_F(GListPaneDrawingTest, WhereAllColumnsSelectNoRowIsHighlighted) {
    OpenList *const list = NewOpen(100);
    list->SetSelColumn(GListPane::kAnyColumn);
    list->SetSelRange(1, 1);
    Show();
    list->UpdateListLine(1);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1"}));
}

TEST_F(GListPaneDrawingTest, ASmallListLeavesTheHighlightToItsDrawer) {
    OpenList *const list = NewOpen(100, glistResRec::kSmallStyle);
    list->SetSelRange(1, 1);
    Show();
    EXPECT_TRUE(Only("PaintRect", LinesOf(*list, [&] { list->UpdateListLine(1); })).empty());
    list->UpdateListLine(1);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1*"}));
}

TEST_F(GListPaneDrawingTest, AListThatIsNotActiveHighlightsOnlyWhenToldTo) {
    OpenList *const list = NewOpen(100);
    list->SetSelRange(1, 1);
    Show();
    desktop.Play("activate off");
    drawer.TakeRows();
    list->UpdateListLine(1);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1"}));
    list->DrawSelectionWhenInactive();
    list->UpdateListLine(1);
    EXPECT_EQ(drawer.TakeRows(), (Log{"1*"}));
}

TEST_F(GListPaneDrawingTest, AMarkedRowIsHighlightedUntilTheListHasBeenDrawn) {
    OpenList *const list = NewOpen(100);
    Show();
    list->InvertItemRect(2, false);
    list->UpdateListLine(2);
    list->UpdateListLine(2);
    EXPECT_EQ(drawer.TakeRows(), (Log{"2*", "2*"}));
    EXPECT_EQ(RowsIn(*list, {37, 40, 53, 50}), (Log{"1"}));
    list->UpdateListLine(2);
    EXPECT_EQ(drawer.TakeRows(), (Log{"2"})) << "a drawing of the list, even of other rows, takes it away";
}

TEST_F(GListPaneDrawingTest, AMarkShowsInAListThatIsNotActiveToo) {
    OpenList *const list = NewOpen(100);
    Show();
    desktop.Play("activate off");
    drawer.TakeRows();
    list->InvertItemRect(2, false);
    list->UpdateListLine(2);
    EXPECT_EQ(drawer.TakeRows(), (Log{"2*"}));
}

TEST_F(GListPaneDrawingTest, WhereAllColumnsSelectAMarkShowsAllTheSame) {
    OpenList *const list = NewOpen(100);
    list->SetSelColumn(GListPane::kAnyColumn);
    Show();
    list->InvertItemRect(2, false);
    list->UpdateListLine(2);
    EXPECT_EQ(drawer.TakeRows(), (Log{"2*"}));
}

// Colours

TEST_F(GListPaneDrawingTest, EachStyleHasItsColors) {
    struct {
        int style;
        RGBColor fore, back;
    } const cases[] = {
        {glistResRec::kDialogStyle, kDialogListTextColor, kDialogListBackgroundColor},
        {glistResRec::kSmallStyle, kSmallListActiveTextColor, kListItemColor},
        {7, kDialogListTextColor, kDialogListBackgroundColor},
    };
    for (auto const &c : cases) {
        OpenList *const list = NewOpen(3, c.style);
        list->Prepare();
        list->SetupColors();
        SaveColorRec colors;
        GetColors(&colors);
        EXPECT_EQ(colors, (SaveColorRec{c.fore, c.back})) << c.style;
    }
}

// A protected row

TEST_F(GListPaneDrawingTest, AProtectedRowIsOnlyInvalidated) {
    OpenList *const list = NewOpen(5);
    Show();
    list->Protect(2);
    list->Prepare();
    Lines const drawn = Traced(*list, [&] { list->DrawListLine(2, 20000, nullptr); });
    Rect const row = RowBox(*list, 2);
    EXPECT_EQ(Only("InvalRect", drawn), Traced(*list, [&] { VelaDrawing::InvalRect(&row); }));
    EXPECT_TRUE(Only("EraseRect", drawn).empty());
    EXPECT_EQ(drawer.TakeRows(), Log());
}

TEST_F(GListPaneDrawingTest, WhatShowsOfAProtectedCellIsInvalidated) {
    OpenList *const list = NewOpen(100);
    Show();
    list->Protect(6);
    Rect const cell = {117, 91, 119, 151};
    EXPECT_EQ(Only("InvalRect", Traced(*list, [&] { list->DrawListLine(6, 1, nullptr); })),
              Traced(*list, [&] { VelaDrawing::InvalRect(&cell); }));
}

TEST_F(GListPaneDrawingTest, TheOtherRowsAreDrawnAroundAProtectedOne) {
    OpenList *const list = NewOpen(4);
    Show();
    list->Protect(2);
    list->DrawVisibleLines(nullptr);
    EXPECT_EQ(drawer.TakeRows(), (Log{"0", "1", "3"}));
    list->Protect(-1);
    list->DrawVisibleLines(nullptr);
    EXPECT_EQ(drawer.TakeRows(), (Log{"0", "1", "2", "3"}));
}

TEST_F(GListPaneDrawingTest, AWindowWithAProtectedRowComesToRest) {
    OpenList *const list = NewOpen(4);
    list->Protect(2);
    Show();
    desktop.Play("wait 1");
    EXPECT_TRUE(Traced(*list, [] {}).empty());
}

// Marking for redraw

TEST_F(GListPaneDrawingTest, ACellIsInvalidatedByItsColumn) {
    GListPane *const list = Filled(100);
    Show();
    EXPECT_EQ(InvalidatedBy([&] { list->InvalCol(1, 2); }), (std::vector<Rect>{{37, 150, 53, 220}}));
}

TEST_F(GListPaneDrawingTest, AColumnIsInvalidatedInEveryRowThatShows) {
    GListPane *const list = Filled(3);
    Show();
    EXPECT_EQ(InvalidatedBy([&] { list->InvalCol(0); }), (std::vector<Rect>{{21, 30, 69, 90}}));
}

TEST_F(GListPaneDrawingTest, ARowIsInvalidatedFromItsFirstColumnToItsLast) {
    GListPane *const list = Filled(100);
    Show();
    EXPECT_EQ(InvalidatedBy([&] { list->InvalRow(1); }), (std::vector<Rect>{{37, 30, 53, 220}}));
    boost::shared_ptr<ColumnList> const columns = ThreeColumns();
    columns->SetBothEdges(0, 10, 60);
    list->SetColumnList(columns);
    EXPECT_EQ(InvalidatedBy([&] { list->InvalRow(1); }), (std::vector<Rect>{{37, 40, 53, 220}}));
    list->SetColumnList(boost::make_shared<ColumnList>(static_cast<short>(0)));
    EXPECT_TRUE(InvalidatedBy([&] { list->InvalRow(1); }).empty()) << "no columns";
}

TEST_F(GListPaneDrawingTest, CellsThatThereAreNotAreNotInvalidated) {
    GListPane *const list = Filled(100);
    Show();
    EXPECT_TRUE(InvalidatedBy([&] {
                    for (int row : {-1, 7, kMost, kLeast})
                        list->InvalRow(row);
                    for (int column : {-1, 3, kMost, kLeast}) {
                        list->InvalCol(column);
                        list->InvalCol(1, column);
                    }
                }).empty());
}
