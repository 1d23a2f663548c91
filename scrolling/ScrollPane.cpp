#include "scrolling/ScrollPane.h"
#include "host/CustomEventHandler.h"
#include "host/PaneWatch.h"
#include "host/UIEvent.h"
#include "scrolling/Truncation.h"
#include "scrolling/WheelAxis.h"
#include <algorithm>
#include <cmath>
#include <new>

namespace {

int const kArrowStep = 10;     // pixels
double const kPageShare = 0.9; // of the box
int const kPixelsPerWheelUnit = 5;

int Clamped(int position, int greatest) { return position < 0 ? 0 : std::min(greatest, position); }

// To the nearest whole number, halves away from 0.
int Rounded(int number) {
    double const nearest = number > 0 ? std::floor(number + 0.5) : std::ceil(number - 0.5);
    return static_cast<int>(nearest);
}

// Where the view lies in its area; its ends stand for themselves.
struct ViewPlace {
    ViewPlace(int position, int greatest, int boxLength, int areaLength)
        : atStart(position == 0)
        , atEnd(!atStart && position == greatest)
        , middle((position + 0.5 * boxLength) / areaLength) {}

    int PositionIn(int areaLength, int greatest, int boxLength) const {
        if (atStart)
            return 0;
        if (atEnd)
            return greatest;
        return Truncated(areaLength * middle - 0.5 * boxLength);
    }

    bool atStart, atEnd;
    double middle; // over the area's length
};

} // namespace

struct ScrollPaneMouseWheelHandler : CustomEventHandler {
    explicit ScrollPaneMouseWheelHandler(ScrollPane *scrolled)
        : pane(scrolled) {}

    bool HandleEvent(UIEvent *event) override {
        boost::shared_ptr<UIEvent::MouseWheelParams> const wheel = event->GetMouseWheelParams();
        return pane->TurnWheel(wheel->axis, Truncated(wheel->delta));
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) ScrollPaneMouseWheelHandler(pane); }

private:
    ScrollPane *pane;
};

ScrollPane::ScrollPane(glogRec *owner)
    : virtualHeight(0)
    , virtualWidth(0)
    , hScrollPos(0)
    , vScrollPos(0) {
    CompoundPaneInit(owner, 0);
}

ScrollPane::~ScrollPane() {
    if (hScrollBar)
        hScrollBar->SetClient(nullptr);
    if (vScrollBar)
        vScrollBar->SetClient(nullptr);
}

// Positions

int ScrollPane::GetMaxHScrollValue() { return virtualWidth - ItemWidth(); }

int ScrollPane::GetMaxVScrollValue() { return virtualHeight - ItemHeight(); }

int ScrollPane::GetScrollDelta() const { return kArrowStep; }

void ScrollPane::SetHScrollPos(int position) {
    hScrollPos = Clamped(position, GetMaxHScrollValue());
    if (hScrollBar)
        hScrollBar->Set(hScrollPos, GetMaxHScrollValue());
    Inval();
    PanePositionChanged();
}

void ScrollPane::SetVScrollPos(int position) {
    vScrollPos = Clamped(position, GetMaxVScrollValue());
    if (vScrollBar)
        vScrollBar->Set(vScrollPos, GetMaxVScrollValue());
    Inval();
    PanePositionChanged();
}

void ScrollPane::HScroll(int delta) {
    if (hScrollBar)
        SetHScrollPos(Saturated(static_cast<long long>(hScrollPos) + delta));
}

void ScrollPane::VScroll(int delta) {
    if (vScrollBar)
        SetVScrollPos(Saturated(static_cast<long long>(vScrollPos) + delta));
}

void ScrollPane::LocalOffset(Point *p) {
    GlogPane::LocalOffset(p);
    p->v = static_cast<short>(p->v + vScrollPos);
    p->h = static_cast<short>(p->h + hScrollPos);
}

// Sizes

