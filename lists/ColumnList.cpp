#include "lists/ColumnList.h"
#include "host/OSFont.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include <algorithm>
#include <limits>

namespace {

int const kHeaderFont = 8;     // index in the application's font table
int const kRoomBesideName = 2; // pixels

short Cut(long long edge) { return static_cast<short>(edge); }

} // namespace

ColumnList::ColumnList(short count)
    : columns(static_cast<std::size_t>(std::max<short>(count, 0))) {}

ColumnList::ColumnList(short count, Data const *records)
    : columns(records, records + std::max<short>(count, 0)) {}

ColumnList::~ColumnList() {}

int ColumnList::GetNumColumns() const { return static_cast<int>(columns.size()); }

int ColumnList::GetLeftEdge(int column) const { return At(column).leftEdge; }

int ColumnList::GetRightEdge(int column) const { return At(column).rightEdge; }

int ColumnList::GetWidth(int column) const { return GetRightEdge(column) - GetLeftEdge(column); }

void ColumnList::GetBothEdges(int column, int &left, int &right) const {
    left = GetLeftEdge(column);
    right = GetRightEdge(column);
}

void ColumnList::GetBothEdges(int column, short &left, short &right) const {
    left = At(column).leftEdge;
    right = At(column).rightEdge;
}

int ColumnList::GetColumnListLeftEdge() const {
    int edge = std::numeric_limits<int>::max();
    for (Data const &column : columns)
        edge = std::min<int>(edge, column.leftEdge);
    return edge;
}

int ColumnList::GetColumnListRightEdge() const {
    int edge = std::numeric_limits<int>::min();
    for (Data const &column : columns)
        edge = std::max<int>(edge, column.rightEdge);
    return edge;
}

UString const &ColumnList::GetName(int column) const { return At(column).name; }

void ColumnList::SetName(int column, UString const &name) { At(column).name = name; }

TextSettings::Alignment ColumnList::GetAlignment(int column) { return At(column).alignment; }

void ColumnList::SetAlignment(int column, TextSettings::Alignment alignment) {
    At(column).alignment = alignment;
}

int ColumnList::GetColumnMargin(int column) const { return At(column).columnMargin; }

void ColumnList::SetColumnMargin(int column, int pixels) { At(column).columnMargin = pixels; }

LocalizedStrings::HelpTag const *ColumnList::GetHelpTag(int column) const { return At(column).helpTag; }

void ColumnList::SetHelpTag(int column, LocalizedStrings::HelpTag const *tag) { At(column).helpTag = tag; }

void ColumnList::GetHelpTagLoc(int column, OS::Help::Placement &placement, double &location) const {
    placement = At(column).helpTagPlacement;
    location = At(column).helpTagLocation;
}

void ColumnList::SetHelpTagLoc(int column, OS::Help::Placement placement, double location) {
    At(column).helpTagPlacement = placement;
    At(column).helpTagLocation = location;
}

// Measured in the font of list headers, whatever font the list draws in.
void ColumnList::SetBothEdges(int column, int left, int right) {
    if (right != left) {
        SaveTextState const textState;
        SetFontData(GetIndVelaFont(kHeaderFont));
        int const least = LooseStringWidth(At(column).name, 0.0f, 1.0f) + kRoomBesideName;
        if (static_cast<long long>(right) - left < least)
            right = static_cast<int>(static_cast<long long>(left) + least);
    }
    At(column).leftEdge = Cut(left);
    At(column).rightEdge = Cut(right);
}

// The distance counts before the wall stops the column: the columns that follow move by all of it, and are
// stopped in their turn. So the last column, made wider, moves its left edge to the right and gets narrower.
void ColumnList::ResizeColumn(int column, int newWidth) {
    Data &resized = At(column);
    short const wall = columns.back().rightEdge;
    short const left = resized.leftEdge;
    long long const delta = static_cast<long long>(newWidth) + left - resized.rightEdge;
    auto const movedTo = [wall](long long edge) { return std::min(Cut(edge), wall); };
    resized.rightEdge = movedTo(static_cast<long long>(left) + newWidth);
    for (int next = column + 1; next < GetNumColumns() - 1; ++next) {
        At(next).leftEdge = movedTo(At(next).leftEdge + delta);
        At(next).rightEdge = movedTo(At(next).rightEdge + delta);
    }
    columns.back().leftEdge = movedTo(columns.back().leftEdge + delta);
}
