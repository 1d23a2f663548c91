// From the click in the window system's queue to the listener.
#include "bench/BenchPage.h"
#include "bench/ProcessorClock.h"
#include "buttons/OvalButtonPane.h"
#include <benchmark/benchmark.h>
#include <string>

namespace {

class TimedListener : public GlogButtonPaneListener {
public:
    void GlogButtonPressed(GlogButtonPane *) override { heardAt = ProcessorClock::Seconds(); }
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
        double const start = ProcessorClock::Seconds();
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
