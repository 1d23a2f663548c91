// Rows, columns, and where they lie.
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "lists/GListPane.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <limits>
#include <new>

namespace {

int const kNone = -1;            // no row, no column
short const kRightOfAll = 30000; // pixels
Rect const kNoBox = {-1, -1, -1, -1};

bool AreAlike(ColumnList &a, ColumnList &b) {
    if (a.GetNumColumns() != b.GetNumColumns())
        return false;
    for (int i = 0; i < a.GetNumColumns(); ++i) {
        if (a.GetLeftEdge(i) != b.GetLeftEdge(i) || a.GetRightEdge(i) != b.GetRightEdge(i) ||
            a.GetAlignment(i) != b.GetAlignment(i) || !(a.GetName(i) == b.GetName(i)))
            return false;
    }
    return true;
}

int ColumnAt(ColumnList const &columns, int h) {
    for (int i = 0; i < columns.GetNumColumns(); ++i) {
        if (columns.GetLeftEdge(i) <= h && h < columns.GetRightEdge(i))
            return i;
    }
    return kNone;
}

// Where a row comes to when one comes in at the place.
int MovedBehind(int place, int row) { return row >= place ? Saturated(row + 1LL) : row; }

} // namespace

// Rows

// False, and nothing has changed, when there is no memory.
bool GListPane::MakeFlags(int count) {
    try {
        selected.SetCount(count);
        return true;
    } catch (std::bad_alloc const &) {
        FailMemFullError();
        return false;
    }
}

void GListPane::SetNumItems(int count) {
    int const rows = std::max(count, 0);
    if (HasFlags() && !MakeFlags(rows))
        return;
    numItems = rows;
    if (HasFlags() && !ClearFlags())
        return;
    SetScrollPosition(topLine);
}

void GListPane::AddItem(int at) {
    if (numItems == std::numeric_limits<int>::max())
        return;
    int const row = std::clamp(at, 0, numItems);
    if (HasFlags() && !MakeFlag(row))
        return;
    ++numItems;
    Prepare();
    if (HasFlags()) {
        PaneWatch const self(this);
        TellSelected(row, false, false);
        if (!self.PaneExists())
            return;
    } else {
        selFirst = MovedBehind(row, selFirst);
        selLast = MovedBehind(row, selLast);
    }
    SetScrollPosition(topLine);
}

// As MakeFlags.
bool GListPane::MakeFlag(int row) {
    try {
        selected.Insert(row);
        return true;
    } catch (std::bad_alloc const &) {
        FailMemFullError();
        return false;
    }
}

// A selection of rows behind this one stays at its numbers, though AddItem moves it.
void GListPane::DelItem(int at) {
    if (!HasRow(at))
        return;
    Prepare();
    if (HasFlags()) {
        selected.Remove(at);
    } else if (selFirst != kNone) {
        if (res.selMode != kListSelectOne && selLast != selFirst)
            selLast = std::min(selLast, numItems - 2);
        else if (selFirst == at)
            selFirst = selLast = kNone;
    }
    --numItems;
    Unmark(at);
    Inval();
    SetScrollPosition(topLine);
}

// Columns

bool GListPane::SetColumnList(boost::shared_ptr<ColumnList> list) {
    ColumnList &added = *list; // fails the pointer's assertion before anything has changed
    bool const differ = !columns || !AreAlike(*columns, added);
    columns = list;
    if (differ)
        Inval();
    InitColumnMapping();
    return differ;
}

void GListPane::InitColumnMapping() {
    columnMapping.resize(static_cast<std::size_t>(columns->GetNumColumns()));
    for (std::size_t i = 0; i < columnMapping.size(); ++i)
        columnMapping[i] = static_cast<int>(i);
}

void GListPane::SetColumnMapping(int physical, int logical) {
    if (IsMapped(physical))
        columnMapping[static_cast<std::size_t>(physical)] = logical;
}

int GListPane::PhysicalToLogicalColumn(int physical) {
    return IsMapped(physical) ? columnMapping[static_cast<std::size_t>(physical)] : physical;
}

bool GListPane::IsMapped(int physical) const {
    return physical >= 0 && static_cast<std::size_t>(physical) < columnMapping.size();
}

