#include "scrolling/ScrollBarPane.h"
#include "frame/ResourceReading.h"
#include "host/CustomEventHandler.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/UIEvent.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/CurrentTick.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarParts.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <limits>
#include <memory>
#include <new>

namespace {

short const kBreadthAtGlogEdge = 16; // pixels, whatever GetScrollBarWidth says
int const kAtEnd = -1;

void SetAttribute(GlogLayoutItem &item, GlogLayoutItem::Attribute attribute, int value) {
    item.SetAttribute(attribute, value, GlogLayoutItem::kPixels, UString());
}

GlogLayoutItem::Attribute LengthAttribute(SingleAxis axis) {
    return axis.IsVertical() ? GlogLayoutItem::kHeight : GlogLayoutItem::kWidth;
}

ScrollBarPane *AttachedOrNull(std::unique_ptr<ScrollBarPane> bar) {
    return bar && bar->GetGlog() ? bar.release() : nullptr;
}

} // namespace

// The wheel turns the bar by its delta, whichever axis it has.
struct ScrollBarPaneMouseWheelHandler : CustomEventHandler {
    explicit ScrollBarPaneMouseWheelHandler(ScrollBarPane *bar)
        : pane(bar) {}

    bool HandleEvent(UIEvent *event) override {
        int const delta = Truncated(event->GetMouseWheelParams()->delta);
        pane->Scroll(-std::max(delta, -std::numeric_limits<int>::max()));
        return true;
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) ScrollBarPaneMouseWheelHandler(pane); }

private:
    ScrollBarPane *pane;
};

// Making

ScrollBarPane::ScrollBarPane()
    : orientation(kVertical)
    , flags(0)
    , edgeH(0)
    , edgeV(0)
    , position(0)
    , range(0)
    , client(nullptr)
    , scrollAmount(0)
    , scrollMultiplier(0)
    , repeatDelay(0)
    , nextRepeatTick(0)
    , upArrow(nullptr)
    , downArrow(nullptr)
    , thumb(nullptr)
    , enabled(false)
    , activeInBackground(false) {}

ScrollBarPane::ScrollBarPane(glogRec *owner, short barFlags, short barEdgeH, short barEdgeV)
    : ScrollBarPane() {
    sbarResRec record = {sbarResRec::kType, barFlags, {0, 0, 0, 0}, barEdgeH, barEdgeV};
    InitScrollBarPane(owner, &record, 0);
}

ScrollBarPane *ScrollBarPane::NewScrollBarPane(glogRec *owner, sbarResRec *record) {
    std::unique_ptr<ScrollBarPane> bar(new (std::nothrow) ScrollBarPane);
    if (bar)
        bar->InitScrollBarPane(owner, record, 0);
    return AttachedOrNull(std::move(bar));
}

ScrollBarPane *ScrollBarPane::NewScrollBarPane(glogRec *owner, GlogStyleSheet *sheet) {
    auto const number = [sheet](char const *key) {
        return static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey(key)));
    };
    sbarResRec record = {sbarResRec::kType, number("Flags"), OptionalRect(sheet->GetItemRes(), "BoundsRect"),
                         number("EdgeH"), number("EdgeV")};
    return NewScrollBarPane(owner, &record);
}

void ScrollBarPane::InitScrollBarPane(glogRec *owner, sbarResRec *record, short id) {
    if (!CompoundPaneInit(owner, id))
        return;
    SetNoErase(true);
    flags = record->flags;
    edgeH = record->edgeH;
    edgeV = record->edgeV;
    SetUseLayout(true);
    orientation = flags & kHorizontalBar ? kHorizontal : kVertical;
    AddParts();
    SetUpBounds(record->bounds);
}

// In the order up arrow, thumb, down arrow; where the platform wants both arrows at the far end, the thumb
// comes first.
void ScrollBarPane::AddParts() {
    RCPtr<GlogLayoutGroup> const group(new GlogLayoutGroup(!IsHorizontal()));
    bool const arrowsTogether = OS::Services::ScrollArrowsTogetherAtEnd();
    upArrow = new ArrowPane(GetGlog(), orientation, kTowardStart, this);
    Add(upArrow, kAtEnd);
    if (!arrowsTogether)
        group->MoveItem(upArrow->GetLayoutRect(), kAtEnd);
    thumb = new ThumbPane(GetGlog(), orientation, this);
    Add(thumb, kAtEnd);
    group->MoveItem(thumb->GetLayoutRect(), kAtEnd);
    downArrow = new ArrowPane(GetGlog(), orientation, kTowardEnd, this);
    Add(downArrow, kAtEnd);
    if (arrowsTogether)
        group->MoveItem(upArrow->GetLayoutRect(), kAtEnd);
    group->MoveItem(downArrow->GetLayoutRect(), kAtEnd);
    GetLayout()->MoveItem(group, kAtEnd);
    ArrangeParts(*group);
}

