// Signals of GObject, as GTK's widgets send them.
#include "bench/peers/notify/Notify.h"
#include <deque>
#include <glib-object.h>

namespace {

long long heard = 0;

struct Counter {
    void Pressed() { ++heard; }
};

void Pressed(GObject *, Counter *counter) { counter->Pressed(); }

guint SignalOf(GType type) {
    static guint const signal = g_signal_new("pressed-in-test", type, G_SIGNAL_RUN_LAST, 0, nullptr, nullptr,
                                             g_cclosure_marshal_VOID__VOID, G_TYPE_NONE, 0);
    return signal;
}

class GtkNotify : public Notify {
public:
    ~GtkNotify() override { g_object_unref(sender); }
    bool AddListeners(int count) override {
        for (int i = 0; i < count; ++i)
            g_signal_connect(sender, "pressed-in-test", G_CALLBACK(Pressed), &counters.emplace_back());
        return true;
    }
    void Send() override { g_signal_emit(sender, signal, 0); }
    long long Heard() const override { return heard; }

private:
    guint const signal = SignalOf(G_TYPE_OBJECT);
    GObject *const sender = static_cast<GObject *>(g_object_new(G_TYPE_OBJECT, nullptr));
    std::deque<Counter> counters;
};

} // namespace

Notify *NewNotify() { return new GtkNotify; }
