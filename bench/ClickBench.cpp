// From the click in the window system's queue to the listener.
#include "bench/BenchPage.h"
#include "buttons/OvalButtonPane.h"
#include <benchmark/benchmark.h>
#include <ctime>
#include <string>

namespace {

double const kSecondsPerNanosecond = 1e-9;

// Of the process, so that other programs do not count.
double ProcessorSeconds() {
    timespec now = {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * kSecondsPerNanosecond;
}

class TimedListener : public GlogButtonPaneListener {
public:
    void GlogButtonPressed(GlogButtonPane *) override { heardAt = ProcessorSeconds(); }
    double heardAt = 0;
};

// The press is drawn, held for its least time, which costs nothing here, and drawn as released.
void ClickToListener(benchmark::State &state) {
    BenchPage page;
    TimedListener listener;
    listener.DependUpon(&page.Button());
    Point const place = BenchPage::PlaceOfButton();
    std::string const click = "click " + std::to_string(place.h) + ' ' + std::to_string(place.v);
    for (auto _ : state) {
        page.desktop.Script(click);
        listener.heardAt = 0;
        double const start = ProcessorSeconds();
        page.desktop.Run();
        state.SetIterationTime(listener.heardAt - start);
        if (listener.heardAt == 0) {
            state.SkipWithError("the listener has not heard of the click");
            break;
        }
        page.desktop.TakePresented(page.Glog());
    }
}
BENCHMARK(ClickToListener)->Name("Click to listener")->UseManualTime();

} // namespace
