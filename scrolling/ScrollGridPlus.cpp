#include "scrolling/ScrollGridPlus.h"
#include "host/CustomEventHandler.h"
#include "host/PaneWatch.h"
#include "host/UIEvent.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "scrolling/WheelAxis.h"
#include <algorithm>
#include <limits>
#include <new>

namespace {

double const kStepsPerWheelUnit = 2.0;

} // namespace

struct ScrollGridPlusMouseWheelHandler : CustomEventHandler {
    explicit ScrollGridPlusMouseWheelHandler(ScrollGridPlus *scrolled)
        : grid(scrolled) {}

    bool HandleEvent(UIEvent *event) override {
        boost::shared_ptr<UIEvent::MouseWheelParams> const wheel = event->GetMouseWheelParams();
        if (wheel->axis != kWheelHorizontal && wheel->axis != kWheelVertical)
            return false;
        int const turned = Truncated(kStepsPerWheelUnit * wheel->delta);
        int const distance = -std::max(turned, -std::numeric_limits<int>::max());
        if (grid->IsVerticalGrid() == (wheel->axis == kWheelVertical))
            static_cast<ScrollGrid *>(grid)->Scroll(distance);
        else
            grid->LateralScroll(distance);
        return true;
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) ScrollGridPlusMouseWheelHandler(grid); }

private:
    ScrollGridPlus *grid;
};

ScrollGridPlus::ScrollGridPlus(glogRec *owner, short id, ScrollBarPane *main, ScrollBarPane *lateral)
    : ScrollGrid(owner, id, main)
    , lateralScrollOffset(0)
    , maxLateralScroll(0)
    , proxy(this)
    , stickToEnd(false) {
    SetLateralScrollbar(lateral);
}

ScrollGridPlus::~ScrollGridPlus() { SetLateralScrollbar(nullptr); }

void ScrollGridPlus::SetLateralScrollbar(ScrollBarPane *bar) {
    if (lateralScrollbar)
        lateralScrollbar->SetClient(nullptr);
    lateralScrollbar = bar;
    if (bar)
        bar->SetClient(&proxy);
}

int ScrollGridPlus::GetMaxLateralScroll() { return MaxScroll(Across()); }

int ScrollGridPlus::LateralScrollDelta(char byUnit) { return byUnit ? 1 : BoxLength(Across()) * 4 / 5; }

void ScrollGridPlus::LateralScrollTo(int position) { LateralScrollGuts(position); }

void ScrollGridPlus::LateralScroll(int distance) {
    LateralScrollGuts(Saturated(static_cast<long long>(lateralScrollOffset) + distance));
}

void ScrollGridPlus::LateralScrollGuts(int position) {
    Prepare();
    int const greatest = GetMaxLateralScroll(), old = lateralScrollOffset;
    maxLateralScroll = greatest;
    lateralScrollOffset = std::max(std::min(position, greatest), 0);
    if (lateralScrollOffset != old) {
        PaneWatch const watch(this);
        PanePositionChanged();
        if (!watch.PaneExists())
            return;
        if (!GetSupressGridUpdate()) {
            Rect box;
            GetScrollBox(&box);
            if (GetGlog())
                MovePixels(box, Across(), lateralScrollOffset - old);
            UpdateGlog(GetGlog());
            if (!watch.PaneExists())
                return;
        } else {
            Inval();
        }
    }
    if (lateralScrollbar)
        lateralScrollbar->Set(lateralScrollOffset, BarRange(greatest));
}

void ScrollGridPlus::SetLateralScrollOffset(int offset) {
    lateralScrollOffset = offset;
    PanePositionChanged();
}

void ScrollGridPlus::LocalOffset(Point *p) {
    ScrollGrid::LocalOffset(p);
    short &place = Across().Place(*p);
    place = static_cast<short>(place + lateralScrollOffset);
}

void ScrollGridPlus::UpdateScrollInfo() {
    PaneWatch const watch(this);
    bool const suppressed = GetSupressGridUpdate();
    SetSupressGridUpdate(true);
    ScrollGrid::UpdateScrollInfo();
    if (!watch.PaneExists())
        return;
    SetSupressGridUpdate(suppressed);

    int const greatest = GetMaxLateralScroll();
    if (stickToEnd)
        KeepDistanceFromEnd(greatest);
    if (!watch.PaneExists())
        return;
    if (greatest == 0 || lateralScrollOffset > greatest)
        LateralScrollTo(greatest);
    else if (lateralScrollbar)
        lateralScrollbar->Set(lateralScrollOffset, greatest);
}

void ScrollGridPlus::KeepDistanceFromEnd(int greatest) {
    PaneWatch const watch(this);
    int const distance = maxLateralScroll - lateralScrollOffset;
    if (distance >= 0) {
        int const wanted = std::max(greatest - distance, 0);
        if (wanted != lateralScrollOffset)
            LateralScrollTo(wanted);
    }
    if (watch.PaneExists())
        maxLateralScroll = greatest;
}

CustomEventHandler *ScrollGridPlus::CanHandleCustomEvent(UIEvent *event) {
    return IsMouseWheelEvent(*event) ? new (std::nothrow) ScrollGridPlusMouseWheelHandler(this) : nullptr;
}

// The lateral bar's client

int ScrollGridPlus::Proxy::GetMaxScrollValue(ScrollBarPane *) { return owner->GetMaxLateralScroll(); }

void ScrollGridPlus::Proxy::ScrollTo(ScrollBarPane *, int position) {
    owner->Prepare();
    owner->LateralScrollTo(position);
}

double ScrollGridPlus::Proxy::GetThumbRatio(ScrollBarPane *) {
    SingleAxis const across = owner->Across();
    return static_cast<double>(owner->BoxLength(across)) / owner->ListLength(across);
}

void ScrollGridPlus::Proxy::StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) {
    amount = owner->LateralScrollDelta(byUnit);
    multiplier = 1;
}

void ScrollGridPlus::Proxy::Scroll(ScrollBarPane *, int &amount, int &multiplier) {
    owner->LateralScroll(Saturated(static_cast<long long>(amount) * multiplier));
}
