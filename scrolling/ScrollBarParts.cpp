#include "scrolling/ScrollBarParts.h"
#include "host/EventRecordAdapter.h"
#include "host/MouseTask.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {

short const kFamily = 1000;
short const kStates = 1, kDownStates = 1, kDisabledStates = 1;
short const kThumbBreadth = 16;         // pixels
double const kPageRepeatInterval = 0.1; // seconds
int const kNothingToReport = -1;

} // namespace

// Arrow

ScrollBarPane::ArrowPane::ArrowPane(glogRec *owningGlog, Orientation orientation, ScrollDirection towards,
                                    ScrollBarPane *bar)
    : direction(towards)
    , owner(bar) {
    short const icon = owner->GetArrowIconID(orientation, direction);
    if (!GIconButtonPaneInit(owningGlog, 0, kFamily, icon, kStates, kDownStates, kDisabledStates))
        return;
    SetDisabledIconsAfterDownStateIcons();
    SetCanDisable(true);
    Disable();
}

short ScrollBarPane::ArrowPane::ClickAction(int modifiers) {
    PaneWatch const watch(this);
    owner->BeginScrolling(false, direction);
    return watch.PaneExists() ? GIconButtonPane::ClickAction(modifiers) : short(0);
}

int ScrollBarPane::ArrowPane::ReleaseAction() {
    owner->EndScrolling();
    return kNothingToReport;
}

void ScrollBarPane::ArrowPane::DoButtonPress(int) { owner->ContinueScrolling(direction); }

// Dragging the thumb

class ScrollBarPane::ThumbScrollMouseTask : public MouseTask {
public:
    ThumbScrollMouseTask(ThumbPane *thumb_, ScrollBarPane *bar_)
        : MouseTask(0)
        , thumb(thumb_)
        , bar(bar_)
        , grabOffset(0) {}

    void MouseTaskBegin() override;
    void MouseTaskContinue(Point const &) override;
    void MouseTaskEnd() override { bar->EndScrolling(); }

private:
    bool FindPosition(Point const &, int &position) const;

    ThumbPane *thumb;
    ScrollBarPane *bar;
    int grabOffset; // from the thumb's start to where the mouse took hold of it
};

void ScrollBarPane::ThumbScrollMouseTask::MouseTaskBegin() {
    SingleAxis const along = thumb->Along();
    grabOffset = along.Place(GetStartPoint()) - along.Start(thumb->GetThumbRect());
}

// The thumb's length is asked for anew each time: the client may change it meanwhile. False when the client
// has done away with the bar.
bool ScrollBarPane::ThumbScrollMouseTask::FindPosition(Point const &where, int &position) const {
    SingleAxis const along = thumb->Along();
    Rect const thumbRect = thumb->GetThumbRect(), bounds = thumb->GetBounds();
    int const room = along.Length(bounds) - along.Length(thumbRect);
    PaneWatch const watch(bar);
    int const greatest = bar->client->GetMaxScrollValue(bar);
    if (!watch.PaneExists())
        return false;
    int const offset = along.Place(where) - along.Start(bounds) - grabOffset;
    int const travel = std::max(std::min(offset, room), 0);
    int const wanted = room == 0 ? 0 : Truncated(static_cast<double>(travel) / room * greatest);
    position = std::max(std::min(wanted, greatest), 0);
    return true;
}

// How far away the mouse is across the bar does not matter.
void ScrollBarPane::ThumbScrollMouseTask::MouseTaskContinue(Point const &where) {
    int newPosition = 0;
    if (!bar->client || !FindPosition(where, newPosition)) // it went away while it was scrolled
        return;
    if (newPosition == bar->position || !bar->Announce())
        return;
    PaneWatch const watch(bar);
    bar->client->ScrollTo(bar, newPosition);
    if (watch.PaneExists())
        UpdateGlog(bar->GetGlog());
}

// Scrolling by pages

class ScrollBarPane::PageScrollMouseTask : public MouseTask {
public:
    PageScrollMouseTask(ThumbPane *thumb_, ScrollBarPane *bar_)
        : MouseTask(0)
        , thumb(thumb_)
        , bar(bar_) {
        SetSleepTime(kPageRepeatInterval);
    }

    void MouseTaskBegin() override { bar->BeginScrolling(true, DirectionTo(GetStartPoint())); }
    void MouseTaskContinue(Point const &) override;
    void MouseTaskEnd() override { bar->EndScrolling(); }

private:
    ScrollDirection DirectionTo(Point const &) const;

    ThumbPane *thumb;
    ScrollBarPane *bar;
};

ScrollBarPane::ScrollDirection ScrollBarPane::PageScrollMouseTask::DirectionTo(Point const &where) const {
    SingleAxis const along = thumb->Along();
    return along.Place(where) > along.Start(thumb->GetThumbRect()) ? kTowardEnd : kTowardStart;
}

void ScrollBarPane::PageScrollMouseTask::MouseTaskContinue(Point const &where) {
    Rect const bounds = thumb->GetBounds(), thumbRect = thumb->GetThumbRect();
    if (!VelaDrawing::PtInRect(where, &bounds))
        return;
    if (VelaDrawing::PtInRect(where, &thumbRect))
        return; // the thumb has come under the mouse
    PaneWatch const watch(bar);
    bar->ContinueScrolling(DirectionTo(where));
    if (watch.PaneExists())
        UpdateGlog(bar->GetGlog());
}

// Thumb

ScrollBarPane::ThumbPane::ThumbPane(glogRec *owningGlog, Orientation barOrientation, ScrollBarPane *bar)
    : orientation(barOrientation)
    , enabled(false)
    , owner(bar) {
    GlogPaneInit(owningGlog, 0);
}

int ScrollBarPane::ThumbPane::GetThumbLength() const {
    int const least = owner->GetMinThumbLength();
    if (!owner->client)
        return least;
    int const length = Along().Length(GetBounds());
    int const wanted = Truncated(length * owner->client->GetThumbRatio(owner));
    return wanted < least ? least : std::min(wanted, length);
}

Rect ScrollBarPane::ThumbPane::GetThumbRect() const {
    SingleAxis const along = Along(), across = along.Across();
    Rect rect = GetBounds();
    int const thumbLength = GetThumbLength();
    int const room = along.Length(rect) - thumbLength;
    int const offset =
        owner->range == 0 ? 0 : Truncated(static_cast<double>(owner->position) / owner->range * room);
    int const last = along.End(rect) - thumbLength;
    // Not kept from lying before the trough, as a position below 0 has it.
    long long const start = std::min<long long>(static_cast<long long>(along.Start(rect)) + offset, last);
    along.Start(rect) = Pixel16(start);
    along.End(rect) = Pixel16(start + thumbLength);
    across.End(rect) = Pixel16(across.Start(rect) + kThumbBreadth);
    return rect;
}

int ScrollBarPane::ThumbPane::HandleClick(EventRecordAdapter *event) {
    if (!enabled)
        return kNothingToReport;
    Point const where = event->where;
    Rect const thumbRect = GetThumbRect();
    if (VelaDrawing::PtInRect(where, &thumbRect)) {
        ThumbScrollMouseTask task(this, owner);
        TrackMouse(task, where);
    } else {
        PageScrollMouseTask task(this, owner);
        TrackMouse(task, where);
    }
    return kNothingToReport;
}

void ScrollBarPane::ThumbPane::DrawGuts(OSRgn *updateRegion) {
    owner->DrawThumbArea(updateRegion, enabled, GetBounds(), GetThumbRect());
}
