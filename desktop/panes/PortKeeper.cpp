#include "desktop/panes/PortKeeper.h"

PortKeeper::PortKeeper()
    : current(DrawingPort::CurrentPort())
    , kept(DrawingPort::CurrentPort()) {
    Keep(DrawingPort::CurrentPort());
}

PortKeeper::PortKeeper(DrawingPort &alsoKept)
    : current(DrawingPort::CurrentPort())
    , kept(&alsoKept) {
    Keep(&alsoKept);
}

void PortKeeper::Keep(DrawingPort *port) {
    if (!port)
        return;
    place = port->GetPlace();
    state = port->State();
}

PortKeeper::~PortKeeper() {
    DrawingPort::MakeCurrent(current.Get());
    DrawingPort *const port = kept.Get();
    if (!port)
        return;
    port->SetPlace(place);
    port->State() = state;
}
