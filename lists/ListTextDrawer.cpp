#include "lists/ListTextDrawer.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <utility>

namespace {

int const kTextFont = 0;           // in the font table
int const kGap = 4;                // pixels between icon and text
int const kMostLayouts = 1 << 16;  // beyond them cells share
short const kDisabledOnPaper = 45; // percent of white
int const kCentred = 1, kOneLine = 0, kUpright = 0, kNothing = 0;

// The column's part of the row without its margins.
Rect CellBox(Rect const &row, ColumnList const &columns, int column) {
    long long const margin = columns.GetColumnMargin(column);
    int const left = std::max(row.left + columns.GetLeftEdge(column), static_cast<int>(row.left));
    int const right = std::min(row.left + columns.GetRightEdge(column), static_cast<int>(row.right));
    Rect cell = row;
    cell.left = Pixel16(left + margin);
    cell.right = Pixel16(right - margin);
    return cell;
}

// Where something of the width begins in the box.
short Start(Rect const &box, int width, TextSettings::Alignment alignment) {
    int const room = box.right - box.left - width;
    if (room <= 0 || alignment == TextSettings::kAlignLeft || alignment == TextSettings::kAlignDefault)
        return box.left;
    return Pixel16(box.left + (alignment == TextSettings::kAlignRight ? room : room / 2));
}

} // namespace

ListTextDrawer::ListTextDrawer(GListPane *list_, CellSource source_)
    : list(list_)
    , source(std::move(source_))
    , font(kTextFont)
    , truncation(TextSettings::kTruncateEnd)
    , rowsKept(0)
    , columnsKept(0) {}

void ListTextDrawer::SetFont(int index) { font = index; }

void ListTextDrawer::SetTruncation(TextSettings::TruncateCode code) { truncation = code; }

void ListTextDrawer::DrawLine(int line, Rect *rowBox, bool hilite) {
    Rect const row = *rowBox;
    if (line < 0 || !list->GetColumnList())
        return;
    SaveColors const colors;
    if (hilite && HighlightsItself()) {
        SetUserHiliteColorAsForeColor();
        VelaDrawing::PaintRect(&row);
        list->SetupColors();
    }
    for (int column = 0; column < list->GetColumnList()->GetNumColumns(); ++column) {
        Rect const box = CellBox(row, *list->GetColumnList(), column);
        if (VelaDrawing::EmptyRect(&box))
            continue;
        ListCell cell;
        source(line, list->PhysicalToLogicalColumn(column), cell);
        DrawCell(cell, line, column, box);
    }
}

// On paper nothing is highlighted.
bool ListTextDrawer::HighlightsItself() const {
    return list->GetResInfo().style == glistResRec::kSmallStyle && !GListPane::printing;
}

// There are layouts for as many rows as show and one more: while one scrolls in, another is still to be seen.
OS::TextLayout &ListTextDrawer::LayoutOf(int line, int column) {
    int const columns = std::max<int>(list->GetColumnList()->GetNumColumns(), 1);
    int const rows = std::clamp(list->GetNumDisplayed() + 1, 1, std::max(kMostLayouts / columns, 1));
    if (rows > rowsKept || columns != columnsKept) {
        rowsKept = std::max(rows, rowsKept);
        columnsKept = columns;
        layouts = Layouts(static_cast<std::size_t>(rowsKept) * static_cast<std::size_t>(columnsKept));
    }
    std::size_t const row = static_cast<std::size_t>(line % rowsKept);
    return layouts[row * static_cast<std::size_t>(columnsKept) + static_cast<std::size_t>(column)];
}

// Nothing when the source has taken the column away.
void ListTextDrawer::DrawCell(ListCell const &cell, int line, int column, Rect const &box) {
    ColumnList const &columns = *list->GetColumnList();
    if (column >= columns.GetNumColumns())
        return;
    // Asking for it changes nothing, although it is no const operation.
    TextSettings::Alignment const alignment = const_cast<ColumnList &>(columns).GetAlignment(column);
    Rect rest = box;
    if (cell.iconFamily != 0)
        DrawIcon(cell, rest, alignment);
    if (!cell.text.empty() && !VelaDrawing::EmptyRect(&rest))
        DrawText(cell, LayoutOf(line, column), rest, alignment);
}

// Takes what the icon needs from the box.
void ListTextDrawer::DrawIcon(ListCell const &cell, Rect &box, TextSettings::Alignment alignment) {
    Rect const size = GetIconBounds(cell.iconFamily);
    int const width = size.right - size.left, height = size.bottom - size.top;
    short const h = cell.text.empty() ? Start(box, width, alignment) : box.left;
    short const v = Pixel16(box.top + (box.bottom - box.top - height) / 2);
    SaveColors const colors;
    ClearColors();
    SavePortAndClip const clip;
    VelaDrawing::NarrowClipToRect(&box);
    Draw1Icon(cell.iconFamily, cell.icon, h, v);
    box.left = Pixel16(box.left + width + kGap);
}

void ListTextDrawer::DrawText(ListCell const &cell, OS::TextLayout &layout, Rect const &box,
                              TextSettings::Alignment alignment) {
    if (cell.isActive) {
        DrawTextLayoutInRect(layout, cell.text, box, font, alignment, truncation, kCentred, kOneLine,
                             kUpright, kNothing, 0.0f, 1.0f, 0.0f);
        return;
    }
    SaveColors const colors;
    if (GListPane::printing)
        GrayForeColor(kDisabledOnPaper); // paper is white in every theme
    else
        SetForegroundColor(kDialogListInactiveTextColor);
    DrawTextLayoutInRect(layout, cell.text, box, font, alignment, truncation, kCentred, kOneLine, kUpright,
                         kNothing, 0.0f, 1.0f, 0.0f);
}