// A border that lies outside the bounds leaves its room to the parts, across the bar and, at the start, along
// it.
void ScrollBarPane::ArrangeParts(GlogLayoutGroup &group) {
    GlogLayoutItem::Attribute const length = LengthAttribute(Along()),
                                    breadth = LengthAttribute(Along().Across());
    SetAttribute(*upArrow->GetLayoutRect(), length, GetArrowPaneLength());
    SetAttribute(*downArrow->GetLayoutRect(), length, GetArrowPaneLength());

    int const across = GetScrollBarWidth() - 2 * GetFrameWidth() + BordersOutside();
    for (GlogPane *part : {static_cast<GlogPane *>(upArrow), static_cast<GlogPane *>(downArrow),
                           static_cast<GlogPane *>(thumb)})
        SetAttribute(*part->GetLayoutRect(), breadth, across);

    bool const startBorderInside = !(flags & kStartBorderOutside);
    if (IsHorizontal() || startBorderInside)
        SetAttribute(group, GlogLayoutItem::kInsetTop, GetFrameWidth());
    if (!IsHorizontal() || startBorderInside)
        SetAttribute(group, GlogLayoutItem::kInsetLeft, GetFrameWidth());
    SetAttribute(*GetLayoutRect(), breadth, GetScrollBarWidth());
}

// Tells the listeners; the client is not told.
ScrollBarPane::~ScrollBarPane() {
    if (!Provider<ScrollBarPane_Listener>::HasDependents())
        return;
    Message0<ScrollBarPane_Listener> const dying(&ScrollBarPane_Listener::ScrollBarPaneDying);
    Provider<ScrollBarPane_Listener>::BroadcastChange(dying, nullptr);
}

// Bounds

SingleAxis ScrollBarPane::Along() const { return SingleAxis(!IsHorizontal()); }

int ScrollBarPane::BordersOutside() const {
    return (flags & kEndBorderOutside ? 1 : 0) + (flags & kStartBorderOutside ? 1 : 0);
}

void ScrollBarPane::SetUpBounds(Rect bounds) {
    SetBox(&bounds);
    DoEdgeCalc();
}

void ScrollBarPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    if (!thumb)
        return; // not set up yet
    Rect inner = *box;
    VelaDrawing::InsetRect(&inner, 1, 1);
    int const troughLength = Along().Length(inner) - 2 * GetArrowPaneLength() + BordersOutside();
    SetAttribute(*thumb->GetLayoutRect(), LengthAttribute(Along()), troughLength);
    Set(position, range);
}

void ScrollBarPane::DoEdgeCalc() {
    if (IsInLayout())
        return;
    Rect box;
    GetBox(&box);
    if (flags & kRightFollowsGlog) {
        box.right = static_cast<short>(GetGlogWidth(GetGlog()) - edgeH);
        if (!IsHorizontal())
            box.left = static_cast<short>(box.right - kBreadthAtGlogEdge);
    }
    if (flags & kBottomFollowsGlog) {
        box.bottom = static_cast<short>(GetGlogHeight(GetGlog()) - edgeV);
        if (IsHorizontal())
            box.top = static_cast<short>(box.bottom - kBreadthAtGlogEdge);
    }
    SetBox(&box);
}

void ScrollBarPane::Resize(Point) {
    if (IsInLayout() || !(flags & (kBottomFollowsGlog | kRightFollowsGlog)))
        return;
    Inval();
    DoEdgeCalc();
    Inval();
}

bool ScrollBarPane::TooSmall() { return Along().Length(GetBounds()) < GetMinLength(); }

// State

void ScrollBarPane::SetClient(ScrollBarClient *newClient) { client = newClient; }

void ScrollBarPane::Set(int newPosition, int newRange) {
    position = newPosition;
    range = newRange;
    double const ratio = client ? client->GetThumbRatio(this) : 0.0;
    bool live = true;
    if (range < 1 || ratio >= 1.0) // what is not a number leaves the bar live
        live = false;
    if (TooSmall())
        live = false;
    if (live != enabled) {
        enabled = live;
        EnableParts(live);
    }
    Inval();
}

