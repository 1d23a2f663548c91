// Check boxes by the thousand: making them, changing one, clicking the last.
#include "bench/GroupPage.h"
#include "bench/ProcessorClock.h"
#include "buttons/CheckBoxPane.h"
#include "frame/ButtonGroupPaneListener.h"
#include "host/glogRec.h"
#include <benchmark/benchmark.h>

namespace {

int const kFew = 1000, kMany = 10000;
int const kBuilds = 8; // of a repetition: enough for the first one, which meets cold memory, not to matter

// Until all panes stand, ready to be shown; the time of one check box.
void Build(benchmark::State &state, GroupPage::Kind kind) {
    SimulatedDesktop desktop;
    int const boxes = static_cast<int>(state.range(0));
    for (auto _ : state) {
        double const start = ProcessorClock::Seconds();
        glogRec *const glog = GroupPage::Build(desktop, kind, boxes, nullptr);
        state.SetIterationTime((ProcessorClock::Seconds() - start) / boxes);
        DisposeGlog(glog);
    }
}
BENCHMARK_CAPTURE(Build, group, GroupPage::kOneGroup)
    ->Arg(kFew)
    ->Arg(kMany)
    ->UseManualTime()
    ->Iterations(kBuilds);
BENCHMARK_CAPTURE(Build, panes, GroupPage::kManyPanes)
    ->Arg(kFew)
    ->Arg(kMany)
    ->UseManualTime()
    ->Iterations(kBuilds);

// The time of one check box.
void Close(benchmark::State &state, GroupPage::Kind kind) {
    SimulatedDesktop desktop;
    int const boxes = static_cast<int>(state.range(0));
    for (auto _ : state) {
        glogRec *const glog = GroupPage::Build(desktop, kind, boxes, nullptr);
        double const start = ProcessorClock::Seconds();
        DisposeGlog(glog);
        state.SetIterationTime((ProcessorClock::Seconds() - start) / boxes);
    }
}
BENCHMARK_CAPTURE(Close, panes, GroupPage::kManyPanes)
    ->Arg(kFew)
    ->Arg(kMany)
    ->UseManualTime()
    ->Iterations(kBuilds);

int Area(Rect const &r) { return (r.right - r.left) * (r.bottom - r.top); }

// Goes round among the check boxes; the time of a change with its redraw. As a counter the pixels that were
// shown for it beyond those that the check box has to itself.
void Toggle(benchmark::State &state, GroupPage::Kind kind) {
    int const boxes = static_cast<int>(state.range(0));
    int const kStep = 37; // has no factor in common with the number of boxes
    GroupPage page(kind, boxes);
    double beyond = 0;
    int box = 0;
    for (auto _ : state) {
        box = (box + kStep) % boxes;
        page.PaneOf(box).ToggleOne(page.IndexOf(box));
        UpdateGlog(page.Glog());
        int shown = 0;
        for (Rect const &rect : page.desktop.TakePresented(page.Glog()))
            shown += Area(rect);
        if (shown == 0)
            state.SkipWithError("a change has not been shown");
        beyond += shown - Area(page.DamageOf(box));
    }
    state.counters["beyond"] = beyond / static_cast<double>(state.iterations());
}
BENCHMARK_CAPTURE(Toggle, group, GroupPage::kOneGroup)->Arg(kFew)->Arg(kMany);
BENCHMARK_CAPTURE(Toggle, panes, GroupPage::kManyPanes)->Arg(kFew)->Arg(kMany);

class TimedListener : public ButtonGroupPaneListener {
public:
    void ButtonValueChanged(ButtonGroupPane *, short, bool) override { heardAt = ProcessorClock::Seconds(); }
    double heardAt = 0;
};

// From the click in the window system's queue to the listener. The last button of a group is the one that is
// found last; of panes it is the first, which lies under all others.
void Click(benchmark::State &state, GroupPage::Kind kind) {
    int const boxes = static_cast<int>(state.range(0));
    int const box = kind == GroupPage::kOneGroup ? boxes - 1 : 0;
    GroupPage page(kind, boxes);
    TimedListener listener;
    listener.DependUpon(&page.PaneOf(box));
    std::string const click = GroupPage::ClickOn(box);
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
BENCHMARK_CAPTURE(Click, group, GroupPage::kOneGroup)->Arg(1)->Arg(kFew)->UseManualTime();
BENCHMARK_CAPTURE(Click, panes, GroupPage::kManyPanes)->Arg(1)->Arg(kFew)->UseManualTime();

} // namespace
