#include "frame/ModalGlogClass.h"

namespace {

short const kNoItem = -1;
int const kUsualKind = 2; // in every call

} // namespace

ModalGlogClass::ModalGlogClass(short okItem_, short cancelItem_)
    : okItem(okItem_)
    , cancelItem(cancelItem_)
    , glog(nullptr)
    , isOpen(false)
    , idleChores(kRunIdleChores) {}

// The port stays current until the glog has gone.
ModalGlogClass::~ModalGlogClass() {
    if (!isOpen)
        return;
    DisposeGlog(glog);
    portSaver.reset();
    isOpen = false;
}

bool ModalGlogClass::ModalGlogInit(short resourceID) {
    using TarnOSWindow::OSWindow;
    glogRec *const opened = LowLevelGlogOpening::NewGlog(
        resourceID, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false, nullptr);
    if (!opened)
        return isOpen;
    if (isOpen)
        DisposeGlog(glog);
    portSaver.reset(); // before the next one looks which port is current
    glog = opened;
    isOpen = true;
    portSaver.reset(new WithPort(*glog->GetPort()));
    return isOpen;
}

short ModalGlogClass::ModalLoop(int *value, unsigned char arg, int a, int b) {
    WithCursorDispatchingDisabled const cursorStays;
    short item = kNoItem;
    if (!isOpen || GlogError(glog)) // the user may have closed it
        return item;
    if (!glog->IsVisible())
        ShowGlog(glog, kShowGlog);
    do
        DoModalGlog(glog, &item, value, FilterHook, this, arg != 0, kUsualKind, a, b, false, idleChores);
    // Nothing can be hit any more in a window that has gone.
    while (!HandleItem(item, *value) && item != kNoItem);
    return item;
}

char ModalGlogClass::FilterHook(glogRec *, void *self, EventRecordAdapter *event, short *item, int *value) {
    return static_cast<ModalGlogClass *>(self)->ModalFilter(event, item, value);
}

char ModalGlogClass::HandleItem(short item, int) {
    if (item == okItem)
        return Read();
    return item == cancelItem;
}

char ModalGlogClass::ReadError() { return GlogError(glog); }

char ModalGlogClass::ModalFilter(EventRecordAdapter *, short *, int *) { return false; }

char ModalGlogClass::Read() { return true; }
