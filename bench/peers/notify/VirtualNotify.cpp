// A bare virtual call for each listener: nobody may leave while a message goes round, nothing is caught.
#include "bench/peers/notify/Notify.h"
#include <deque>
#include <vector>

namespace {

long long heard = 0;

struct Listener {
    virtual ~Listener() {}
    virtual void Pressed(void *) = 0;
};
struct Counter : Listener {
    void Pressed(void *) override {
        ++heard;
        asm volatile("" : : : "memory"); // or the loop would become one addition
    }
};

class VirtualNotify : public Notify {
public:
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i) {
            counters.emplace_back();
            listeners.push_back(&counters.back());
        }
        return true;
    }
    void Send() override {
        for (Listener *listener : listeners)
            listener->Pressed(nullptr);
    }
    long long Heard() const override { return heard; }

private:
    std::deque<Counter> counters;
    std::vector<Listener *> listeners;
};

} // namespace

Notify *NewNotify() { return new VirtualNotify; }
