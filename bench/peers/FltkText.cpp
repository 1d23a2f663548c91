// The text in FLTK 1.3: an Fl_Text_Editor.
#include "bench/peers/FltkToolkit.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerText.h"
#include <FL/Fl.H>
#include <FL/Fl_Text_Buffer.H>
#include <FL/Fl_Text_Editor.H>
#include <FL/Fl_Window.H>
#include <memory>

namespace {

class FltkText : public PeerText {
public:
    ~FltkText() override {
        edit->buffer(nullptr);
        window.reset();
    }
    void Show() override {
        window.reset(new Fl_Window(0, 0, kWidth, kHeight, "Text"));
        window->clear_border();
        edit = new Fl_Text_Editor(0, 0, kWidth, kHeight);
        edit->textfont(FL_HELVETICA);
        edit->textsize(PeerForm::kFontSize);
        buffer.text(Lines().c_str());
        edit->buffer(buffer);
        window->end();
        window->show();
        window->wait_for_expose();
        edit->take_focus();
        edit->insert_position(kMiddle);
        edit->show_insert_position();
        Settle();
        FltkToolkit::Finish();
    }
    void Type() override {
        char const typed[] = {kTyped, 0};
        edit->insert(typed);
        edit->show_insert_position(); // as its key does
        FltkToolkit::Finish();
    }
    void Delete() override {
        Fl_Text_Editor::kf_backspace(0, edit);
        FltkToolkit::Finish();
    }
    void Settle() override { FltkToolkit::Settle(); }

private:
    FltkToolkit toolkit;
    Fl_Text_Buffer buffer;
    std::unique_ptr<Fl_Window> window;
    Fl_Text_Editor *edit = nullptr; // the window's
};

} // namespace

PeerText *NewPeerText(int &, char **) { return new FltkText; }
