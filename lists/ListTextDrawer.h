// Draws the rows of a list as texts and icons in its columns.
#pragma once
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "host/UString.h"
#include "lists/ListLineDrawer.h"
#include <functional>
#include <vector>

class ColumnList;
class GListPane;

// What one cell shows.
struct ListCell {
    UString text;
    short iconFamily = 0; // 0: no icon
    short icon = 0;       // index in the family
    bool isActive = true; // false: the text has the colour of what is disabled
};

// A cell stands in its column by the column's alignment, its margin kept free at either side. An icon comes
// before the text, or stands by the alignment where there is no text. What is too wide is shortened or cut.
// A selected row of a small list is highlighted as a whole; in one of the dialog style the list does it.
//
// Texts are shaped when they first show and kept while they do: drawing the same ones again costs no shaping.
class ListTextDrawer : public ListLineDrawer {
public:
    // Fills in a cell, which is empty, of a row and a logical column. Asked each time that the row is drawn,
    // also for rows behind the last, when those are. Must not give the list another drawer or delete it.
    typedef std::function<void(int line, int column, ListCell &)> CellSource;

    // For the list, which must outlive the drawer and mostly owns it; without columns nothing is drawn. Font
    // 0, texts shortened at their end.
    ListTextDrawer(GListPane *, CellSource);

    // Both only store: the list is to be invalidated.
    void SetFont(int index); // in the application's font table
    void SetTruncation(TextSettings::TruncateCode);

    // Overridden operation of drawers.
    void DrawLine(int line, Rect *rowBox, bool hilite) override;

private:
    typedef std::vector<OS::TextLayout> Layouts;

    OS::TextLayout &LayoutOf(int line, int column);
    bool HighlightsItself() const;
    void DrawCell(ListCell const &, int line, int column, Rect const &box);
    void DrawIcon(ListCell const &, Rect &box, TextSettings::Alignment);
    void DrawText(ListCell const &, OS::TextLayout &, Rect const &box, TextSettings::Alignment);

    GListPane *list;
    CellSource source;
    int font;
    TextSettings::TruncateCode truncation;
    // A layout for each cell that shows: row by row, rows in turn.
    Layouts layouts;
    int rowsKept, columnsKept;
};
