// A window for as long as it is open.
#pragma once
#include "host/glogRec.h"

// Knows when the window goes, also when another one comes to lie at the same address.
class OpenWindow : private TarnOSWindow::OSWindow_PlatformWindowListener {
public:
    void Watch(glogRec *window) {
        if (glog)
            CancelDependency(glog);
        glog = window;
        DependUpon(glog);
    }
    // Null once it was disposed of.
    glogRec *Get() const { return GlogError(glog) ? nullptr : glog; }

private:
    void ProviderDying(Provider<OSWindow_PlatformWindowListener> *) override { glog = nullptr; }

    glogRec *glog = nullptr;
};
