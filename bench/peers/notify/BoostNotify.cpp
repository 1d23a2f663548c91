// boost::signals2, with listeners that take themselves out.
#include "bench/peers/notify/Notify.h"
#include <boost/signals2.hpp>
#include <deque>

namespace {

long long heard = 0;

struct Counter {
    void Pressed(void *) { ++heard; }
    boost::signals2::scoped_connection connection;
};

class BoostNotify : public Notify {
public:
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i) {
            Counter &counter = counters.emplace_back();
            counter.connection = signal.connect([&counter](void *source) { counter.Pressed(source); });
        }
        return true;
    }
    void Send() override { signal(nullptr); }
    long long Heard() const override { return heard; }

private:
    boost::signals2::signal<void(void *)> signal;
    std::deque<Counter> counters;
};

} // namespace

Notify *NewNotify() { return new BoostNotify; }
