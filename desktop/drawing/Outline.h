// The outline of a rectangle, over what a window shows.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "host/Geometry.h"
#include <cstdint>
#include <optional>
#include <vector>

class Surface;

// In window coordinates. It is two lines wide, in the theme's colours for text and for the ground, so that it
// stands out from whatever lies beneath.
struct Outline {
    Rect box;
    Rect clip; // what lies outside of it does not show
};

// The outline of one window. It never becomes part of the window's pixels, which panes redraw and scroll as
// if it were not there: WithOutline lays it over them for as long as somebody looks.
class OutlineLayer {
public:
    void Show(Outline const &);
    void Hide();
    std::optional<Outline> const &Shown() const { return shown; }
    // The device pixels that have looked different since the last call.
    std::vector<DeviceRect> TakeChanged(DeviceScale);
    bool HasChanged() const { return !changed.empty(); } // since then

private:
    std::optional<Outline> shown;
    std::vector<Outline> changed;
};

// Draws the layer's outline on the surface, and takes it off again exactly.
class WithOutline {
public:
    WithOutline(Surface &, DeviceScale, OutlineLayer const &);
    ~WithOutline();
    WithOutline(WithOutline const &) = delete;
    WithOutline &operator=(WithOutline const &) = delete;

private:
    void Cover(DeviceRect const &bar, std::uint32_t pixel);

    Surface &surface;
    std::vector<DeviceRect> covered;
    std::vector<std::uint32_t> beneath; // the pixels of the covered bars, row by row
};
