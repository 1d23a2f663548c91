// The tool tip that shows help tags.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Surface.h"
#include "desktop/windows/WindowSystem.h"
#include "host/GlogPane.h"
#include "host/TextLayout.h"
#include <memory>

class Glog;

// Appears when the pointer has rested on a part with a help tag for the tag's delay; goes when the pointer
// leaves the part, and at any click, key, turn of the wheel or change of activation.
class HelpTagWindow {
public:
    explicit HelpTagWindow(WindowSystem &);
    ~HelpTagWindow();
    void PointerAt(Glog &, Point window);
    void Hide();
    static void HideAny();              // of the open desktop, if there is one
    void Tick(double now);              // shows what is due
    double UntilNext(double now) const; // negative when nothing is due
    void OwnerGone(PlatformWindow *);
    void Exposed(PlatformWindow *);
    bool IsShown() const { return window != nullptr; }
    Rect ScreenPlace() const { return place; } // while it is shown
    Surface const *Pixels() const { return surface.get(); }
    PlatformWindow *Owner() const { return owner; }

private:
    struct Found {
        LocalizedStrings::HelpTag const *tag = nullptr; // only to be compared: it may be gone
        UString text;
        Rect part{0, 0, 0, 0}; // window coordinates
        OS::Help::Placement placement = OS::Help::kPlacementForParts;
        double delay = 0;
    };
    static bool Find(GlogPane &, Point, Found &);
    void Show();
    void Draw();
    Rect ChoosePlace(int width, int height) const;

    WindowSystem &windows;
    Found wanted;
    Glog *glog = nullptr;
    PlatformWindow *owner = nullptr;
    double due = -1;
    std::unique_ptr<PlatformWindow> window;
    std::unique_ptr<Surface> surface;
    DrawingPort port;
    OS::TextLayout layout;
    Rect place{0, 0, 0, 0};
};
