#include "lists/ListTextDrawer.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "tests/ShapingCount.h"
#include "tests/frame/Allocations.h"
#include "tests/lists/ListTest.h"
#include <algorithm>
#include <limits>
#include <map>

namespace {

short const kNotes = 1821; // icons of 8 x 14

class ListTextDrawerTest : public ListTest {
protected:
    // A list whose cells say their row and column, unless the test has others.
    GListPane *NewTextList(int rows, int style = glistResRec::kDialogStyle) {
        glistResRec record = Record();
        record.style = style;
        GListPane *const list = Equipped(NewList(record), rows);
        texts = new ListTextDrawer(list, [this](int line, int column, ListCell &cell) {
            ++asked;
            auto const own = cells.find({line, column});
            if (own != cells.end())
                cell = own->second;
            else
                cell.text = Text((std::to_string(line) + ":" + std::to_string(column)).c_str());
        });
        list->SetLineDrawer(texts, true);
        Show();
        return list;
    }
    static ListCell Cell(char const *text, short family = 0, short icon = 0) {
        ListCell cell;
        cell.text = Text(text);
        cell.iconFamily = family;
        cell.icon = icon;
        return cell;
    }
    Lines TextsOf(GListPane &list, int row) {
        return Only("DrawTextLayoutInRect", Traced(list, [&] { list.UpdateListLine(row); }));
    }
    Lines IconsOf(GListPane &list, int row) {
        return Only("Draw1Icon", Traced(list, [&] { list.UpdateListLine(row); }));
    }
    // The call that shows a text in a rectangle.
    Lines Expected(GListPane &list, char const *text, Rect const &box, TextSettings::Alignment alignment,
                   int font = 0, TextSettings::TruncateCode truncation = TextSettings::kTruncateEnd) {
        OS::TextLayout layout;
        return Only("DrawTextLayoutInRect", Traced(list, [&] {
                        list.SetupColors();
                        DrawTextLayoutInRect(layout, Text(text), box, font, alignment, truncation, 1, 0, 0, 0,
                                             0.0f, 1.0f, 0.0f);
                    }));
    }
    static void Restyle(GListPane &list, std::function<void(ColumnList &)> const &change) {
        boost::shared_ptr<ColumnList> const columns = ThreeColumns();
        change(*columns);
        list.SetColumnList(columns);
    }

    ListTextDrawer *texts = nullptr;
    std::map<std::pair<int, int>, ListCell> cells;
    int asked = 0;
};

} // namespace

TEST_F(ListTextDrawerTest, EachColumnShowsItsTextInsideItsMargins) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) { columns.SetColumnMargin(1, 5); });
    Lines const drawn = TextsOf(*list, 2); // from 31 on; the row is from 53 to 69
    ASSERT_EQ(drawn.size(), 3u);
    EXPECT_EQ(drawn[0], Expected(*list, "2:0", {53, 32, 69, 90}, TextSettings::kAlignDefault)[0]);
    EXPECT_EQ(drawn[1], Expected(*list, "2:1", {53, 96, 69, 146}, TextSettings::kAlignDefault)[0]);
    EXPECT_EQ(drawn[2], Expected(*list, "2:2", {53, 152, 69, 220}, TextSettings::kAlignDefault)[0]);
}

TEST_F(ListTextDrawerTest, TextsStandByTheAlignmentOfTheirColumn) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) {
        columns.SetAlignment(0, TextSettings::kAlignRight);
        columns.SetAlignment(1, TextSettings::kAlignCenter);
    });
    Lines const drawn = TextsOf(*list, 0);
    ASSERT_EQ(drawn.size(), 3u);
    EXPECT_EQ(drawn[0], Expected(*list, "0:0", {21, 32, 37, 90}, TextSettings::kAlignRight)[0]);
    EXPECT_EQ(drawn[1], Expected(*list, "0:1", {21, 92, 37, 150}, TextSettings::kAlignCenter)[0]);
}

TEST_F(ListTextDrawerTest, TextsCanBeInAnotherFontAndShortenedElsewhere) {
    GListPane *const list = NewTextList(100);
    texts->SetFont(8);
    texts->SetTruncation(TextSettings::kTruncateMiddle);
    EXPECT_EQ(TextsOf(*list, 0)[0], Expected(*list, "0:0", {21, 32, 37, 90}, TextSettings::kAlignDefault, 8,
                                             TextSettings::kTruncateMiddle)[0]);
}

