#include "bench/peers/FltkToolkit.h"
#include "bench/peers/PeerForm.h"
#include <FL/Fl.H>
#include <FL/x.H>
#include <X11/Xlib.h>

namespace {

double const kLongestWait = 1; // seconds
int const kMostWaits = 100;    // it returns for every event

} // namespace

// A space before the name stands for the upright face.
FltkToolkit::FltkToolkit()
    : font(std::string(" ") + PeerForm::kFontFamily) {
    Fl::set_font(FL_HELVETICA, font.c_str());
}

void FltkToolkit::Finish() {
    Fl::flush();
    XSync(fl_display, False);
}

void FltkToolkit::Settle() {
    Fl::check();
    XSync(fl_display, False);
}

void FltkToolkit::WaitUntil(bool const &over) {
    for (int i = 0; i < kMostWaits && !over; ++i)
        Fl::wait(kLongestWait);
}
