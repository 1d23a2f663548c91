#include "buttons/GIconButton.h"
#include "frame/ResourceReading.h"
#include "host/CallbackAPI.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include <memory>
#include <new>

namespace {

unsigned short const kOptionKey = 0x0800; // in the modifiers of an event

// Class 0 stands for no command.
void Execute(CommandSpecifier const &command) {
    if (command.classID != 0)
        InternalCallbackAPI::gInstance->ExecuteCommand(&command);
}

short ShortUnder(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key) {
    return static_cast<short>(item->GetSIntItemValue(ResourceKey(key)));
}

unsigned char FlagUnder(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key) {
    return item->GetSIntItemValue(ResourceKey(key)) != 0;
}

} // namespace

GIconButton::GIconButton()
    : numDownStates(0)
    , canCancel(false)
    , notifyWindow(false)
    , pressed(false)
    , autoIncrement(true)
    , clickHandler(nullptr)
    , iconStateHook(nullptr)
    , refCon(0) {}

GIconButton *GIconButton::NewGIconButton(glogRec *owner, GIconButtonResRec *resource) {
    std::unique_ptr<GIconButton> button(new (std::nothrow) GIconButton);
    if (!button || !button->InitGIconButton(owner, *resource))
        return nullptr;
    return button.release();
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
GIconButton *GIconButton::NewGIconButton(glogRec *owner, boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    GIconButtonResRec resource;
    resource.kind = GIconButtonResRec::kKind;
    ReadItem(item, resource);
    resource.numDownStates = ShortUnder(item, "NumDownStates");
    resource.canCancel = FlagUnder(item, "CanCancel");
    resource.notifyWindow = FlagUnder(item, "NotifyWindow");
    resource.cmdClassID = ShortUnder(item, "CmdClassID");
    resource.optCmdClassID = ShortUnder(item, "OptCmdClassID");
    resource.cmdID = ShortUnder(item, "CmdID");
    resource.optCmdID = ShortUnder(item, "OptCmdID");
    return NewGIconButton(owner, &resource);
}

GIconButton *GIconButton::InitGIconButton(glogRec *owner, GIconButtonResRec &resource) {
    if (!InitGIconPane(owner, resource))
        return nullptr;
    numDownStates = resource.numDownStates;
    canCancel = resource.canCancel != 0;
    notifyWindow = resource.notifyWindow != 0;
    command = CommandSpecifier(resource.cmdClassID, resource.cmdID);
    optionCommand = CommandSpecifier(resource.optCmdClassID, resource.optCmdID);
    return this;
}

void GIconButton::SetAutoIncrement(bool increment) { autoIncrement = increment; }

void GIconButton::SetClickHandler(ClickHandler *handler) { clickHandler = handler; }

void GIconButton::SetIconStateHook(int (*hook)(int)) { iconStateHook = hook; }

void GIconButton::SetRefCon(int number) { refCon = number; }

void GIconButton::PushOrPopButton(bool press) {
    if (!GetEnabled() || press == pressed)
        return;
    pressed = press;
    Inval();
    UpdateGlog(glog);
}

short GIconButton::NextState() const {
    return autoIncrement ? static_cast<short>((GetCurState() + 1) % GetNumStates()) : GetCurState();
}

short GIconButton::ShownIcon() const {
    int distance = 0; // from the icon of state 0
    int state = GetCurState();
    if (pressed) {
        distance = GetNumStates() + (CanDisable() ? 1 : 0);
        state %= numDownStates;
    }
    distance += GetEnabled() ? state : GetNumStates();
    if (iconStateHook)
        distance = iconStateHook(distance);
    return static_cast<short>(GetIconNum() + distance);
}

void GIconButton::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    Draw1Icon(GetFamilyID(), ShownIcon(), box.left, box.top);
    if (DecalProc const decal = GetDecalProc())
        decal(glog, box, GetEnabled(), pressed, this);
}

int GIconButton::HandleClick(EventRecordAdapter *event) {
    CommandSpecifier const chosen = event->modifiers & kOptionKey ? optionCommand : command;
    if (!GIconPane::HandleClick(event))
        return 0;
    PaneWatch const self(this);
    if (clickHandler) {
        if (int const result = clickHandler->ClickStarted(this, event))
            return result;
    }
    if (self.PaneExists() && !canCancel)
        Execute(chosen);
    if (!self.PaneExists())
        return -1;

    Prepare();
    Tracking tracking = {this, &self, NextState()};
    Rect box;
    GetBox(&box);
    if (!GenericButtonTrackingLoop(canCancel, &box, TransitionProc, &tracking) || !self.PaneExists())
        return -1;
    // Handler and command may delete the button: nothing of it is touched after each of them.
    int const result = notifyWindow ? 1 : -1;
    bool const sendNow = canCancel;
    if (clickHandler)
        clickHandler->ClickFinished(this);
    if (sendNow)
        Execute(chosen);
    return result;
}

void GIconButton::TransitionProc(void *data, TransitionTo to) {
    Tracking const &tracking = *static_cast<Tracking const *>(data);
    if (!tracking.watch->PaneExists())
        return;
    switch (to) {
    case kTransitionToPressed:
        tracking.button->PushOrPopButton(true);
        break;
    case kTransitionToReleased:
        tracking.button->SetCurState(tracking.next);
        tracking.button->PushOrPopButton(false);
        break;
    case kTransitionToIdle:
        tracking.button->PushOrPopButton(false);
        break;
    case kTransitionTick:
        break;
    }
}