void ScrollBarPane::EnableParts(bool enable) {
    if (!thumb)
        return; // not set up yet
    upArrow->SetEnable(enable);
    downArrow->SetEnable(enable);
    thumb->SetEnabled(enable);
}

// Panes may have been put into a bar, and what they tell of may delete it.

void ScrollBarPane::Activate() {
    PaneWatch const self(this);
    CompoundPane::Activate();
    if (!self.PaneExists())
        return;
    EnableParts(enabled);
    Inval();
}

// `enabled` stays, so that Activate brings the parts back.
void ScrollBarPane::Deactivate() {
    PaneWatch const self(this);
    CompoundPane::Deactivate();
    if (!self.PaneExists())
        return;
    EnableParts(activeInBackground && enabled);
    Inval();
}

void ScrollBarPane::SetActiveInBackground() { activeInBackground = true; }

// Commands

void ScrollBarPane::ScrollOneUnit(bool forward) { Scroll(forward ? 1 : -1); }

void ScrollBarPane::Scroll(int units) { ScrollOnce(true, units); }

void ScrollBarPane::ScrollPage(bool forward) { ScrollOnce(false, forward ? 1 : -1); }

void ScrollBarPane::ScrollOnce(bool byUnit, int times) {
    int amount = 0, multiplier = 0;
    if (!TellStart(byUnit, amount, multiplier))
        return;
    amount = Saturated(static_cast<long long>(std::max(amount, 1)) * times);
    if (TellScroll(amount, multiplier))
        EndScrolling();
}

// The client hears of the end without another announcement.
void ScrollBarPane::ScrollToEnd(bool toEnd) {
    PaneWatch const watch(this);
    int target = 0;
    if (toEnd) {
        if (!Announce())
            return;
        target = client->GetMaxScrollValue(this);
    }
    if (!watch.PaneExists() || !Announce())
        return;
    client->ScrollTo(this, target);
    if (watch.PaneExists() && client)
        client->DoneScrolling(this);
}

// The client

bool ScrollBarPane::Announce() {
    if (!client)
        return false;
    PaneWatch const watch(this);
    client->InhibitAutoScroll(GetGlog());
    return watch.PaneExists() && client;
}

bool ScrollBarPane::TellStart(bool byUnit, int &amount, int &multiplier) {
    if (!Announce())
        return false;
    PaneWatch const watch(this);
    client->StartScrolling(this, byUnit, amount, multiplier);
    return watch.PaneExists() && client;
}

bool ScrollBarPane::TellScroll(int amount, int &multiplier) {
    if (!Announce())
        return false;
    PaneWatch const watch(this);
    client->Scroll(this, amount, multiplier);
    return watch.PaneExists() && client;
}

CustomEventHandler *ScrollBarPane::CanHandleCustomEvent(UIEvent *event) {
    return IsMouseWheelEvent(*event) ? new (std::nothrow) ScrollBarPaneMouseWheelHandler(this) : nullptr;
}

// Gestures

void ScrollBarPane::BeginScrolling(bool byPage, ScrollDirection direction) {
    int amount = 0, multiplier = 0;
    if (!TellStart(!byPage, amount, multiplier))
        return;
    scrollAmount = std::max(amount, 1);
    scrollMultiplier = multiplier;
    if (!Step(direction == kTowardStart ? -scrollAmount : scrollAmount))
        return;
    PaneWatch const watch(this);
    int const delay = byPage ? client->GetPageScrollDelay() : client->GetArrowScrollDelay();
    if (!watch.PaneExists())
        return;
    repeatDelay = delay;
    nextRepeatTick = CurrentTick() + 3LL * repeatDelay;
}

// Toward the start every repeat begins with the multiplier 1; toward the end it stays what the client has
// made of it. So a client that raises it is faster and faster toward the end alone.
void ScrollBarPane::ContinueScrolling(ScrollDirection direction) {
    if (CurrentTick() < nextRepeatTick || !client)
        return;
    int step = scrollAmount;
    if (direction == kTowardStart) {
        step = -step;
        scrollMultiplier = 1;
    }
    if (Step(step))
        nextRepeatTick = CurrentTick() + repeatDelay;
}

// The client writes to a multiplier of its own, since it may do away with the bar first.
bool ScrollBarPane::Step(int amount) {
    int multiplier = scrollMultiplier;
    PaneWatch const watch(this);
    bool const goesOn = TellScroll(amount, multiplier);
    if (watch.PaneExists())
        scrollMultiplier = multiplier;
    return goesOn;
}

void ScrollBarPane::EndScrolling() {
    if (Announce())
        client->DoneScrolling(this);
}
