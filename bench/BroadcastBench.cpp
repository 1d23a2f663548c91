// Telling dependents, beside a loop with one dynamic_cast and one virtual call for each.
#include "bench/CountingListener.h"
#include <benchmark/benchmark.h>
#include <deque>
#include <vector>

namespace {

int const kMostDependents = 100;

// Sends as panes do.
class Sender : public Provider<GlogButtonPaneListener> {
public:
    void Send() {
        if (HasDependents())
            BroadcastChange(GlogButtonPanePressedMsg(nullptr), nullptr);
    }
};

void CheckHeard(benchmark::State &state, std::deque<CountingListener> const &listeners) {
    for (CountingListener const &listener : listeners)
        if (listener.Heard() != static_cast<long>(state.iterations()))
            state.SkipWithError("a dependent has not heard every message");
}

void BroadcastOurs(benchmark::State &state) {
    Sender sender;
    std::deque<CountingListener> listeners(static_cast<std::size_t>(state.range(0)));
    for (CountingListener &listener : listeners)
        listener.DependUpon(&sender);
    Sender *seen = &sender;
    for (auto _ : state) {
        benchmark::DoNotOptimize(seen);
        seen->Send();
        benchmark::ClobberMemory();
    }
    CheckHeard(state, listeners);
}
BENCHMARK(BroadcastOurs)->Name("Broadcast/ours")->Arg(0)->Arg(1)->Arg(10)->Arg(kMostDependents);

typedef Dependent<GlogButtonPaneListener> AnyDependent;

void Tell(std::vector<AnyDependent *> const &dependents) {
    for (AnyDependent *dependent : dependents)
        if (GlogButtonPaneListener *listener = dynamic_cast<GlogButtonPaneListener *>(dependent))
            listener->GlogButtonPressed(nullptr);
}

void BroadcastBare(benchmark::State &state) {
    std::deque<CountingListener> listeners(static_cast<std::size_t>(state.range(0)));
    std::vector<AnyDependent *> dependents;
    for (CountingListener &listener : listeners)
        dependents.push_back(&listener);
    std::vector<AnyDependent *> const *seen = &dependents;
    for (auto _ : state) {
        benchmark::DoNotOptimize(seen);
        Tell(*seen);
        benchmark::ClobberMemory();
    }
    CheckHeard(state, listeners);
}
BENCHMARK(BroadcastBare)->Name("Broadcast/bare")->Arg(1)->Arg(10)->Arg(kMostDependents);

// What a message to nobody may cost: one test whether there is anybody to call.
void PointerTest(benchmark::State &state) {
    struct Holder {
        CountingListener *listener = nullptr;
    } holder;
    Holder *seen = &holder;
    for (auto _ : state) {
        benchmark::DoNotOptimize(seen);
        if (seen->listener)
            seen->listener->GlogButtonPressed(nullptr);
        benchmark::ClobberMemory();
    }
}
BENCHMARK(PointerTest)->Name("Broadcast/bare/0");

} // namespace
