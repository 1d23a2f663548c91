// What a zoom slider zooms.
#pragma once
#include "host/Noncopyable.h"

// Made by the program, owned by the pane. Levels are fractions from 0.0, the smallest, to 1.0.
class ZoomPopUpPaneClient : public Noncopyable<void> {
public:
    virtual ~ZoomPopUpPaneClient() {}
    virtual void PrepareToZoom() {}          // before the first change of a drag, and before each step
    virtual float GetZoomFraction() = 0;     // the level as it is
    virtual void SetZoomFraction(float) = 0; // another level, which may be rounded; also one that is the same
    virtual void ZoomStep(bool up) = 0;      // to the next larger or smaller level; from the wheel
    virtual void ZoomIdle() {}               // again and again while the slider is up
};
