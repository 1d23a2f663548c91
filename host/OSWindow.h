#pragma once
#include "frame/Provider.h"
#include "host/RGBColor.h"
class OSPort;

namespace TarnOSWindow {

class OSWindow;

class OSWindow_PlatformWindowListener : public Dependent<OSWindow_PlatformWindowListener> {
public:
    virtual void PlatformWindow_Opened(OSWindow &) {}
    virtual void PlatformWindow_Closing(OSWindow &) {}
};

class OSWindow : public Provider<OSWindow_PlatformWindowListener> {
public:
    enum PositionArg { PositionOnTop = 0 };
    class SendBehindArg {
    public:
        explicit SendBehindArg(PositionArg p) : position(p) {}
        PositionArg position;
    };
    virtual ~OSWindow() {}
    virtual OSPort *GetPort() = 0;
    virtual bool IsVisible() = 0;
    virtual RGBColor GetContentColor() = 0;
};

}
