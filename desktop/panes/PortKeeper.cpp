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
    h = port->OriginH();
    v = port->OriginV();
    boundary = port->Boundary();
    clip = port->GetClipState();
    state = port->State();
}

PortKeeper::~PortKeeper() {
    DrawingPort::MakeCurrent(current.Get());
    DrawingPort *const port = kept.Get();
    if (!port)
        return;
    port->SetOrigin(h, v);
    port->SetBoundary(boundary);
    port->SetClipState(clip);
    port->State() = state;
}
