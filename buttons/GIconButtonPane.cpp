#include "buttons/GIconButtonPane.h"
#include "buttons/NaturalSize.h"
#include "host/CallbackAPI.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/MouseTask.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <memory>
#include <new>

// One press of the button.
class TrackButtonMouseTask : public MouseTask {
public:
    TrackButtonMouseTask(GIconButtonPane *, EventRecordAdapter const &press);

    void MouseTaskBegin() override;
    void MouseTaskContinue(Point const &) override;
    void MouseTaskEnd() override;

    // What the click has come to: what ReleaseAction answered, -1 when the mouse was released outside.
    int Result() const { return result; }

private:
    void FollowMouse(Point const &);
    void ShowState(short);

    GIconButtonPane *pane;
    PaneWatch const watch; // what a press sets off may delete the button
    short originalState;   // before the press
    short nextState;       // after a completed click
    short downState;       // while the button is held down
    short canCancel;
    int result;
    bool outside; // where the mouse is
    EventRecordAdapter event;
};

namespace {

double const kRepeatInterval = 0.1; // seconds
int const kNotClicked = -1;
short const kFirstFamily = 1;
short const kStatesWithOwnDisabledIcons = 2; // from this number of disabled states on, each state has one

} // namespace

TrackButtonMouseTask::TrackButtonMouseTask(GIconButtonPane *button, EventRecordAdapter const &press)
    : MouseTask(0)
    , pane(button)
    , watch(button)
    , originalState(0)
    , nextState(0)
    , downState(0)
    , canCancel(button->canCancel)
    , result(kNotClicked)
    , outside(false)
    , event(press) {}

void TrackButtonMouseTask::MouseTaskBegin() {
    originalState = pane->GetState();
    nextState = pane->ClickAction(event.modifiers);
    if (!watch.PaneExists())
        return;
    int const look = std::min<int>(originalState, pane->numDownStates - 1);
    downState = static_cast<short>(pane->FirstDownState() + look);
    pane->SetState(downState);
    pane->DoButtonPress(event.modifiers);
    if (!watch.PaneExists())
        return;
    UpdateGlog(pane->GetGlog());
    SetSleepTime(kRepeatInterval);
}

void TrackButtonMouseTask::MouseTaskContinue(Point const &where) {
    if (canCancel)
        FollowMouse(where);
    VelaFoundationCallbackAPI::gInstance->TrackingStep();
}

void TrackButtonMouseTask::FollowMouse(Point const &where) {
    Rect box;
    pane->GetBox(&box);
    outside = !VelaDrawing::PtInRect(where, &box);
    if (outside) {
        ShowState(originalState);
    } else {
        ShowState(downState);
        pane->DoButtonPress(event.modifiers);
    }
    if (watch.PaneExists())
        UpdateGlog(pane->GetGlog());
}

void TrackButtonMouseTask::ShowState(short state) {
    if (pane->GetState() != state)
        pane->SetState(state);
}

void TrackButtonMouseTask::MouseTaskEnd() {
    if (outside)
        return;
    pane->SetState(nextState);
    result = pane->ReleaseAction();
}

GIconButtonPane::GIconButtonPane()
    : family(0)
    , icon(0)
    , numStates(0)
    , numDownStates(0)
    , numDisabledStates(0)
    , state(0)
    , canCancel(true)
    , canDisable(false)
    , enabled(true)
    , disabledIconsAfterDownStateIcons(false)
    , hasDisabledIcons(true) {}

GIconButtonPane *GIconButtonPane::NewGIconButtonPane(glogRec *owner, short id, short family, short icon,
                                                     short numStates, short numDownStates,
                                                     short numDisabledStates) {
    std::unique_ptr<GIconButtonPane> button(new (std::nothrow) GIconButtonPane);
    if (!button ||
        !button->GIconButtonPaneInit(owner, id, family, icon, numStates, numDownStates, numDisabledStates))
        return nullptr;
    return button.release();
}

GIconButtonPane *GIconButtonPane::GIconButtonPaneInit(glogRec *owner, short id, short iconFamily,
                                                      short firstIcon, short states, short downStates,
                                                      short disabledStates) {
    if (!GlogPaneInit(owner, id))
        return nullptr;
    family = iconFamily;
    icon = firstIcon;
    numStates = states;
    numDownStates = downStates;
    numDisabledStates = disabledStates;

    Rect size;
    GetBox(&size);
    if (VelaDrawing::EmptyRect(&size)) {
        if (family < kFirstFamily)
            return this;
        size = GetIconBounds(family);
    }
    SetNaturalSize(*this, size.right - size.left, size.bottom - size.top);
    return this;
}

void GIconButtonPane::SetState(short newState) {
    if (newState == state)
        return;
    state = newState;
    Inval();
}

short GIconButtonPane::GetState() { return state; }

short GIconButtonPane::ClickAction(int) { return static_cast<short>((state + 1) % numStates); }

int GIconButtonPane::ReleaseAction() { return 1; }

void GIconButtonPane::DoButtonPress(int) {}

void GIconButtonPane::DrawMore(short) {}

void GIconButtonPane::Enable() { SetEnable(true); }

void GIconButtonPane::Disable() { SetEnable(false); }

void GIconButtonPane::SetEnable(bool enable) {
    if (enable == enabled)
        return;
    enabled = enable;
    Inval();
}

void GIconButtonPane::SetIcon(int newIcon) {
    short const number = static_cast<short>(newIcon);
    if (number == icon)
        return;
    icon = number;
    Inval();
}

void GIconButtonPane::SetIconSet(int newFamily) { family = static_cast<short>(newFamily); }

void GIconButtonPane::SetCanDisable(bool can) { canDisable = can; }

void GIconButtonPane::SetDisabledIconsAfterDownStateIcons() { disabledIconsAfterDownStateIcons = true; }

void GIconButtonPane::SetNoDisabledIcons() { hasDisabledIcons = false; }

void GIconButtonPane::SetCanCancel(bool can) { canCancel = can; }

short GIconButtonPane::FirstDownState() const {
    bool const disabledIconsPrecede = canDisable && !disabledIconsAfterDownStateIcons;
    return static_cast<short>(numStates + (disabledIconsPrecede ? numDisabledStates : 0));
}

// The disabled icons are found whether or not the button can be disabled: that flag only says whether they
// stand before the pressed ones.
short GIconButtonPane::ShownIcon() const {
    if (enabled)
        return static_cast<short>(icon + state);
    int shown = icon;
    if (hasDisabledIcons)
        shown += numStates + (disabledIconsAfterDownStateIcons ? numDownStates : 0);
    if (numDisabledStates >= kStatesWithOwnDisabledIcons)
        shown += state;
    return static_cast<short>(shown);
}

void GIconButtonPane::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    short const shown = ShownIcon();
    Draw1Icon(family, shown, box.left, box.top);
    DrawMore(shown);
}

int GIconButtonPane::HandleClick(EventRecordAdapter *event) {
    if (!enabled)
        return kNotClicked;
    TrackButtonMouseTask task(this, *event);
    TrackMouse(task, event->where);
    return task.Result();
}
