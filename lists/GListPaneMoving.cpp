// A row is dragged to another place.
#include "host/DragRect.h"
#include "host/OSPort.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "lists/GListPane.h"
#include "scrolling/CurrentTick.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {

int const kStays = -1;
short const kSlopH = 24, kSlopV = 40; // pixels round the list where a drop still counts
short const kShadow = 10;             // pixels that the inner shadow takes
long long const kTicksPerScroll = 3;

} // namespace

// Scrolls the list while the dragged row would leave it.
class GListPane::DragUpdater : public DragRegionUpdater {
public:
    DragUpdater(GListPane *scrolled, int above, int below)
        : list(scrolled)
        , watch(scrolled)
        , nextScrollTick(0)
        , scrollAbove(above)
        , scrollBelow(below) {}

    void UpdateDragRegion() override {
        if (!watch.PaneExists())
            return;
        list->Prepare();
        Point p;
        OS::Services::GetMouse(&p);
        int const direction = p.v < scrollAbove ? -1 : p.v > scrollBelow ? 1 : 0;
        long long const now = CurrentTick();
        if (direction == 0 || now < nextScrollTick)
            return;
        nextScrollTick = now + kTicksPerScroll;
        PenState pen;
        VelaDrawing::GetPenState(&pen);
        list->SetScrollPosition(Saturated(0LL + list->topLine + direction));
        UpdateGlog(list->glog);
        VelaDrawing::SetPenState(&pen);
    }

private:
    GListPane *list;
    PaneWatch watch;
    long long nextScrollTick;
    int scrollAbove, scrollBelow; // heights of the mouse beyond which the list scrolls
};

int GListPane::MoveItem(Point point) {
    int from = kStays, column = kStays;
    if (!CheckHit(point, &from, &column))
        return kStays;
    Prepare();
    PaneWatch const self(this);
    DeselectAll();
    Rect row;
    if (!self.PaneExists() || !HasRow(from) || !GetRowBox(from, row))
        return kStays;
    int dropV = 0;
    if (!DragRow(point, row, dropV) || !self.PaneExists() || !HasRow(from))
        return kStays;
    int to = PlaceOfDrop({Pixel16(dropV), point.h});
    if (to == from)
        return kStays;
    if (to > from)
        --to; // the row has been taken out before
    MovePixels(from, to);
    return to;
}

// False when the row is to stay; else writes the height to which its lower edge has come.
bool GListPane::DragRow(Point point, Rect const &row, int &dropV) {
    Rect box;
    GetBox(&box);
    Rect slop = box;
    VelaDrawing::InsetRect(&slop, -kSlopH, -kSlopV);
    DragUpdater updater(this, point.v - row.bottom + box.top, box.bottom - row.top + point.v);
    DragRegionTypes::Result const result =
        DragRect(this, row, OS::Point(point), box, slop, DragRegionTypes::kVerticalOnly, &updater);
    dropV = Truncated(result.dv + row.bottom);
    return result.moved;
}

int GListPane::PlaceOfDrop(Point drop) {
    int line = kAbove, column = 0;
    CheckHit(drop, &line, &column);
    if (line == kAbove)
        return std::max(topLine, 0);
    if (line == kBelow)
        return static_cast<int>(std::clamp<long long>(0LL + topLine + numDisplayed, 0, numItems));
    return std::max(line, 0);
}

// A preview of the change that the caller is about to make.
void GListPane::MovePixels(int from, int to) {
    Rect moved = InnerBox();
    if (IsDialogStyle())
        moved.top = static_cast<short>(moved.top + kShadow);
    moved.top = static_cast<short>(moved.top + res.firstLineOffset);
    Rect row;
    if (GetRowBox(std::min(from, to), row))
        moved.top = row.top;
    if (GetRowBox(std::max(from, to), row))
        moved.bottom = row.bottom;
    int const distance = from < to ? -res.lineHeight : res.lineHeight;
    Prepare();
    OSPort::Current().ScrollRect(moved, OS::Size(0, distance));
    if (IsDialogStyle())
        InvalShadow();
}

// What has been moved along with the pixels.
void GListPane::InvalShadow() {
    Rect const box = InnerBox();
    Rect left = box, top = box;
    left.top = static_cast<short>(box.top + kShadow);
    left.right = static_cast<short>(box.left + kShadow);
    top.bottom = static_cast<short>(box.top + kShadow);
    VelaDrawing::InvalRect(&left);
    VelaDrawing::InvalRect(&top);
}
