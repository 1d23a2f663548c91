#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {

short const kCornerFamily = 1774, kCornerIcon = 0;
short const kCornerSide = 10; // pixels

OS::RectBase<OS::RectTag> Floating(Rect const &r) { return OS::RectBase<OS::RectTag>(r); }

} // namespace

bool GListPane::printing = false;

void GListPane::DrawGuts(OSRgn *region) {
    Prepare();
    Rect box;
    GetBox(&box);
    SaveColors const colors;
    if (IsDialogStyle()) {
        VelaDrawing::PenNormal();
        SetForegroundColor(kScrollBarBorderColor);
        VelaDrawing::FrameRect(&box);
    }
    DrawVisibleLines(region);
    if (!CanDrawSelection())
        DrawInactiveSelection();
    ForceNextPrepare();
}

void GListPane::DrawVisibleLines(OSRgn *region) {
    Prepare();
    SaveColors const colors;
    int i = 0;
    for (; i < numDisplayed && 0LL + topLine + i < numItems; ++i) {
        Rect row;
        GetRowBox(topLine + i, row);
        if (VelaDrawing::RectInRgn(&row, region))
            DrawListLine(topLine + i, kWholeRow, region);
    }
    if (CurrentlyDrawingForDragAndDrop())
        return;
    if (!printing) {
        DrawGround(topLine + i);
        if (IsDialogStyle())
            DrawInnerShadow();
    }
    transientHilites.clear();
}

// Below the rows, when they do not fill the list.
void GListPane::DrawGround(int firstFree) {
    Rect place;
    if (!GetRowBox(firstFree, place))
        return;
    Rect rest = InnerBox();
    rest.top = place.top;
    if (res.style != glistResRec::kSmallStyle) {
        SetupColors();
        VelaDrawing::EraseRect(&rest);
        return;
    }
    VelaDrawing::RGBForeColor(kListBackgroundColor);
    VelaDrawing::PaintRect(&rest);
    DrawShadowLine({rest.top, rest.left}, {rest.top, rest.right});
}

// Leaves the clip narrowed to what is inside the frame.
void GListPane::DrawInnerShadow() {
    Rect const box = InnerBox();
    VelaDrawing::NarrowClipToRect(&box);
    SavePortAndClip const saved;
    short const right = static_cast<short>(box.left + kCornerSide);
    short const below = static_cast<short>(box.top + kCornerSide);
    Draw1Icon(kCornerFamily, kCornerIcon, box.left, box.top);
    DrawShadowLine({box.top, right}, {box.top, box.right});
    DrawShadowLine({below, box.left}, {box.bottom, box.left});
}

// One row

void GListPane::DrawListLine(int line, int column, OSRgn *region) {
    if (line < 0) // no number that a drawer could know; printing from a page below 1 comes here
        return;
    bool const full = column >= 0;
    Prepare();
    SavePortAndClip const saved;
    VelaDrawing::NarrowClip(region);
    Rect row;
    if (!GetRowBox(line, row))
        return;
    Rect clip = row;
    if (column < kWholeRow && !NarrowToColumn(column, clip))
        return;
    Rect const area = InnerBox();
    bool const isSeen = VelaDrawing::SectRect(&area, &clip, &clip);
    if (line == protectedLine) {
        if (!printing)
            VelaDrawing::InvalRect(&clip);
        return;
    }
    if (!isSeen)
        return;
    WithClipRect const narrowed(Floating(clip));
    SetupColors();
    if (full && !printing && !CurrentlyDrawingForDragAndDrop())
        VelaDrawing::EraseRect(&row);
    bool const hilite = LooksSelected(line);
    if (full && !printing && hilite && IsDialogStyle())
        HiliteColumnRect(row);
    DoDrawListLine(line, &row, hilite);
}

void GListPane::UpdateListLine(int line) { DrawListLine(line, kWholeRow + 1, nullptr); }

// A negative number names the column of its amount.
bool GListPane::NarrowToColumn(int column, Rect &clip) const {
    long long const named = column < 0 ? -static_cast<long long>(column) : column;
    if (named >= columns->GetNumColumns())
        return false;
    int left = 0, right = 0;
    columns->GetBothEdges(static_cast<int>(named), left, right);
    clip.left = static_cast<short>(clip.left + left);
    clip.right = static_cast<short>(clip.left + right - left);
    return true;
}

bool GListPane::LooksSelected(int line) {
    if (std::binary_search(transientHilites.begin(), transientHilites.end(), line))
        return true;
    return CanDrawSelection() && CheckSel(line) && selColumn != kAnyColumn;
}

void GListPane::DoDrawListLine(int line, Rect *rowBox, bool hilite) {
    if (lineDrawer)
        lineDrawer->DrawLine(line, rowBox, hilite);
}

void GListPane::HiliteColumnRect(Rect rowBox) {
    if (!HasColumn(selColumn))
        return;
    SaveColors const colors;
    Rect const cell = CellIn(rowBox, selColumn);
    SetupColors();
    SetUserHiliteColorAsForeColor();
    VelaDrawing::PaintRect(&cell);
}

// The column's part of the row; the column has to be one.
Rect GListPane::CellIn(Rect const &rowBox, int column) const {
    Rect cell = rowBox;
    cell.left = std::max(Pixel16(rowBox.left + columns->GetLeftEdge(column)), rowBox.left);
    cell.right = std::min(Pixel16(rowBox.left + columns->GetRightEdge(column)), rowBox.right);
    return cell;
}

void GListPane::SetupColors() {
    if (printing) {
        ClearColors();
    } else if (res.style == glistResRec::kSmallStyle) {
        SetForegroundColor(kSmallListActiveTextColor);
        SetBackgroundColor(kListItemColor);
    } else {
        SetForegroundColor(kDialogListTextColor);
        SetBackgroundColor(kDialogListBackgroundColor);
    }
}

void GListPane::InvalInactiveSelectionDisplay() {}

void GListPane::DrawInactiveSelection() {}

void GListPane::ModifyScrollRect(Rect &) {}

// Invalidation

Rect GListPane::InnerBox() {
    Rect box;
    GetBox(&box);
    VelaDrawing::InsetRect(&box, Inset(), Inset());
    return box;
}

void GListPane::InvalBox(Rect const &box) {
    if (!GetVisibility())
        return;
    Prepare();
    VelaDrawing::InvalRect(&box);
}

void GListPane::InvalLine(int line) {
    Rect row;
    if (GetRowBox(line, row))
        InvalBox(row);
}

void GListPane::InvalRow(int line) {
    ColumnList const &table = *columns;
    Rect row;
    if (!GetRowBox(line, row))
        return;
    short const origin = GetBounds().left;
    row.left = Pixel16(0LL + table.GetColumnListLeftEdge() + origin);
    row.right = Pixel16(0LL + table.GetColumnListRightEdge() + origin);
    InvalBox(row);
}

// Rows that do not show need not be asked.
void GListPane::InvalCol(int column) {
    for (int i = 0; i < numDisplayed && HasRow(Saturated(0LL + topLine + i)); ++i)
        InvalCol(topLine + i, column);
}

void GListPane::InvalCol(int line, int column) {
    ColumnList const &table = *columns;
    Rect row;
    if (!HasColumn(column) || !GetRowBox(line, row))
        return;
    short const origin = GetBounds().left;
    row.left = Pixel16(table.GetLeftEdge(column) + origin);
    row.right = Pixel16(table.GetRightEdge(column) + origin);
    InvalBox(row);
}
