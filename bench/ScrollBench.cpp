// A scroll step and the drawing that follows it, with little and with much out of sight.
#include "bench/BarePicture.h"
#include "bench/ProcessorClock.h"
#include "desktop/SimulatedDesktop.h"
#include "host/UString.h"
#include "host/glogRec.h"
#include "scrolling/ScrollGrid.h"
#include "scrolling/ScrollPane.h"
#include "text/LabelPane.h"
#include <algorithm>
#include <benchmark/benchmark.h>
#include <string>

namespace {

short const kWidth = 300, kHeight = 400, kBarWidth = 16, kRowHeight = 16; // pixels
int const kStep = 10, kRange = 200;

// Two columns of the window: what is scrolled, and its bar.
class ScrollPage {
public:
    ScrollPage()
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth + kBarWidth, kHeight)))
        , bar(new ScrollBarPane(glog, 0, 0, 0)) {
        Rect box = {0, kWidth, kHeight, kWidth + kBarWidth};
        bar->SetBox(&box);
    }

    GlogPane *NewRow(int number, short top) {
        Rect row = {top, 0, static_cast<short>(top + kRowHeight), kWidth};
        LabelPane *const label = LabelPane::NewLabelPane(
            glog, 0, &row, false,
            UString(("Row " + std::to_string(number)).c_str(), UString::kByteEncoding1));
        label->SetBox(&row);
        return label;
    }
    void Place(GlogPane &scrolled) {
        Rect box = {0, 0, kHeight, kWidth};
        scrolled.SetBox(&box);
    }
    void Show() {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        desktop.TakePresented(glog);
    }
    // Whether anything was shown since the last call.
    bool Shown() { return !desktop.TakePresented(glog).empty(); }

    SimulatedDesktop desktop;
    glogRec *glog;
    ScrollBarPane *bar;
};

// There and back within the same rows, however many lie behind them, so that every step moves and what is
// shown is the same.
class Steps {
public:
    int Next(int position, int greatest) {
        if (position + step < 0 || position + step > std::min(greatest, kRange))
            step = -step;
        return step;
    }

private:
    int step = kStep;
};

// Only the drawing: that every member hears of its new place is a walk over all of them.
void StepOfGrid(benchmark::State &state) {
    ScrollPage page;
    ScrollGrid *const grid = new ScrollGrid(page.glog, 0, page.bar);
    page.Place(*grid);
    for (int i = 0; i < state.range(0); ++i)
        grid->Add(page.NewRow(i, 0), -1);
    page.Show();
    grid->SetSlaved(); // leaves the update to its master
    grid->Prepare();
    Steps steps;
    for (auto _ : state) {
        int const offset = grid->GetScrollOffset();
        grid->Scroll(steps.Next(offset, grid->GetMaxScroll()));
        double const before = ProcessorClock::Seconds();
        UpdateGlog(page.glog);
        state.SetIterationTime(ProcessorClock::Seconds() - before);
        if (grid->GetScrollOffset() == offset || !page.Shown())
            state.SkipWithError("a step has not been shown");
    }
}
BENCHMARK(StepOfGrid)->Name("Scroll/grid")->Arg(100)->Arg(2000)->UseManualTime();

void StepOfPane(benchmark::State &state) {
    ScrollPage page;
    ScrollPane *const pane = new ScrollPane(page.glog);
    page.Place(*pane);
    pane->SetVScrollBar(page.bar);
    short const extent = static_cast<short>(state.range(0));
    for (short top = 0; top + kRowHeight <= extent; top = static_cast<short>(top + kRowHeight))
        pane->Add(page.NewRow(top / kRowHeight, top), -1);
    pane->SetVirtualHeight(extent);
    pane->SetVScrollPos(0);
    page.Show();
    Steps steps;
    for (auto _ : state) {
        int const position = page.bar->GetPosition();
        pane->VScroll(steps.Next(position, pane->GetMaxVScrollValue()));
        UpdateGlog(page.glog);
        if (page.bar->GetPosition() == position || !page.Shown())
            state.SkipWithError("a step has not been shown");
    }
}
BENCHMARK(StepOfPane)->Name("Scroll/pane")->Arg(600)->Arg(30000);

// The rows moved in memory, one text drawn into what comes to light, and all of it taken over.
void StepBare(benchmark::State &state) {
    int const kFont = 0;
    BarePicture picture(kWidth, kHeight);
    picture.Add("Row 1000", kFont, 0, kHeight - kStep);
    picture.Clear();
    Surface &surface = picture.Pixels().surface;
    for (auto _ : state) {
        std::copy(surface.Row(kStep), surface.Row(kHeight), surface.Row(0));
        std::fill(surface.Row(kHeight - kStep), surface.Row(kHeight), Canvas::kWhite);
        cairo_surface_mark_dirty(surface.CairoSurface());
        picture.DrawTexts();
        picture.Show();
    }
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(StepBare)->Name("Scroll/bare");

} // namespace
