#include "artwork/compiler/RenderedImage.h"
#include "artwork/compiler/ArtworkError.h"
#include "desktop/resources/AtlasFormat.h"
#include <algorithm>

namespace {

constexpr std::uint32_t kAlphaMask = 0xff000000;

}

RenderedImage::RenderedImage(int w, int h)
    : width(w)
    , height(h)
    , pixels(static_cast<std::size_t>(w) * static_cast<std::size_t>(h)) {}

bool RenderedImage::IsOpaque() const {
    return std::all_of(pixels.begin(), pixels.end(),
                       [](std::uint32_t p) { return (p & kAlphaMask) == kAlphaMask; });
}

bool RenderedImage::IsEmpty() const {
    return std::all_of(pixels.begin(), pixels.end(), [](std::uint32_t p) { return (p & kAlphaMask) == 0; });
}

RenderedImage::Surface RenderedImage::MakeSurface() {
    return Surface(cairo_image_surface_create_for_data(reinterpret_cast<unsigned char *>(pixels.data()),
                                                       CAIRO_FORMAT_ARGB32, width, height,
                                                       width * AtlasFormat::kBytesPerPixel),
                   cairo_surface_destroy);
}

void RenderedImage::WritePng(std::filesystem::path const &path) {
    cairo_status_t const status = cairo_surface_write_to_png(MakeSurface().get(), path.c_str());
    if (status != CAIRO_STATUS_SUCCESS)
        throw ArtworkError(path.string() + ": " + cairo_status_to_string(status));
}
