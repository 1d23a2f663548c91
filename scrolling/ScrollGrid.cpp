#include "scrolling/ScrollGrid.h"
#include "host/CustomEventHandler.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/PaneWatch.h"
#include "host/UIEvent.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "scrolling/WheelAxis.h"
#include <algorithm>
#include <cstdlib>
#include <limits>
#include <new>

namespace {

int const kStepsPerView = 16; // an arrow makes one of them, a page all but one
int const kFastest = 4;       // the greatest multiplier
double const kStepsPerWheelUnit = 2.0;

int Clamped(int position, int greatest) { return std::max(std::min(position, greatest), 0); }

} // namespace

struct ScrollGridMouseWheelHandler : CustomEventHandler {
    explicit ScrollGridMouseWheelHandler(ScrollGrid *scrolled)
        : grid(scrolled) {}

    // A wheel across the axis is left to others.
    bool HandleEvent(UIEvent *event) override {
        boost::shared_ptr<UIEvent::MouseWheelParams> const wheel = event->GetMouseWheelParams();
        if (wheel->axis != (grid->IsVerticalGrid() ? kWheelVertical : kWheelHorizontal))
            return false;
        int const delta = Truncated(wheel->delta);
        grid->Scroll(Truncated(-static_cast<double>(delta) * kStepsPerWheelUnit));
        return true;
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) ScrollGridMouseWheelHandler(grid); }

private:
    ScrollGrid *grid;
};

ScrollGrid::ScrollGrid(glogRec *owner, short id, ScrollBarPane *bar)
    : scrollOffset(0)
    , supressGridUpdate(false)
    , supressSBarUpdate(false)
    , alwaysUpdateScrollbar(true)
    , slaved(false) {
    GridInit(owner, id);
    SetScrollbar(bar);
}

ScrollGrid::~ScrollGrid() { LetGoOfScrollbar(); }

// Sizes

int ScrollGrid::BoxLength(SingleAxis axis) { return axis.IsVertical() ? ItemHeight() : ItemWidth(); }

short ScrollGrid::ListLength(SingleAxis axis) { return axis.IsVertical() ? ListHeight() : ListWidth(); }

int ScrollGrid::MaxScroll(SingleAxis axis) { return std::max(ListLength(axis) - BoxLength(axis), 0); }

int ScrollGrid::GetMaxScroll() { return MaxScroll(Along()); }

int ScrollGrid::ScrollDelta(bool byUnit) {
    int const size = std::max(BoxLength(Along()), kStepsPerView);
    return byUnit ? size / kStepsPerView : size * (kStepsPerView - 1) / kStepsPerView;
}

void ScrollGrid::GetScrollBox(Rect *box) { GetBox(box); }

void ScrollGrid::LocalOffset(Point *p) {
    GlogPane::LocalOffset(p);
    short &place = Along().Place(*p);
    place = static_cast<short>(place + scrollOffset);
}

// Scrolling

void ScrollGrid::ScrollTo(int position) { ScrollGuts(position); }

int ScrollGrid::Scroll(int distance) {
    return ScrollGuts(Saturated(static_cast<long long>(scrollOffset) + distance));
}

int ScrollGrid::ScrollGuts(int position) {
    int const greatest = GetMaxScroll(), old = scrollOffset;
    scrollOffset = Clamped(position, greatest);
    int const moved = scrollOffset - old;
    if (moved != 0) {
        PaneWatch const watch(this); // members that hear of it, and whatever is drawn, may do away with it
        PanePositionChanged();
        if (!watch.PaneExists())
            return moved;
        if (UseScrollRect(moved)) {
            Prepare();
            Rect box;
            GetScrollBox(&box);
            if (HasFrame())
                VelaDrawing::InsetRect(&box, 1, 1);
            MovePixels(box, Along(), moved);
        } else {
            Inval();
        }
        if (slaved)
            return moved;
        UpdateGlog(GetGlog());
        if (!watch.PaneExists())
            return moved;
    }
    if (slaved)
        return moved;
    if ((moved != 0 || alwaysUpdateScrollbar) && scrollbar)
        scrollbar->Set(scrollOffset, BarRange(greatest));
    return moved;
}

void ScrollGrid::MovePixels(Rect const &box, SingleAxis axis, int distance) {
    OS::Size const shift = axis.IsVertical() ? OS::Size(0, -distance) : OS::Size(-distance, 0);
    OSPort::Current().ScrollRect(box, shift);
}

char ScrollGrid::UseScrollRect(int distance) {
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    return GetGlog() && port == GetGlog()->GetPort() && 2 * std::llabs(distance) < BoxLength(Along());
}

bool ScrollGrid::CanScroll(int direction) {
    if (direction < 0)
        return scrollOffset > 0;
    return direction > 0 && scrollOffset < GetMaxScroll();
}

void ScrollGrid::SetScrollOffset(int offset) {
    scrollOffset = offset;
    PanePositionChanged();
}

// The grid's box counts in its container's coordinates and the members' boxes in the grid's own: where a grid
// does not lie at the start of its container, what is taken as the view's end lies as much too far.
void ScrollGrid::RevealSubpanes(std::vector<GlogPane *> const &panes) {
    SingleAxis const along = Along();
    int low = std::numeric_limits<short>::max(), high = std::numeric_limits<short>::min();
    int viewEnd = 0;
    for (GlogPane *pane : panes) {
        Rect box, own;
        pane->GetBox(&box);
        GetBox(&own);
        low = std::min<int>(low, along.Start(box));
        high = std::max<int>(high, along.End(box));
        viewEnd = along.Start(own) + BoxLength(along) + scrollOffset;
    }
    if (viewEnd <= scrollOffset || high <= low)
        return;
    if (low < scrollOffset)
        ScrollTo(low);
    else if (high > viewEnd)
        ScrollTo(high - low <= BoxLength(along) ? scrollOffset + high - viewEnd : low);
}

