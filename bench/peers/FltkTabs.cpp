// The tabs in FLTK 1.3: an Fl_Tabs.
#include "bench/peers/FltkToolkit.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerTabs.h"
#include <FL/Fl.H>
#include <FL/Fl_Group.H>
#include <FL/Fl_Tabs.H>
#include <FL/Fl_Window.H>
#include <memory>

namespace {

int const kTabHeight = 20;

class FltkTabs : public PeerTabs {
public:
    void Show() override {
        window.reset(new Fl_Window(0, 0, kWidest, kHeight, "Tabs"));
        window->clear_border();
        tabs = new Fl_Tabs(0, 0, kWidest, kHeight);
        for (int i = 0; i < kTabs; ++i) {
            auto *const page = new Fl_Group(0, kTabHeight, kWidest, kHeight - kTabHeight);
            page->copy_label(NameOf(i).c_str());
            page->labelsize(PeerForm::kFontSize);
            page->end();
        }
        tabs->resizable(nullptr); // the pages are nobody's concern here
        tabs->end();
        window->end();
        window->show();
        window->wait_for_expose();
        Settle();
    }
    void SetWidth(int width) override {
        tabs->resize(0, 0, width, kHeight);
        window->redraw(); // what the row has left is the window's
        FltkToolkit::Finish();
    }
    void Settle() override { FltkToolkit::Settle(); }

private:
    FltkToolkit toolkit;
    std::unique_ptr<Fl_Window> window;
    Fl_Tabs *tabs = nullptr; // the window's
};

} // namespace

PeerTabs *NewPeerTabs(int &, char **) { return new FltkTabs; }