TEST_F(ListTextDrawerTest, AColumnShowsWhatItIsMappedTo) {
    GListPane *const list = NewTextList(100);
    list->SetColumnMapping(0, 2);
    list->SetColumnMapping(2, 0);
    EXPECT_EQ(TextsOf(*list, 4)[0],
              Expected(*list, "4:2", {85, 32, 101, 90}, TextSettings::kAlignDefault)[0]);
}

TEST_F(ListTextDrawerTest, AnEmptyCellDrawsNothing) {
    GListPane *const list = NewTextList(100);
    cells[{0, 1}] = ListCell();
    EXPECT_EQ(TextsOf(*list, 0).size(), 2u);
}

TEST_F(ListTextDrawerTest, ColumnsOutsideOfTheListAreNotAskedFor) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) {
        columns.SetBothEdges(0, -100, -10);
        columns.SetBothEdges(2, 300, 400);
    });
    asked = 0;
    EXPECT_EQ(TextsOf(*list, 0).size(), 1u);
    EXPECT_EQ(asked, 1);
}

TEST_F(ListTextDrawerTest, ACellEndsWithTheList) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) { columns.SetBothEdges(2, 120, 500); });
    EXPECT_EQ(TextsOf(*list, 0)[2],
              Expected(*list, "0:2", {21, 152, 37, 228}, TextSettings::kAlignDefault)[0]);
}

TEST_F(ListTextDrawerTest, AMarginThatLeavesNoRoomLeavesTheCellEmpty) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) { columns.SetColumnMargin(0, 30); });
    EXPECT_EQ(TextsOf(*list, 0).size(), 2u);
    Restyle(*list, [](ColumnList &columns) { columns.SetColumnMargin(0, 2000000000); });
    EXPECT_EQ(TextsOf(*list, 0).size(), 2u);
}

// Icons

TEST_F(ListTextDrawerTest, AnIconComesBeforeItsText) {
    GListPane *const list = NewTextList(100);
    cells[{1, 0}] = Cell("note", kNotes, 2);
    EXPECT_EQ(IconsOf(*list, 1), Traced(*list, [] { Draw1Icon(kNotes, 2, 32, 38); }));
    EXPECT_EQ(TextsOf(*list, 1)[0],
              Expected(*list, "note", {37, 44, 53, 90}, TextSettings::kAlignDefault)[0]);
}

TEST_F(ListTextDrawerTest, AnIconAloneStandsByTheAlignment) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) {
        columns.SetAlignment(0, TextSettings::kAlignLeft);
        columns.SetAlignment(1, TextSettings::kAlignCenter);
        columns.SetAlignment(2, TextSettings::kAlignRight);
    });
    for (int column : {0, 1, 2})
        cells[{0, column}] = Cell("", kNotes, 1);
    EXPECT_EQ(IconsOf(*list, 0), Traced(*list, [] {
                  Draw1Icon(kNotes, 1, 32, 22);
                  Draw1Icon(kNotes, 1, 117, 22);
                  Draw1Icon(kNotes, 1, 212, 22);
              }));
}

TEST_F(ListTextDrawerTest, AnIconWiderThanItsCellIsCut) {
    GListPane *const list = NewTextList(100);
    Restyle(*list, [](ColumnList &columns) { columns.SetBothEdges(0, 0, 5); });
    cells[{0, 0}] = Cell("gone", kNotes, 1);
    Rect const cell = {21, 32, 37, 35};
    Lines const drawn = Traced(*list, [&] { list->UpdateListLine(0); });
    Lines const clips = Only("NarrowClipToRect", drawn);
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_EQ(clips[0], Traced(*list, [&] { VelaDrawing::NarrowClipToRect(&cell); })[0]);
    EXPECT_EQ(TextsOf(*list, 0).size(), 2u) << "no room for its text";
}

// Looks

TEST_F(ListTextDrawerTest, WhatIsNotActiveHasTheColorOfDisabledText) {
    GListPane *const list = NewTextList(100);
    cells[{0, 1}] = Cell("off");
    cells[{0, 1}].isActive = false;
    OS::TextLayout layout;
    Rect const cell = {21, 92, 37, 150};
    Lines const expected =
        Only("DrawTextLayoutInRect", Traced(*list, [&] {
                 SetForegroundColor(kDialogListInactiveTextColor);
                 DrawTextLayoutInRect(layout, Text("off"), cell, 0, TextSettings::kAlignDefault,
                                      TextSettings::kTruncateEnd, 1, 0, 0, 0, 0.0f, 1.0f, 0.0f);
             }));
    EXPECT_EQ(TextsOf(*list, 0)[1], expected[0]);
    EXPECT_NE(TextsOf(*list, 0)[2].find(TextsOf(*list, 1)[2].substr(TextsOf(*list, 1)[2].find("fore"))),
              std::string::npos)
        << "the next cell has the usual one";
}

