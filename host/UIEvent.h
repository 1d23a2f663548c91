// Events beyond those of mouse button and key, such as the wheel's.
#pragma once
#include <boost/shared_ptr.hpp>

// Offered to panes by GlogPane::CanHandleCustomEvent. Valid for the call that it is given to.
class UIEvent {
public:
    struct MouseWheelParams { // one turn along one axis
        float delta;          // notches; positive toward the start: up or left
        int axis;             // 0 horizontal, 1 vertical; others are possible and mean nothing to panes
    };

    virtual ~UIEvent() {}
    // What the wheel did; null for any other event.
    virtual boost::shared_ptr<MouseWheelParams> GetMouseWheelParams() = 0;
};

// Whether the event comes from the wheel.
bool IsMouseWheelEvent(UIEvent const &);
