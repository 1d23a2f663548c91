// The callback of a widget of FLTK. There is one for each widget.
#include "bench/peers/notify/Notify.h"
#include <FL/Fl_Button.H>

namespace {

long long heard = 0;

class FltkNotify : public Notify {
public:
    bool AddListeners(int count) override {
        sender.callback([](Fl_Widget *) { ++heard; });
        return count == 1;
    }
    void Send() override { sender.do_callback(); }
    long long Heard() const override { return heard; }

private:
    Fl_Button sender{0, 0, 10, 10};
};

} // namespace

Notify *NewNotify() { return new FltkNotify; }
