#include "host/glogRec.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "host/GlogPane.h"
#include <algorithm>
#include <vector>

void UpdateGlog(glogRec *glog) {
    if (glog)
        Glog::From(glog).Update();
}

short GetGlogWidth(glogRec *glog) { return static_cast<short>(Glog::From(glog).Width()); }

short GetGlogHeight(glogRec *glog) { return static_cast<short>(Glog::From(glog).Height()); }

// Panes that were given numbers go by them; where none has the number, the place in the order of creation
// counts.
GlogPane *GetGlogItem(glogRec *glog, short id) {
    if (id < 1)
        return nullptr;
    std::vector<GlogPane *> const &items = Glog::From(glog).Items();
    for (GlogPane *pane : items)
        if (GlogPane *found = pane->FindByID(id))
            return found;
    return static_cast<std::size_t>(id) <= items.size() ? items[static_cast<std::size_t>(id) - 1] : nullptr;
}

short CountGlogItems(glogRec *glog) { return static_cast<short>(Glog::From(glog).Items().size()); }

void SetPortToGlog(glogRec *record) {
    Glog &glog = Glog::From(record);
    DrawingPort &port = glog.Port();
    DrawingPort::MakeCurrent(&port);
    port.SetOrigin(0, 0);
    port.SetBoundary(glog.UpdateRegion() ? *glog.UpdateRegion() : OSRgn(port.Extent()));
}

void ShowGlog(glogRec *glog, ShowOrHideEnum how) {
    if (how == kShowGlog)
        Glog::From(glog).Show();
    else
        Glog::From(glog).Hide();
}

void PositionGlog(glogRec *glog, Rect *place, bool redrawNow) {
    Glog::From(glog).Place(*place);
    if (redrawNow)
        UpdateGlog(glog);
}

// A glog that is gone already is none of the desktop's: it is compared, and not looked into. Null for that.
static Glog *Known(glogRec const *glog) {
    if (!Desktop::Current())
        return nullptr;
    std::vector<Glog *> const &glogs = DesktopRep::Of(*Desktop::Current()).Glogs();
    auto const found = std::find(glogs.begin(), glogs.end(), glog);
    return found == glogs.end() ? nullptr : *found;
}

void DisposeGlog(glogRec *glog) {
    if (Glog *const known = Known(glog))
        DesktopRep::Of(*Desktop::Current()).Dispose(known);
}

bool GlogError(glogRec *glog) {
    Glog const *const known = Known(glog);
    return !known || known->disposed;
}
