// Icons, rectangles and lines, beside the bare pixman call for the same pixels.
#include "bench/BenchIcons.h"
#include "host/Icons.h"
#include "host/VelaDrawing.h"
#include "tests/drawing/Canvas.h"
#include <benchmark/benchmark.h>

namespace {

int const kCanvasWidth = 640, kCanvasHeight = 480;
int const kBitsPerPixel = 32;
std::uint32_t const kBlack = 0xFF000000u;

short const kLeft = 40, kTop = 30;
short const kRunWidth = 200; // of a line or a run of tiles
short const kRectWidth = 60, kRectHeight = 20;

Rect const kRectangle = {kTop, kLeft, kTop + kRectHeight, kLeft + kRectWidth};

Rect RunOfTiles() { return {kTop, kLeft, static_cast<short>(kTop + BenchIcons::kHeight), kLeft + kRunWidth}; }

// Runs the drawing on a canvas of its own.
template <class Draw> void Measure(benchmark::State &state, Draw draw) {
    Canvas canvas(kCanvasWidth, kCanvasHeight);
    for (auto _ : state) {
        draw(canvas);
        benchmark::ClobberMemory();
    }
    if (canvas.Count(Canvas::kWhite) == kCanvasWidth * kCanvasHeight)
        state.SkipWithError("nothing has been drawn");
}

// A bare drawing call: fills a box of the canvas.
void Fill(Canvas &canvas, int width, int height) {
    pixman_fill(canvas.surface.Pixels(), canvas.surface.Width(), kBitsPerPixel, kLeft, kTop, width, height,
                kBlack);
}

void IconOurs(benchmark::State &state) {
    BenchIcons::Image(BenchIcons::kLeftCap, DeviceScale());
    Measure(state, [](Canvas &) { Draw1Icon(BenchIcons::kFamily, BenchIcons::kLeftCap, kLeft, kTop); });
}
BENCHMARK(IconOurs)->Name("Icon/ours");

void IconBare(benchmark::State &state) {
    PixelImage const image = BenchIcons::Image(BenchIcons::kLeftCap, DeviceScale());
    Measure(state, [&](Canvas &canvas) {
        BenchIcons::Compose(image, canvas.surface.PixmanImage(), kLeft, kTop, image.width);
    });
}
BENCHMARK(IconBare)->Name("Icon/bare");

void TilesOurs(benchmark::State &state) {
    BenchIcons::Image(BenchIcons::kMiddle, DeviceScale());
    Rect const run = RunOfTiles();
    Measure(state, [&](Canvas &) {
        TileIcon(&run, BenchIcons::kFamily, BenchIcons::kMiddle, BenchIcons::kWidth, BenchIcons::kHeight);
    });
}
BENCHMARK(TilesOurs)->Name("Tiles/ours");

void TilesBare(benchmark::State &state) {
    PixelImage const image = BenchIcons::Image(BenchIcons::kMiddle, DeviceScale());
    pixman_image_set_repeat(image.pixels, PIXMAN_REPEAT_NORMAL);
    Measure(state, [&](Canvas &canvas) {
        BenchIcons::Compose(image, canvas.surface.PixmanImage(), kLeft, kTop, kRunWidth);
    });
    pixman_image_set_repeat(image.pixels, PIXMAN_REPEAT_NONE); // it belongs to all
}
BENCHMARK(TilesBare)->Name("Tiles/bare");

void RectangleOurs(benchmark::State &state) {
    Measure(state, [](Canvas &) { VelaDrawing::PaintRect(&kRectangle); });
}
BENCHMARK(RectangleOurs)->Name("Rectangle/ours");

void RectangleBare(benchmark::State &state) {
    Measure(state, [](Canvas &canvas) { Fill(canvas, kRectWidth, kRectHeight); });
}
BENCHMARK(RectangleBare)->Name("Rectangle/bare");

void LineOurs(benchmark::State &state) {
    Measure(state, [](Canvas &) {
        VelaDrawing::MoveTo(kLeft, kTop);
        VelaDrawing::LineTo(kLeft + kRunWidth - 1, kTop);
    });
}
BENCHMARK(LineOurs)->Name("Line/ours");

void LineBare(benchmark::State &state) {
    Measure(state, [](Canvas &canvas) { Fill(canvas, kRunWidth, 1); });
}
BENCHMARK(LineBare)->Name("Line/bare");

} // namespace