TEST_F(ListTextDrawerTest, ASelectedRowOfASmallListIsHighlightedAsAWhole) {
    GListPane *const list = NewTextList(100, glistResRec::kSmallStyle);
    list->SetSelRange(1, 1);
    Rect const row = RowBox(*list, 1);
    EXPECT_EQ(Only("PaintRect", Traced(*list, [&] { list->UpdateListLine(1); })),
              Traced(*list, [&] { VelaDrawing::PaintRect(&row); }));
    EXPECT_TRUE(Only("PaintRect", Traced(*list, [&] { list->UpdateListLine(2); })).empty());
}

TEST_F(ListTextDrawerTest, TextsOfAHighlightedRowHaveTheColorOfTheOthers) {
    GListPane *const list = NewTextList(100, glistResRec::kSmallStyle);
    Lines const before = TextsOf(*list, 1);
    list->SetSelRange(1, 1);
    EXPECT_EQ(TextsOf(*list, 1), before);
}

TEST_F(ListTextDrawerTest, OfTheDialogStyleTheListHighlightsAlone) {
    GListPane *const list = NewTextList(100);
    list->SetSelRange(1, 1);
    EXPECT_EQ(Only("PaintRect", Traced(*list, [&] { list->UpdateListLine(1); })).size(), 1u);
}

TEST_F(ListTextDrawerTest, OnPaperNothingIsHighlighted) {
    GListPane *const list = NewTextList(10, glistResRec::kSmallStyle);
    list->SetSelRange(1, 1);
    list->SaveSetup();
    Lines const drawn = Traced(*list, [&] { list->DrawVisibleLines(nullptr); });
    EXPECT_TRUE(Only("PaintRect", drawn).empty());
    EXPECT_EQ(Only("DrawTextLayoutInRect", drawn).size(), 30u);
    list->RestoreSetup();
}

TEST_F(ListTextDrawerTest, KeepsTheColorsOfTheRow) {
    GListPane *const list = NewTextList(100, glistResRec::kSmallStyle);
    cells[{0, 0}] = Cell("note", kNotes, 2);
    list->Prepare();
    SaveColorRec const tinted = {{1, 2, 3}, {4, 5, 6}};
    SetColors(&tinted);
    Rect row = RowBox(*list, 0);
    texts->DrawLine(0, &row, true);
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, tinted);
}

// Shaping

TEST_F(ListTextDrawerTest, TheSameTextsAreNotShapedAgain) {
    GListPane *const list = NewTextList(1000);
    list->Inval();
    UpdateGlog(glog);
    int const before = ShapingCount::texts;
    for (int i = 0; i < 3; ++i) {
        list->Inval();
        UpdateGlog(glog);
    }
    EXPECT_EQ(ShapingCount::texts, before);
}

TEST_F(ListTextDrawerTest, AStepShapesTheTextsOfTheRowThatComesIn) {
    GListPane *const list = NewTextList(1000);
    list->SetScrollPosition(100);
    UpdateGlog(glog);
    int const before = ShapingCount::texts;
    list->SetScrollPosition(101);
    UpdateGlog(glog);
    EXPECT_EQ(ShapingCount::texts - before, 3);
    list->SetScrollPosition(100);
    UpdateGlog(glog);
    EXPECT_EQ(ShapingCount::texts - before, 3) << "the row that went out is still known";
}

// More than the texts that the host keeps for calls without layouts.
TEST_F(ListTextDrawerTest, ManyColumnsAreNotShapedAgainEither) {
    GListPane *const list = NewTextList(1000);
    boost::shared_ptr<ColumnList> const columns = boost::make_shared<ColumnList>(static_cast<short>(190));
    for (int i = 0; i < 190; ++i)
        columns->SetBothEdges(i, i, i + 4);
    list->SetColumnList(columns);
    list->Inval();
    UpdateGlog(glog);
    int const before = ShapingCount::texts;
    list->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(ShapingCount::texts, before);
}

// Changes from inside

