#pragma once
class UIEvent;

struct CustomEventHandler {
    virtual bool HandleEvent(UIEvent *) = 0;
    virtual CustomEventHandler *Clone() = 0;
};
