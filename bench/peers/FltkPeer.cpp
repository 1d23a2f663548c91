// The form in FLTK 1.3.
#include "bench/peers/FltkToolkit.h"
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include <FL/Fl.H>
#include <FL/Fl_Check_Button.H>
#include <FL/Fl_Group.H>
#include <FL/Fl_Image_Surface.H>
#include <FL/Fl_Radio_Round_Button.H>
#include <FL/Fl_Window.H>
#include <FL/x.H>
#include <X11/Xlib.h>
#include <memory>
#include <vector>

namespace {

// In a window without a second buffer, which is the faster kind.
class FltkPeer : public Peer {
public:
    void Build(int count, int height) override {
        window.reset(new Fl_Window(0, 0, PeerForm::kWidth, height, PeerForm::kTitle));
        window->clear_border(); // else it leaves room for a frame
        for (int group = 0; group < PeerForm::kGroups; ++group)
            AddGroup(PeerForm::OfGroup(group));
        for (int box = 0; box < count; ++box) {
            PeerForm::Place const place = PeerForm::OfBox(box);
            auto *const button =
                new Fl_Check_Button(place.h, place.v, PeerForm::kColumnWidth, PeerForm::kRowHeight);
            button->copy_label(PeerForm::TextOfBox(box).c_str());
            button->labelsize(PeerForm::kFontSize);
            button->callback(Clicked, this);
            boxes.push_back(button);
        }
        window->end();
    }
    void Destroy() override {
        boxes.clear();
        window.reset(); // with all widgets
    }
    void Show() override {
        window->show();
        window->wait_for_expose();
        Repaint();
    }

    void Repaint() override {
        window->redraw();
        FltkToolkit::Finish();
    }
    void Toggle(int box) override {
        Fl_Check_Button *const button = boxes[static_cast<std::size_t>(box)];
        button->value(!button->value());
        FltkToolkit::Finish();
    }
    // A picture of the server's: there is no drawing into the program's own memory.
    void RepaintOffscreen() override {
        Fl_Image_Surface surface(window->w(), window->h());
        surface.set_current();
        surface.draw(window.get());
        XSync(fl_display, False);
        Fl_Display_Device::display_device()->set_current();
    }

    void Settle() override { FltkToolkit::Settle(); }
    void WaitUntilHeard() override {
        heard = false;
        FltkToolkit::WaitUntil(heard);
    }

private:
    static void AddGroup(PeerForm::Place corner) {
        auto *const group = new Fl_Group(corner.h, corner.v, PeerForm::kGroupWidth, PeerForm::kGroupHeight);
        for (int radio = 0; radio < PeerForm::kRadiosPerGroup; ++radio) {
            PeerForm::Place const place = PeerForm::OfRadio(radio);
            auto *const button = new Fl_Radio_Round_Button(corner.h + place.h, corner.v + place.v,
                                                           PeerForm::kColumnWidth, PeerForm::kRowHeight);
            button->copy_label(PeerForm::TextOfRadio(radio).c_str());
            button->labelsize(PeerForm::kFontSize);
            if (radio == 0)
                button->setonly();
        }
        group->end();
    }
    static void Clicked(Fl_Widget *, void *data) {
        auto *const peer = static_cast<FltkPeer *>(data);
        peer->Heard();
        peer->heard = true;
    }
    FltkToolkit toolkit;
    std::unique_ptr<Fl_Window> window;
    std::vector<Fl_Check_Button *> boxes; // the window's
    bool heard = false;
};

} // namespace

Peer *NewPeer(bool, int &, char **) { return new FltkPeer; }