TEST_F(ListTextDrawerTest, ASourceMayTakeColumnsAway) {
    GListPane *const list = NewTextList(100);
    bool taken = false;
    list->SetLineDrawer(new ListTextDrawer(list,
                                           [&](int, int, ListCell &cell) {
                                               cell.text = Text("x");
                                               if (!taken)
                                                   list->SetColumnList(
                                                       boost::make_shared<ColumnList>(static_cast<short>(0)));
                                               taken = true;
                                           }),
                        true);
    EXPECT_TRUE(TextsOf(*list, 0).empty());
    EXPECT_TRUE(taken);
}

TEST_F(ListTextDrawerTest, ALargerListKeepsMoreTexts) {
    GListPane *const list = NewTextList(1000);
    Rect large = {0, 0, 200, 320};
    list->SetBox(&large);
    list->Inval();
    UpdateGlog(glog);
    int const before = ShapingCount::texts;
    list->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(ShapingCount::texts, before);
}

TEST_F(ListTest, WithoutColumnsADrawerOfTextsDrawsNothing) {
    GListPane *const list = NewList(Record());
    int asked = 0;
    list->SetLineDrawer(new ListTextDrawer(list, [&](int, int, ListCell &) { ++asked; }), true);
    list->SetNumItems(5);
    Show();
    list->Inval();
    Repainted();
    EXPECT_EQ(asked, 0);
}

TEST_F(ListTextDrawerTest, ARowMayBeDrawnWhereNoneShows) {
    glistResRec record = Record();
    record.firstLineOffset = 1000;
    GListPane *const list = Equipped(NewList(record), 100);
    ASSERT_LT(list->GetNumDisplayed(), -1);
    Show();
    Rect row = {60, 31, 76, 229};
    for (int line : {0, 1, 5, std::numeric_limits<int>::max()}) {
        ListTextDrawer drawn(list, [](int, int, ListCell &cell) { cell.text = Text("x"); });
        EXPECT_EQ(
            Only("DrawTextLayoutInRect", Traced(*list, [&] { drawn.DrawLine(line, &row, false); })).size(),
            3u)
            << line;
    }
}

TEST_F(ListTextDrawerTest, ANegativeRowIsNotDrawn) {
    NewTextList(100);
    asked = 0;
    Rect row = {60, 31, 76, 229};
    for (int line : {-1, std::numeric_limits<int>::min()})
        texts->DrawLine(line, &row, false);
    EXPECT_EQ(asked, 0);
}

// A dialog may ask for many rows and columns of nearly no size, of which none but a few have a text.
TEST_F(ListTextDrawerTest, ManyRowsAndColumnsTakeNoMoreThanSoMuchMemory) {
    glistResRec record = Record();
    record.bounds = {0, 0, 4000, 200};
    record.lineHeight = 1;
    GListPane *const list = Equipped(NewList(record), 10000);
    ListTextDrawer drawn(list, [](int, int, ListCell &cell) { cell.text = Text("x"); });
    boost::shared_ptr<ColumnList> const columns = boost::make_shared<ColumnList>(static_cast<short>(2000));
    columns->SetBothEdges(1999, 0, 100);
    list->SetColumnList(columns);
    Show();
    ASSERT_GT(list->GetNumDisplayed(), 3000);
    Rect row = {60, 31, 76, 229};
    Allocations::Counter const counter;
    EXPECT_EQ(Only("DrawTextLayoutInRect", Traced(*list, [&] { drawn.DrawLine(0, &row, false); })).size(),
              1u);
    EXPECT_LT(counter.Bytes(), 20000000);
}

// Rows share the layouts then, and each still shows its own text.
TEST_F(ListTextDrawerTest, RowsThatShareWhatIsKeptShowTheirOwnTexts) {
    glistResRec record = Record();
    record.bounds = {0, 0, 199, 200};
    record.lineHeight = 2;
    GListPane *const list = Equipped(NewList(record), 200);
    boost::shared_ptr<ColumnList> const columns = boost::make_shared<ColumnList>(static_cast<short>(32767));
    columns->SetBothEdges(0, 0, 100);
    list->SetColumnList(columns);
    list->SetLineDrawer(new ListTextDrawer(list,
                                           [](int line, int, ListCell &cell) {
                                               cell.text = Text(("row" + std::to_string(line)).c_str());
                                           }),
                        true);
    Show();
    for (int row : {0, 1, 2, 50, 0})
        EXPECT_NE(TextsOf(*list, row).front().find("\"row" + std::to_string(row) + "\""), std::string::npos);
}