void ScrollGrid::ScrollTillVisible(GlogPane *pane) { RevealSubpanes(std::vector<GlogPane *>(1, pane)); }

// Changes of size

void ScrollGrid::UpdateScrollInfo() {
    if (slaved)
        return;
    int const greatest = GetMaxScroll();
    if (greatest == 0 || scrollOffset > greatest)
        ScrollTo(greatest);
    else if (scrollbar)
        scrollbar->Set(scrollOffset, greatest);
}

short ScrollGrid::Add(GlogPane *pane, short position) {
    short const index = Grid::Add(pane, position);
    if (index >= 0)
        UpdateScrollInfo();
    return index;
}

void ScrollGrid::Del(short index) {
    if (index < 0 || index >= NumSubpanes())
        return;
    Grid::Del(index);
    UpdateScrollInfo();
}

void ScrollGrid::Resize(Point) {
    Rect oldBox;
    GetBox(&oldBox);
    GlogPane::CalcBox();
    InvalidateUncovered(oldBox);
}

void ScrollGrid::AutoResize(short dh, short dv) {
    Rect oldBox;
    GetBox(&oldBox);
    CompoundPane::AutoResize(dh, dv);
    InvalidateUncovered(oldBox);
}

// What the box has left.
void ScrollGrid::InvalidateUncovered(Rect const &oldBox) {
    Rect newBox;
    GetBox(&newBox);
    TempRgn const oldRegion, newRegion, uncovered;
    VelaDrawing::RectRgn(oldRegion, &oldBox);
    VelaDrawing::RectRgn(newRegion, &newBox);
    VelaDrawing::DiffRgn(oldRegion, newRegion, uncovered);
    Prepare();
    VelaDrawing::InvalRgn(uncovered);
    supressGridUpdate = true;
    PaneWatch const watch(this);
    UpdateScrollInfo();
    if (watch.PaneExists())
        supressGridUpdate = false;
}

void ScrollGrid::SetSupressGridUpdate(bool suppress) { supressGridUpdate = suppress; }

void ScrollGrid::SetSupressSBarUpdate(bool suppress) { supressSBarUpdate = suppress; }

// The bar

void ScrollGrid::SetScrollbar(ScrollBarPane *bar) {
    LetGoOfScrollbar();
    scrollbar = bar;
    if (!bar)
        return;
    bar->SetClient(this);
    PaneWatch const watch(this);
    UpdateScrollInfo(); // which may draw, and so do away with the grid or the bar
    if (watch.PaneExists() && scrollbar.Get() == bar)
        DependUpon(bar);
}

void ScrollGrid::LetGoOfScrollbar() {
    if (!scrollbar)
        return;
    Provider<ScrollBarPane_Listener> &provider = *scrollbar.Get();
    if (provider.HasDependents())
        provider.RemoveDependent(this);
    scrollbar->SetClient(nullptr);
    scrollbar = nullptr;
}

void ScrollGrid::ScrollBarPaneDying() { LetGoOfScrollbar(); }

void ScrollGrid::GetScrollbarBounds(Rect *box) {
    if (scrollbar)
        scrollbar->GetBox(box);
}

void ScrollGrid::SetScrollbarBounds(Rect *box) {
    if (scrollbar)
        scrollbar->SetBox(box);
}

int ScrollGrid::GetMaxScrollValue(ScrollBarPane *) { return GetMaxScroll(); }

void ScrollGrid::ScrollTo(ScrollBarPane *, int position) {
    Prepare();
    ScrollTo(position);
}

double ScrollGrid::GetThumbRatio(ScrollBarPane *) {
    short const size = ListLength(Along());
    return size > 0 ? static_cast<double>(BoxLength(Along())) / size : 0.0;
}

void ScrollGrid::StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) {
    amount = ScrollDelta(byUnit);
    multiplier = 1;
}

void ScrollGrid::Scroll(ScrollBarPane *, int &amount, int &multiplier) {
    Scroll(Saturated(static_cast<long long>(amount) * multiplier));
    if (multiplier < kFastest)
        ++multiplier;
}

CustomEventHandler *ScrollGrid::CanHandleCustomEvent(UIEvent *event) {
    return IsMouseWheelEvent(*event) ? new (std::nothrow) ScrollGridMouseWheelHandler(this) : nullptr;
}

// Guards

WithScrollGridSuppressGridUpdate::WithScrollGridSuppressGridUpdate(ScrollGrid *grid_, bool suppress)
    : before(grid_->GetSupressGridUpdate()) {
    grid = grid_;
    grid->SetSupressGridUpdate(suppress);
}

WithScrollGridSuppressGridUpdate::~WithScrollGridSuppressGridUpdate() {
    if (grid)
        grid->SetSupressGridUpdate(before);
}

WithScrollGridSuppressSBarUpdate::WithScrollGridSuppressSBarUpdate(ScrollGrid *grid_, bool suppress)
    : before(grid_->GetSupressSBarUpdate()) {
    grid = grid_;
    grid->SetSupressSBarUpdate(suppress);
}

WithScrollGridSuppressSBarUpdate::~WithScrollGridSuppressSBarUpdate() {
    if (grid)
        grid->SetSupressSBarUpdate(before);
}

WithScrollGridSuppressUpdates::WithScrollGridSuppressUpdates(ScrollGrid *grid, bool suppress)
    : gridUpdate(grid, suppress)
    , barUpdate(grid, suppress) {}
