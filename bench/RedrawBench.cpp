// Redrawing a page of 200 panes: all of it, and a small part.
#include "bench/BarePicture.h"
#include "bench/BenchPage.h"
#include "buttons/OvalButtonPane.h"
#include <benchmark/benchmark.h>
#include <string>

namespace {

short const kDamageSide = 16; // pixels

void RedrawAll(benchmark::State &state) {
    BenchPage page;
    Rect const all = {0, 0, BenchPage::kHeight, BenchPage::kWidth};
    for (auto _ : state)
        page.Redraw(all);
    if (page.desktop.TakePresented(page.Glog()).size() != static_cast<std::size_t>(state.iterations()))
        state.SkipWithError("a redraw has not been shown");
}
BENCHMARK(RedrawAll)->Name("Redraw/all");

// The texts of as many panes and nothing else: no buttons behind them.
void RedrawAllBare(benchmark::State &state) {
    int const kFont = 0;
    BarePicture picture(BenchPage::kWidth, BenchPage::kHeight);
    for (int place = 0; place < BenchPage::kColumns * BenchPage::kRows; ++place)
        picture.Add("Channel " + std::to_string(place + 1), kFont,
                    place % BenchPage::kColumns * BenchPage::kColumnWidth,
                    place / BenchPage::kColumns * BenchPage::kRowHeight);
    for (auto _ : state)
        picture.Repaint();
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(RedrawAllBare)->Name("Redraw/all bare");

// Goes round among places all over the page, so that panes of every kind are met.
void RedrawSpot(benchmark::State &state) {
    BenchPage page;
    int const kStep = 37; // has no factor in common with the number of places
    int place = 0;
    std::size_t shown = 0;
    for (auto _ : state) {
        place = (place + kStep) % (BenchPage::kColumns * BenchPage::kRows);
        short const top = static_cast<short>(place / BenchPage::kColumns * BenchPage::kRowHeight);
        short const left = static_cast<short>(place % BenchPage::kColumns * BenchPage::kColumnWidth);
        page.Redraw(
            {top, left, static_cast<short>(top + kDamageSide), static_cast<short>(left + kDamageSide)});
        shown += page.desktop.TakePresented(page.Glog()).size();
    }
    if (shown != static_cast<std::size_t>(state.iterations()))
        state.SkipWithError("a redraw has not been shown");
}
BENCHMARK(RedrawSpot)->Name("Redraw/spot");

// A button that shows another state, as every press does.
void RedrawButton(benchmark::State &state) {
    BenchPage page;
    Rect const box = page.Button().GetBounds();
    for (auto _ : state) {
        page.Redraw(box);
        benchmark::DoNotOptimize(page.desktop.TakePresented(page.Glog()));
    }
}
BENCHMARK(RedrawButton)->Name("Redraw/button");

} // namespace
