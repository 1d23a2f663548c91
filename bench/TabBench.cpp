// A row of 40 tabs that is fitted into one width after the other, through all of its steps.
#include "bench/BarePicture.h"
#include "desktop/SimulatedDesktop.h"
#include "host/glogRec.h"
#include "tabs/TabPane.h"
#include <benchmark/benchmark.h>
#include <string>
#include <vector>

namespace {

int const kTabs = 40;
short const kWidth = 2600, kHeight = 30; // pixels, of the window
int const kTabFont = 3;
int const kNarrowest = 20, kStride = 617, kRange = kWidth - kNarrowest;

class TabPage {
public:
    TabPage()
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight))) {
        std::vector<TabPane::Item> items;
        for (int i = 1; i <= kTabs; ++i)
            items.push_back(TabPane::Item(Numbered("Track ", i), Numbered("T", i)));
        tabs = new TabPane(glog, Rect{0, 0, kHeight, kWidth}, items, 0);
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        for (int i = 0; i < kRange; ++i)
            FitNext(); // every text has been shaped once
    }
    // Wide and narrow in turn.
    void FitNext() {
        at = (at + kStride) % kRange;
        FitInto(static_cast<short>(kNarrowest + at));
    }
    void FitInto(short width) { tabs->FitIntoRect({0, 0, kHeight, width}); }
    void Repaint() {
        tabs->Inval();
        UpdateGlog(glog);
    }

private:
    static UString Numbered(char const *word, int number) {
        return UString((word + std::to_string(number)).c_str(), UString::kByteEncoding1);
    }

    SimulatedDesktop desktop;
    glogRec *const glog;
    TabPane *tabs; // the glog's
    int at = 0;
};

void Fit(benchmark::State &state) {
    TabPage page;
    for (auto _ : state)
        page.FitNext();
}
BENCHMARK(Fit)->Name("Tabs/fit");

void FitAndRepaint(benchmark::State &state) {
    TabPage page;
    for (auto _ : state) {
        page.FitNext();
        page.Repaint();
    }
}
BENCHMARK(FitAndRepaint)->Name("Tabs/fit and repaint");

void Repaint(benchmark::State &state) {
    TabPage page;
    page.FitInto(kWidth);
    for (auto _ : state)
        page.Repaint();
}
BENCHMARK(Repaint)->Name("Tabs/repaint");

// Names and nothing else: no tabs behind them.
void RepaintBare(benchmark::State &state) {
    BarePicture picture(kWidth, kHeight);
    for (int i = 0; i < kTabs; ++i)
        picture.Add("Track " + std::to_string(i + 1), kTabFont, i * (kWidth / kTabs), 8);
    for (auto _ : state)
        picture.Repaint();
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(RepaintBare)->Name("Tabs/repaint bare");

} // namespace
