// libsigc++ 3, with listeners that take themselves out.
#include "bench/peers/notify/Notify.h"
#include <deque>
#include <sigc++/sigc++.h>

namespace {

long long heard = 0;

struct Counter : sigc::trackable {
    void Pressed(void *) { ++heard; }
};

class SigcNotify : public Notify {
public:
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i)
            signal.connect(sigc::mem_fun(counters.emplace_back(), &Counter::Pressed));
        return true;
    }
    void Send() override { signal.emit(nullptr); }
    long long Heard() const override { return heard; }

private:
    sigc::signal<void(void *)> signal;
    std::deque<Counter> counters;
};

} // namespace

Notify *NewNotify() { return new SigcNotify; }
