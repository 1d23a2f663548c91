#include "bench/BarePicture.h"
#include <algorithm>
#include <benchmark/benchmark.h>

BarePicture::BarePicture(int width, int height)
    : canvas(width, height)
    , shown(static_cast<std::size_t>(width) * static_cast<std::size_t>(height)) {}

void BarePicture::Add(std::string const &text, int font, int left, int top) {
    texts.push_back(
        {std::make_unique<BarePangoText>(canvas.surface.CairoSurface(), text.c_str(), font), left, top});
}

void BarePicture::Clear() {
    std::fill_n(canvas.surface.Pixels(), shown.size(), Canvas::kWhite);
    cairo_surface_mark_dirty(canvas.surface.CairoSurface());
}

void BarePicture::DrawTexts() {
    for (Placed &placed : texts)
        placed.text->Draw(placed.left, placed.top);
    cairo_surface_flush(canvas.surface.CairoSurface());
}

void BarePicture::Show() {
    std::copy_n(canvas.surface.Pixels(), shown.size(), shown.begin());
    benchmark::DoNotOptimize(shown.data());
}

bool BarePicture::IsBlank() const {
    return std::all_of(shown.begin(), shown.end(),
                       [](std::uint32_t pixel) { return pixel == Canvas::kWhite; });
}
