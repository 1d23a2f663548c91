#include "desktop/panes/ModalRun.h"
#include "desktop/panes/EventRecords.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/panes/PortKeeper.h"
#include "desktop/windows/EventLoop.h"
#include "host/GlogPane.h"
#include <vector>

namespace {

ModalRun *theInnermost = nullptr;

short const kNothing = -1;
int const kUsualConfirm = 1, kUsualCancel = 2;
int const kCancelled = 1; // as a button that was pressed gives it

// By its number only: which item comes first in a glog says nothing about what it is for.
GlogPane *VisiblePane(Glog &glog, int item) {
    for (GlogPane *pane : glog.Items())
        if (GlogPane *found = pane->FindByID(item))
            return found->GetVisibility() ? found : nullptr;
    return nullptr;
}

} // namespace

ModalRun::ModalRun(Glog &glog_, GlogFilterHook filter_, void *self_, int confirm, int cancel,
                   RunIdleChores chores_)
    : glog(glog_)
    , filter(filter_)
    , self(self_)
    , confirmItem(confirm > 0 ? confirm : kUsualConfirm)
    , cancelItem(cancel > 0 ? cancel : kUsualCancel)
    , chores(chores_)
    , outer(theInnermost)
    , hitItem(kNothing) {
    theInnermost = this;
}

ModalRun::~ModalRun() { theInnermost = outer; }

ModalRun *ModalRun::Innermost() { return theInnermost; }

bool ModalRun::IsOver() const { return isHit || glog.disposed || !glog.IsVisible(); }

void ModalRun::Run(short *item, int *value) {
    HostCall const call;
    PortKeeper const keeper;
    EventLoop::Instance().RunModal([this] { return IsOver(); }, chores == kRunIdleChores);
    *item = hitItem;
    *value = hitValue;
}

void ModalRun::Hit(int item, int value) {
    if (isHit)
        return;
    isHit = true;
    hitItem = static_cast<short>(item);
    hitValue = value;
}

bool ModalRun::NoteHit(Glog &where, int item, int value) {
    if (&where != &glog)
        return false;
    Hit(item, value);
    return true;
}

// Events

bool ModalRun::Takes(InputEvent const &event, Glog *target) {
    if (target != &glog) {
        if (event.kind == InputEvent::kMouseDown)
            glog.Window()->Raise();
        return event.kind != InputEvent::kMouseLeave;
    }
    if (IsOver() || Filters(event))
        return true;
    if (event.kind == InputEvent::kCloseRequested)
        return Cancel(event), true;
    return event.kind == InputEvent::kKeyDown && TakesKey(event);
}

bool ModalRun::Filters(InputEvent const &event) {
    bool const isShown = event.kind == InputEvent::kMouseDown || event.kind == InputEvent::kMouseUp ||
                         event.kind == InputEvent::kKeyDown || event.kind == InputEvent::kTextInput;
    if (!filter || !isShown)
        return false;
    EventRecordAdapter record = EventRecords::Of(event);
    SetPortToGlog(&glog);
    short item = kNothing;
    int value = 0;
    if (!filter(&glog, self, &record, &item, &value))
        return IsOver();
    // One that names no item has only used the event up: -1 means that the glog has gone.
    if (item != kNothing)
        Hit(item, value);
    return true;
}

// A text field remains the current item when its editing has ended, and takes both keys without an effect.
static bool HasBeenLeft(GlogPane *pane) { return pane && pane->Selectable() && !pane->IsSelected(); }

bool ModalRun::TakesKey(InputEvent const &event) {
    bool const confirms = event.key == KeyCodes::kReturn || event.key == KeyCodes::kEnter;
    bool const cancels = event.key == KeyCodes::kEscape;
    if (!confirms && !cancels)
        return false;
    if (!HasBeenLeft(glog.GetCurItem()) && glog.KeyDown(event))
        return true;
    if (IsOver())
        return true;
    if (cancels)
        Cancel(event);
    else if (!event.repeat)
        Press(confirmItem, event);
    return true;
}

// As a click in its middle would. Whether that hits is the pane's affair: a disabled button does not.
bool ModalRun::Press(int item, InputEvent const &event) {
    GlogPane *const pane = VisiblePane(glog, item);
    if (!pane)
        return false;
    Rect const box = pane->GetDrawRectangle();
    Point const origin = PaneAccess::Origin(*pane);
    InputEvent press;
    press.kind = InputEvent::kMouseDown;
    press.window = event.window;
    press.time = event.time;
    press.button = press.clicks = 1;
    press.h = (box.left + box.right) / 2 + origin.h;
    press.v = (box.top + box.bottom) / 2 + origin.v;
    glog.Click(press);
    return true;
}

void ModalRun::Cancel(InputEvent const &event) {
    if (!Press(cancelItem, event))
        Hit(cancelItem, kCancelled);
}

void DoModalGlog(glogRec *record, short *item, int *value, GlogFilterHook filter, void *self, bool, int,
                 int confirm, int cancel, bool, RunIdleChores chores) {
    *item = kNothing;
    *value = 0;
    // Between two runs of a dialog its item may have disposed of it.
    if (EventLoop::Open() && !GlogError(record))
        ModalRun(Glog::From(record), filter, self, confirm, cancel, chores).Run(item, value);
}
