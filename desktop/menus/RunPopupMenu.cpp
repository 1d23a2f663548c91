#include "desktop/Desktop.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/PortKeeper.h"
#include "host/OSMenuHandle.h"

namespace {

// The visible glog that is drawn on the current port; null when there is none.
Glog *CurrentGlog() {
    DrawingPort *const port = DrawingPort::CurrentPort();
    if (!port || !Desktop::Current())
        return nullptr;
    for (Glog *glog : DesktopRep::Of(*Desktop::Current()).Glogs())
        if (&glog->Port() == port && glog->IsVisible() && !glog->disposed && !glog->UpdateRegion())
            return glog;
    return nullptr;
}

ScreenRect OnScreen(Glog const &glog, DrawingPort const &port, Rect const &local) {
    Point const content = glog.Window()->ScreenPlace();
    return ScreenRect::Of(local).Moved(port.OriginH() + content.h, port.OriginV() + content.v);
}

} // namespace

int RunPopupMenu(OSMenuHandle &handle, short currentItem, Rect *place) {
    Glog *const glog = handle.IsValid() && place && !MenuTracker::Open() ? CurrentGlog() : nullptr;
    if (!glog)
        return 0;
    HostCall const call;
    PortKeeper const keeper;
    EventLoop &loop = EventLoop::Instance();
    return MenuTracker(*glog, loop, handle, currentItem, OnScreen(*glog, glog->Port(), *place)).Run();
}
