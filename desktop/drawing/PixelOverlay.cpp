#include "desktop/drawing/PixelOverlay.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>

WithOverlays::WithOverlays(Surface &surface, std::vector<PixelOverlay> const &overlays) {
    for (PixelOverlay const &overlay : overlays)
        Cover(surface, overlay);
}

void WithOverlays::Cover(Surface &surface, PixelOverlay const &overlay) {
    Surface const &picture = *overlay.picture;
    DeviceRect const box =
        DeviceRect{overlay.left, overlay.top, overlay.left + picture.Width(), overlay.top + picture.Height()}
            .Intersected({0, 0, surface.Width(), surface.Height()});
    for (int y = box.top; y < box.bottom && !box.Empty(); ++y) {
        std::uint32_t *const at = surface.Row(y) + box.left;
        rows.push_back({at, std::vector<std::uint32_t>(at, at + box.Width())});
        std::uint32_t const *const from = picture.Row(y - overlay.top) + (box.left - overlay.left);
        std::copy(from, from + box.Width(), at);
    }
}

WithOverlays::~WithOverlays() {
    for (auto row = rows.rbegin(); row != rows.rend(); ++row)
        std::copy(row->beneath.begin(), row->beneath.end(), row->at);
}
