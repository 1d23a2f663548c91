#include "desktop/windows/SimulatedWindow.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include <algorithm>
#include <cstring>

SimulatedWindow::SimulatedWindow(SimulatedWindowSystem &system_, WindowSpec const &spec, double scale_)
    : system(system_)
    , title(spec.title)
    , width(spec.width)
    , height(spec.height)
    , place{static_cast<short>(spec.v), static_cast<short>(spec.h)}
    , scale(scale_)
    , popup(spec.popup) {}

SimulatedWindow::~SimulatedWindow() { system.WindowGone(this); }

void SimulatedWindow::Show() {
    if (shown)
        return;
    shown = true;
    system.WindowShown(this);
}

void SimulatedWindow::Hide() {
    if (!shown)
        return;
    shown = false;
    picture.reset();
    system.WindowHidden(this);
}

void SimulatedWindow::SetPlace(int h, int v) { place = {static_cast<short>(v), static_cast<short>(h)}; }

void SimulatedWindow::SetContentSize(int w, int h) {
    width = w;
    height = h;
}

void SimulatedWindow::Resize(int w, int h) {
    SetContentSize(std::max(maxWidth > 0 ? std::min(w, maxWidth) : w, minWidth),
                   std::max(maxHeight > 0 ? std::min(h, maxHeight) : h, minHeight));
}

void SimulatedWindow::SetSizeLimits(int minWidth_, int minHeight_, int maxWidth_, int maxHeight_) {
    minWidth = minWidth_;
    minHeight = minHeight_;
    maxWidth = maxWidth_;
    maxHeight = maxHeight_;
}

void SimulatedWindow::Present(Surface const &surface, DeviceRect const *rects, std::size_t count) {
    if (!picture || picture->Width() != surface.Width() || picture->Height() != surface.Height())
        picture.reset(new Surface(surface.Width(), surface.Height()));
    for (std::size_t i = 0; i < count; ++i) {
        DeviceRect const r{std::max(rects[i].left, 0), std::max(rects[i].top, 0),
                           std::min(rects[i].right, surface.Width()),
                           std::min(rects[i].bottom, surface.Height())};
        if (r.Empty())
            continue;
        presented.push_back(r);
        for (int y = r.top; y < r.bottom; ++y)
            std::memcpy(picture->Row(y) + r.left, surface.Row(y) + r.left,
                        static_cast<std::size_t>(r.Width()) * sizeof(std::uint32_t));
    }
}

std::vector<DeviceRect> SimulatedWindow::TakePresented() {
    std::vector<DeviceRect> taken;
    taken.swap(presented);
    return taken;
}
