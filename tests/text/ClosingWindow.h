// What a window tells its panes when it closes.
#pragma once
#include "frame/Provider.h"
#include "host/OSWindow.h"
#include "host/glogRec.h"

class ClosingWindow : public DependentCastMessenger<TarnOSWindow::OSWindow_PlatformWindowListener> {
public:
    explicit ClosingWindow(glogRec &window_)
        : window(window_) {}
    void BroadcastChange(TarnOSWindow::OSWindow_PlatformWindowListener *listener) override {
        listener->PlatformWindow_Closing(window);
    }

private:
    glogRec &window;
};