bool GListPane::HasColumn(int column) const {
    return columns && column >= 0 && column < columns->GetNumColumns();
}

// Places

// What rows have of the box's height.
int GListPane::FreeHeight() const {
    Rect const box = GetBounds();
    return box.bottom - box.top - res.firstLineOffset - 2 * Inset();
}

int GListPane::NumFullyDisplayedLines() { return res.lineHeight > 0 ? FreeHeight() / res.lineHeight : 0; }

void GListPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    int const height = res.lineHeight;
    numDisplayed = height > 0 ? (FreeHeight() + height - 1) / height : 0;
    numFullLines = NumFullyDisplayedLines();
    SetScrollPosition(topLine);
}

void GListPane::SetLineHeight(int height) {
    Rect box;
    GetBox(&box);
    res.lineHeight = Pixel16(height);
    Inval();
    SetBox(&box);
    Inval();
}

void GListPane::Resize(Point) {
    if (glog && !IsInLayout() && res.autoEdge != glistResRec::kNoEdge)
        FollowEdges();
    SetScrollPosition(topLine);
}

void GListPane::FollowEdges() {
    Rect oldBox;
    GetBox(&oldBox);
    Rect newBox = oldBox;
    if (res.autoEdge == glistResRec::kRightFollows || res.autoEdge == glistResRec::kBothFollow)
        newBox.right = Pixel16(GetGlogWidth(glog) - res.edgeH);
    if (res.autoEdge == glistResRec::kBottomFollows || res.autoEdge == glistResRec::kBothFollow)
        newBox.bottom = Pixel16(GetGlogHeight(glog) - res.edgeV);
    Prepare();
    HelpResizeObject(&oldBox, &newBox);
    if (IsDialogStyle())
        VelaDrawing::InvalRect(&newBox);
    SetBox(&newBox);
}

void GListPane::AutoResize(short dh, short dv) {
    GlogPane::AutoResize(dh, dv);
    if (res.autoEdge == glistResRec::kNoEdge)
        Resize({0, 0});
}

void GListPane::GetFirstAndLast(int *first, int *last) const {
    *first = topLine;
    *last = Saturated(std::min<long long>(0LL + topLine + numDisplayed - 1, numItems - 1));
}

bool GListPane::Shows(int line) const {
    long long const place = 0LL + line - topLine;
    return place >= 0 && place < numDisplayed;
}

bool GListPane::GetRowBox(int line, Rect &box) const {
    if (!Shows(line)) {
        box = kNoBox;
        return false;
    }
    Rect const all = GetBounds();
    int const top = all.top + Inset() + res.firstLineOffset + res.lineHeight * (line - topLine);
    box.left = static_cast<short>(all.left + Inset());
    box.right = static_cast<short>(all.right - Inset());
    box.top = static_cast<short>(top);
    box.bottom = static_cast<short>(top + res.lineHeight);
    return true;
}

bool GListPane::GetCellBox(int line, int column, Rect &box) const {
    if (!HasColumn(column) || !GetRowBox(line, box)) {
        box = kNoBox;
        return false;
    }
    columns->GetBothEdges(column, box.left, box.right);
    return true;
}

bool GListPane::GLGetBox(GLGetBoxRec *record) { return GetRowBox(record->line, record->box); }

bool GListPane::CheckHit(Point point, int *line, int *column) {
    Rect box;
    GetBox(&box);
    *line = RowAt(point.v, box);
    *column = columns && point.h < box.right ? ColumnAt(*columns, point.h - box.left) : kNone;
    return *column != kNone && *line >= 0;
}

int GListPane::RowAt(int v, Rect const &box) const {
    int const y = v - res.firstLineOffset - box.top - Inset();
    if (y < 0)
        return kAbove;
    if (v > box.bottom || res.lineHeight < 1)
        return kBelow;
    long long const row = 0LL + y / res.lineHeight + topLine;
    return row < numItems ? static_cast<int>(row) : kBelow;
}

int GListPane::CheckHitV(int v) {
    int line = kNone, column = kNone;
    CheckHit({Pixel16(v), kRightOfAll}, &line, &column);
    return line;
}
