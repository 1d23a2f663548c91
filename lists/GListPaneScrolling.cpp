// The list as client of a bar, the wheel, and ways to a row.
#include "host/CustomEventHandler.h"
#include "host/UIEvent.h"
#include "lists/GListPane.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/Truncation.h"
#include "scrolling/WheelAxis.h"
#include <algorithm>
#include <new>

namespace {

int const kArrowDelay = 5;  // ticks
int const kKeptByAPage = 2; // rows that show before it and after it
int const kOneRow = 1;

} // namespace

struct GListMouseWheelHandler : CustomEventHandler {
    explicit GListMouseWheelHandler(GListPane *scrolled)
        : list(scrolled) {}

    // A wheel across the list is left to others.
    bool HandleEvent(UIEvent *event) override {
        boost::shared_ptr<UIEvent::MouseWheelParams> const wheel = event->GetMouseWheelParams();
        if (wheel->axis != kWheelVertical)
            return false;
        long long const rows = Truncated(wheel->delta);
        list->SetScrollPosition(Saturated(list->GetScrollPos() - rows));
        return true;
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) GListMouseWheelHandler(list); }

private:
    GListPane *list;
};

CustomEventHandler *GListPane::CanHandleCustomEvent(UIEvent *event) {
    if (inhibitScrolling || !IsMouseWheelEvent(*event))
        return nullptr;
    return new (std::nothrow) GListMouseWheelHandler(this);
}

// Below 0 when all rows fit.
int GListPane::MaxTop() { return Saturated(0LL + numItems - NumFullyDisplayedLines()); }

void GListPane::SetScrollPosition(int position) {
    ScrollBarPane *const bar = GetScrollBar();
    if (!bar && !scrollWithNoBar)
        return;
    int const greatest = std::max(MaxTop(), 0);
    int const target = std::clamp(position, 0, greatest);
    if (bar)
        bar->Set(target, greatest);
    topLine = target;
    Inval();
}

int GListPane::GetMaxScrollValue(ScrollBarPane *) { return MaxTop(); }

void GListPane::ScrollTo(ScrollBarPane *, int position) { SetScrollPosition(position); }

double GListPane::GetThumbRatio(ScrollBarPane *) {
    return static_cast<double>(NumFullyDisplayedLines()) / numItems;
}

void GListPane::StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) {
    amount = byUnit ? kOneRow : std::max(numDisplayed - kKeptByAPage, kOneRow);
    multiplier = 1;
}

void GListPane::Scroll(ScrollBarPane *, int &amount, int &) {
    SetScrollPosition(Saturated(0LL + topLine + amount));
}

int GListPane::GetArrowScrollDelay() { return kArrowDelay; }

void GListPane::PageTillVisible(int line) { PageTillVisible(line, line); }

// Rows that fit come in with one more row as air.
void GListPane::PageTillVisible(int first, int last) {
    long long const top = topLine, bottom = top + numFullLines - 1;
    bool const shows = first >= top && last <= bottom;
    bool const fillsTheView = first <= top && last >= bottom;
    if (shows || fillsTheView)
        return;
    int const air = 0LL + last - first < numFullLines - 1 ? 1 : 0;
    if (last >= bottom)
        SetScrollPosition(Saturated(0LL + first - air));
    else
        SetScrollPosition(Saturated(0LL + last - numFullLines + 1 + air));
}
