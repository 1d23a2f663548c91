// A window that exists in memory only.
#pragma once
#include "desktop/drawing/Surface.h"
#include "desktop/windows/PlatformWindow.h"
#include <memory>
#include <vector>

class SimulatedWindowSystem;

// Keeps what was presented, as a screen would.
class SimulatedWindow : public PlatformWindow {
public:
    SimulatedWindow(SimulatedWindowSystem &, WindowSpec const &, double scale);
    ~SimulatedWindow() override;
    void Show() override;
    void Hide() override;
    void Raise() override {} // nothing can cover it
    void SetTitle(std::string const &title_) override { title = title_; }
    void SetPlace(int h, int v) override;
    void SetContentSize(int width, int height) override;
    void SetSizeLimits(int minWidth, int minHeight, int maxWidth, int maxHeight) override;
    int Width() const override { return width; }
    int Height() const override { return height; }
    Point ScreenPlace() const override { return place; }
    double Scale() const override { return scale; }
    void Present(Surface const &, DeviceRect const *, std::size_t count) override;
    void StartTextInput(Rect const &) override {} // a script types what it wants
    void StopTextInput() override {}

    bool IsShown() const { return shown; }
    bool IsPopup() const { return popup; }
    Surface const *Picture() const { return picture.get(); }
    std::vector<DeviceRect> TakePresented();
    void SetScaleFactor(double scale_) { scale = scale_; }
    // Cut to the limits.
    void Resize(int width, int height);

private:
    SimulatedWindowSystem &system;
    std::string title;
    int width, height;
    int minWidth = 0, minHeight = 0, maxWidth = 0, maxHeight = 0;
    Point place;
    double scale;
    bool popup;
    bool shown = false;
    std::unique_ptr<Surface> picture;
    std::vector<DeviceRect> presented;
};
