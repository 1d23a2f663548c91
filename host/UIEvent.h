#pragma once
#include <boost/shared_ptr.hpp>

class UIEvent {
public:

    struct MouseWheelParams {
        float delta;
        int axis;
    };
    virtual ~UIEvent() {}
    virtual boost::shared_ptr<MouseWheelParams> GetMouseWheelParams() = 0;
};

bool IsMouseWheelEvent(UIEvent const &);
