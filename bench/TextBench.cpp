// Text whose layout is kept, beside the bare drawing of a layout.
#include "bench/BarePangoText.h"
#include "host/TextLayout.h"
#include "tests/drawing/Canvas.h"
#include <benchmark/benchmark.h>

namespace {

int const kCanvasWidth = 320, kCanvasHeight = 80;
char const kText[] = "Send level";
int const kFont = 0;
int const kNoLimit = -1;
short const kLeft = 20, kTop = 20, kBaseline = 32;

UString Text() { return UString(kText, UString::kByteEncoding1); }

void CheckDrawn(benchmark::State &state, Canvas const &canvas) {
    if (canvas.Count(Canvas::kWhite) == kCanvasWidth * kCanvasHeight)
        state.SkipWithError("nothing has been drawn");
}

// As labels draw theirs.
void TextAtPoint(benchmark::State &state) {
    Canvas canvas(kCanvasWidth, kCanvasHeight);
    UString const text = Text();
    for (auto _ : state)
        DrawStringAtPoint(text, Point{kBaseline, kLeft}, kNoLimit, TextSettings::kTruncateNone);
    CheckDrawn(state, canvas);
}
BENCHMARK(TextAtPoint)->Name("Text/ours at a point");

// As buttons draw theirs.
void TextInRect(benchmark::State &state) {
    Canvas canvas(kCanvasWidth, kCanvasHeight);
    UString const text = Text();
    OS::TextLayout layout;
    Rect const place = {kTop, kLeft, kTop + 24, kLeft + 120};
    for (auto _ : state)
        DrawTextLayoutInRect(layout, text, place, kFont, TextSettings::kAlignCenter,
                             TextSettings::kTruncateNone, 1, 0, 0, 0, 0.0f, 1.0f, 1.0f);
    CheckDrawn(state, canvas);
}
BENCHMARK(TextInRect)->Name("Text/ours in a rectangle");

void TextBare(benchmark::State &state) {
    Canvas canvas(kCanvasWidth, kCanvasHeight);
    BarePangoText text(canvas.surface.CairoSurface(), kText, kFont);
    for (auto _ : state)
        text.Draw(kLeft, kTop);
    CheckDrawn(state, canvas);
}
BENCHMARK(TextBare)->Name("Text/bare");

} // namespace
