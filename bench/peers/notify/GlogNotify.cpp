// Listeners of our panes.
#include "bench/peers/notify/Notify.h"
#include "frame/GlogButtonPaneListener.h"
#include <deque>

namespace {

long long heard = 0;

class Counter : public GlogButtonPaneListener {
    void GlogButtonPressed(GlogButtonPane *) override { ++heard; }
};

class GlogNotify : public Notify {
public:
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i) {
            counters.emplace_back();
            counters.back().DependUpon(&sender);
        }
        return true;
    }
    void Send() override { sender.Send(); }
    long long Heard() const override { return heard; }

private:
    // Sends as panes do.
    class Sender : public Provider<GlogButtonPaneListener> {
    public:
        void Send() {
            if (HasDependents())
                BroadcastChange(GlogButtonPanePressedMsg(nullptr), nullptr);
        }
    };
    Sender sender;
    std::deque<Counter> counters; // dies first
};

} // namespace

Notify *NewNotify() { return new GlogNotify; }
