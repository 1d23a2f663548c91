#include "desktop/drawing/Outline.h"
#include "desktop/drawing/Surface.h"
#include "host/NamedColors.h"
#include <algorithm>

namespace {

bool Same(Rect const &a, Rect const &b) {
    return a.top == b.top && a.left == b.left && a.bottom == b.bottom && a.right == b.right;
}

DeviceRect InDevicePixels(DeviceScale scale, Rect const &r) {
    return scale.ToDevice(r.left, r.top, r.right, r.bottom);
}

std::uint32_t PixelOf(RGBColor const &color) {
    auto const high = [](unsigned short component) { return static_cast<std::uint32_t>(component >> 8); };
    return 0xFF000000u | high(color.red) << 16 | high(color.green) << 8 | high(color.blue);
}

// The two lines of an outline, from the outside inward.
struct Lines {
    Lines(DeviceScale scale, Outline const &outline)
        : clip(InDevicePixels(scale, outline.clip))
        , outer(InDevicePixels(scale, outline.box))
        , width(std::max(scale.Edge(1), 1)) {}

    // Calls with each bar of each line that shows: line 0 is the outer one.
    template <class Visit> void ForEachBar(Visit visit) const {
        DeviceRect line = outer;
        for (int i = 0; i < 2 && !line.Empty(); ++i) {
            DeviceRect const inside = Inset(line);
            for (DeviceRect const &bar : Bars(line, inside)) {
                DeviceRect const part = bar.Intersected(clip);
                if (!part.Empty())
                    visit(i, part);
            }
            line = inside;
        }
    }

private:
    DeviceRect Inset(DeviceRect const &r) const {
        return {r.left + width, r.top + width, r.right - width, r.bottom - width};
    }
    // A line with nothing inside is all of its box.
    static std::vector<DeviceRect> Bars(DeviceRect const &line, DeviceRect const &inside) {
        if (inside.Empty())
            return {line};
        return {{line.left, line.top, line.right, inside.top},
                {line.left, inside.top, inside.left, inside.bottom},
                {inside.right, inside.top, line.right, inside.bottom},
                {line.left, inside.bottom, line.right, line.bottom}};
    }

    DeviceRect clip, outer;
    int width;
};

} // namespace

void OutlineLayer::Show(Outline const &outline) {
    if (shown && Same(shown->box, outline.box) && Same(shown->clip, outline.clip))
        return;
    Hide();
    shown = outline;
    changed.push_back(outline);
}

void OutlineLayer::Hide() {
    if (shown)
        changed.push_back(*shown);
    shown.reset();
}

std::vector<DeviceRect> OutlineLayer::TakeChanged(DeviceScale scale) {
    std::vector<DeviceRect> bars;
    for (Outline const &outline : changed)
        Lines(scale, outline).ForEachBar([&](int, DeviceRect const &bar) { bars.push_back(bar); });
    changed.clear();
    return bars;
}

WithOutline::WithOutline(Surface &surface_, DeviceScale scale, OutlineLayer const &layer)
    : surface(surface_) {
    if (!layer.Shown())
        return;
    std::uint32_t const colors[] = {PixelOf(kDialogActiveTextColor), PixelOf(kWindowBackgroundColor)};
    DeviceRect const whole = {0, 0, surface.Width(), surface.Height()};
    Lines(scale, *layer.Shown()).ForEachBar([&](int line, DeviceRect const &bar) {
        DeviceRect const part = bar.Intersected(whole);
        if (!part.Empty())
            Cover(part, colors[line]);
    });
}

WithOutline::~WithOutline() {
    std::uint32_t const *kept = beneath.data();
    for (DeviceRect const &bar : covered)
        for (int y = bar.top; y < bar.bottom; ++y, kept += bar.Width())
            std::copy_n(kept, bar.Width(), surface.Row(y) + bar.left);
}

void WithOutline::Cover(DeviceRect const &bar, std::uint32_t pixel) {
    covered.push_back(bar);
    for (int y = bar.top; y < bar.bottom; ++y) {
        std::uint32_t *const row = surface.Row(y) + bar.left;
        beneath.insert(beneath.end(), row, row + bar.Width());
        std::fill_n(row, bar.Width(), pixel);
    }
}
