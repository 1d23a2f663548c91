// Keeps what is current for drawing.
#pragma once
#include "desktop/drawing/DrawingPort.h"

// Puts the current port back, with its origin, boundary, clip and state: whatever ran meanwhile may have
// prepared other panes, thrown, or closed the very window.
class PortKeeper {
public:
    PortKeeper();
    explicit PortKeeper(DrawingPort &alsoKept); // this port's settings instead of the current one's
    ~PortKeeper();
    PortKeeper(PortKeeper const &) = delete;
    PortKeeper &operator=(PortKeeper const &) = delete;

private:
    void Keep(DrawingPort *);
    PortRef current, kept;
    PortPlace place;
    GraphicsState state;
};
