#include "scrolling/Grid.h"
#include "host/VelaDrawing.h"
#include "scrolling/SingleAxis.h"
#include <algorithm>

namespace {

Rect BoxOf(GlogPane &pane) {
    Rect box;
    pane.GetBox(&box);
    return box;
}

} // namespace

Grid::Grid()
    : verticalGrid(false)
    , mayHaveDifferentSizes(false) {}

Grid *Grid::GridInit(glogRec *owner, short id) {
    if (!CompoundPaneInit(owner, id))
        return nullptr;
    verticalGrid = true;
    return this;
}

short Grid::Add(GlogPane *pane, short position) {
    short const index = CompoundPane::Add(pane, position);
    if (index >= 0)
        Reposition(index, true);
    return index;
}

void Grid::Del(short index) {
    if (index < 0 || index >= NumSubpanes())
        return;
    CompoundPane::Del(index);
    Reposition(index, false);
}

void Grid::Reposition(short first, unsigned char invalidate) {
    for (short i = first; i < NumSubpanes(); ++i) {
        SetMemberBounds(i);
        if (invalidate)
            Get(i)->Inval();
    }
}

void Grid::Move(short from, short to) {
    if (from < 0 || from >= NumSubpanes() || to < 0 || to >= NumSubpanes())
        return;
    GlogPane *const member = Get(from);
    DelGuts(from, true);
    if (CompoundPane::AddGuts(member, to) < 0) // a subclass's is for additions, and this is none
        return;
    for (short i = std::min(from, to); i <= std::max(from, to); ++i) {
        SetMemberBounds(i);
        Get(i)->Inval();
    }
}

void Grid::SetMemberBounds(short index) {
    if (index < 0 || index >= NumSubpanes())
        return;
    GlogPane *const pane = Get(index);
    if (!pane || pane->IsInLayout() || !IsAGridItem(pane))
        return;
    Rect box = BoxOf(*pane);
    Point place = {0, 0};
    short const item = GetGridItemIndex(pane);
    if (item > 0) {
        SingleAxis const along(verticalGrid);
        along.Place(place) = along.End(BoxOf(*GetNthGridItem(static_cast<short>(item - 1))));
    }
    VelaDrawing::OffsetRect(&box, static_cast<short>(place.h - box.left),
                            static_cast<short>(place.v - box.top));
    pane->SetBox(&box);
}

short Grid::GetNumGridItems() { return NumSubpanes(); }

GlogPane *Grid::GetNthGridItem(short index) { return Get(index); }

short Grid::GetGridItemIndex(GlogPane *pane) { return Find(pane); }

bool Grid::IsAGridItem(GlogPane *) { return true; }

short Grid::ListHeight() { return ListDimension(true, mayHaveDifferentSizes && !verticalGrid); }

short Grid::ListWidth() { return ListDimension(false, mayHaveDifferentSizes && verticalGrid); }

short Grid::ListDimension(bool height, bool measureAll) {
    short const count = GetNumGridItems();
    if (count < 1)
        return 0;
    GlogPane *const first = GetNthGridItem(0);
    GlogPane *const last = GetNthGridItem(static_cast<short>(count - 1));
    if (!first || !last)
        return 0;
    SingleAxis const axis(height);
    if (!measureAll)
        return static_cast<short>(axis.End(BoxOf(*last)) - axis.Start(BoxOf(*first)));
    short largest = 0;
    for (short i = 0; i < count; ++i)
        largest = std::max(largest, axis.Length(BoxOf(*GetNthGridItem(i))));
    return largest;
}
