#include "tools/gallery/ListHeaderPane.h"
#include "host/EventRecordAdapter.h"
#include "host/NamedColors.h"
#include "host/OSFont.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <cstdlib>
#include <memory>
#include <new>

namespace {

int const kHeadingFont = 8;
int const kReach = 4;          // pixels beside an edge that take it
int const kNarrowest = 28;     // pixels of a column
short const kMoveAlongX = 650; // cursor
short const kEdgeInset = 4;    // pixels above and below the line at an edge
int const kCentredVertically = 1;
int const kNoColumn = -1;

short Pixel(int value) { return static_cast<short>(value); }

} // namespace

ListHeaderPane *ListHeaderPane::NewListHeaderPane(glogRec *owner, boost::shared_ptr<ColumnList> columns,
                                                  std::function<void()> resized) {
    std::unique_ptr<ListHeaderPane> pane(new (std::nothrow)
                                             ListHeaderPane(std::move(columns), std::move(resized)));
    return pane && pane->GlogPaneInit(owner, 0) ? pane.release() : nullptr;
}

ListHeaderPane::ListHeaderPane(boost::shared_ptr<ColumnList> columns_, std::function<void()> resized_)
    : columns(std::move(columns_))
    , resized(std::move(resized_)) {}

// The last column ends where the list does.
int ListHeaderPane::ColumnEndingAt(Point point) const {
    int const h = point.h - GetBounds().left;
    for (int column = 0; column < columns->GetNumColumns() - 1; ++column)
        if (std::abs(columns->GetRightEdge(column) - h) <= kReach)
            return column;
    return kNoColumn;
}

char ListHeaderPane::AdjustCursorAndDisplayHelp(Point point) {
    if (ColumnEndingAt(point) == kNoColumn)
        return GlogPane::AdjustCursorAndDisplayHelp(point);
    CrsrMain(kMoveAlongX);
    return true;
}

int ListHeaderPane::HandleClick(EventRecordAdapter *event) {
    int const column = ColumnEndingAt(event->where);
    if (column == kNoColumn)
        return 0;
    Resize(column, event->where);
    return -1;
}

// Whoever is told, and whoever is drawn, may do away with the headings.
void ListHeaderPane::Resize(int column, Point start) {
    int const width = columns->GetWidth(column), last = columns->GetNumColumns() - 1;
    int const widest =
        columns->GetRightEdge(last) - columns->GetLeftEdge(column) - (last - column) * kNarrowest;
    PaneWatch const watch(this);
    glogRec *const window = glog;
    std::function<void()> const tell = resized;
    Prepare();
    Point place = start;
    while (MouseIsDragging(&place, nullptr) && watch.PaneExists()) {
        int const wanted = std::clamp(width + place.h - start.h, kNarrowest, std::max(widest, kNarrowest));
        columns->ResizeColumn(column, wanted);
        Inval();
        tell();
        UpdateGlog(window);
        if (!watch.PaneExists())
            return;
        Prepare();
    }
}

void ListHeaderPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    SaveTextState const state;
    Rect const box = GetDrawRectangle();
    VelaDrawing::RGBForeColor(kListBackgroundColor);
    VelaDrawing::PaintRect(&box);
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::FrameRect(&box);
    SetFontData(GetIndVelaFont(kHeadingFont));
    int const count = columns->GetNumColumns();
    for (int column = 0; column < count; ++column) {
        int const left = box.left + columns->GetLeftEdge(column),
                  right = box.left + columns->GetRightEdge(column);
        if (column < count - 1) {
            Rect const line = {Pixel(box.top + kEdgeInset), Pixel(right - 1), Pixel(box.bottom - kEdgeInset),
                               Pixel(right)};
            VelaDrawing::RGBForeColor(kScrollBarBorderColor);
            VelaDrawing::PaintRect(&line);
        }
        int const margin = columns->GetColumnMargin(column);
        Rect const cell = {box.top, Pixel(left + margin), box.bottom, Pixel(right - margin)};
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
        DrawStringInRect(columns->GetName(column), cell, columns->GetAlignment(column),
                         TextSettings::kTruncateEnd, kCentredVertically, 0, 0, 0.0f, 1.0f, 1.0f, 0.0f);
    }
}
