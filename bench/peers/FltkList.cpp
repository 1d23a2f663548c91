// The list in FLTK 1.3: an Fl_Scroll.
#include "bench/peers/FltkToolkit.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerList.h"
#include <FL/Fl.H>
#include <FL/Fl_Box.H>
#include <FL/Fl_Scroll.H>
#include <FL/Fl_Window.H>
#include <memory>

namespace {

class FltkList : public PeerList {
public:
    void Show() override {
        window.reset(new Fl_Window(0, 0, kWidth + kBarWidth, kHeight, "List"));
        window->clear_border();
        scroll = new Fl_Scroll(0, 0, kWidth + kBarWidth, kHeight);
        scroll->type(Fl_Scroll::VERTICAL_ALWAYS);
        for (int i = 0; i < kLabels; ++i) {
            auto *const label = new Fl_Box(0, i * kRowHeight, kWidth, kRowHeight);
            label->copy_label(TextOf(i).c_str());
            label->labelsize(PeerForm::kFontSize);
            label->align(FL_ALIGN_LEFT | FL_ALIGN_INSIDE);
        }
        scroll->end();
        window->end();
        window->show();
        window->wait_for_expose();
        Settle();
    }
    void ScrollTo(int position) override {
        scroll->scroll_to(0, position);
        FltkToolkit::Finish();
    }
    void Settle() override { FltkToolkit::Settle(); }

private:
    FltkToolkit toolkit;
    std::unique_ptr<Fl_Window> window;
    Fl_Scroll *scroll = nullptr; // the window's
};

} // namespace

PeerList *NewPeerList(int &, char **) { return new FltkList; }