void ScrollPane::SetBox(Rect *box) {
    PaneWatch const watch(this); // subpanes that hear of it may do away with it
    GlogPane::SetBox(box);
    if (!watch.PaneExists())
        return;
    virtualHeight = std::max(virtualHeight, box->bottom - box->top);
    virtualWidth = std::max(virtualWidth, box->right - box->left);
    SetVScrollPos(vScrollPos);
    if (watch.PaneExists())
        SetHScrollPos(hScrollPos);
}

void ScrollPane::SetVirtualHeight(int size) {
    int const boxHeight = ItemHeight();
    size = std::max(size, boxHeight);
    if (size == virtualHeight)
        return;
    ViewPlace const view(vScrollPos, GetMaxVScrollValue(), boxHeight, virtualHeight);
    virtualHeight = size;
    SetVScrollPos(Rounded(view.PositionIn(size, GetMaxVScrollValue(), boxHeight)));
}

void ScrollPane::SetVirtualWidth(int size) {
    int const boxWidth = ItemWidth();
    size = std::max(size, boxWidth);
    if (size == virtualWidth)
        return;
    ViewPlace const view(hScrollPos, GetMaxHScrollValue(), boxWidth, virtualWidth);
    virtualWidth = size;
    SetHScrollPos(Rounded(view.PositionIn(size, GetMaxHScrollValue(), boxWidth)));
}

// Bars

void ScrollPane::SetHScrollBar(ScrollBarPane *bar) {
    if (bar == hScrollBar.Get())
        return;
    if (hScrollBar)
        hScrollBar->SetClient(nullptr);
    hScrollBar = bar;
    if (bar)
        bar->SetClient(this);
}

void ScrollPane::SetVScrollBar(ScrollBarPane *bar) {
    if (bar == vScrollBar.Get())
        return;
    if (vScrollBar)
        vScrollBar->SetClient(nullptr);
    vScrollBar = bar;
    if (bar)
        bar->SetClient(this);
}

bool ScrollPane::IsHScrollBar(ScrollBarPane const *bar) const { return bar && bar == hScrollBar.Get(); }

bool ScrollPane::IsVScrollBar(ScrollBarPane const *bar) const { return bar && bar == vScrollBar.Get(); }

int ScrollPane::GetMaxScrollValue(ScrollBarPane *bar) {
    if (IsHScrollBar(bar))
        return GetMaxHScrollValue();
    return IsVScrollBar(bar) ? GetMaxVScrollValue() : 0;
}

double ScrollPane::GetThumbRatio(ScrollBarPane *bar) {
    if (IsHScrollBar(bar))
        return static_cast<double>(ItemWidth()) / virtualWidth;
    return IsVScrollBar(bar) ? static_cast<double>(ItemHeight()) / virtualHeight : 0.0;
}

void ScrollPane::ScrollTo(ScrollBarPane *bar, int position) {
    if (IsHScrollBar(bar))
        SetHScrollPos(position);
    else
        SetVScrollPos(position);
}

void ScrollPane::Scroll(ScrollBarPane *bar, int &amount, int &multiplier) {
    int const position = IsHScrollBar(bar) ? hScrollPos : vScrollPos;
    ScrollTo(bar, Saturated(static_cast<long long>(amount) * multiplier + position));
}

void ScrollPane::StartScrolling(ScrollBarPane *bar, bool byUnit, int &amount, int &multiplier) {
    if (byUnit)
        amount = GetScrollDelta();
    else
        amount = Truncated(kPageShare * (IsHScrollBar(bar) ? ItemWidth() : ItemHeight()));
    multiplier = 1;
}

// Wheel

CustomEventHandler *ScrollPane::CanHandleCustomEvent(UIEvent *event) {
    return IsMouseWheelEvent(*event) ? new (std::nothrow) ScrollPaneMouseWheelHandler(this) : nullptr;
}

bool ScrollPane::TurnWheel(int axis, int delta) {
    long long const distance = -static_cast<long long>(delta) * kPixelsPerWheelUnit;
    switch (axis) {
    case kWheelHorizontal:
        if (hScrollBar)
            SetHScrollPos(Saturated(hScrollPos + distance));
        return true;
    case kWheelVertical:
        if (vScrollBar)
            SetVScrollPos(Saturated(vScrollPos + distance));
        return true;
    default:
        return false;
    }
}
