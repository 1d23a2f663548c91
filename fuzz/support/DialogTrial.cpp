#include "fuzz/support/DialogTrial.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "dialogs/LoadError.h"
#include "fuzz/support/Require.h"
#include "host/GlogPane.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"

std::string const DialogTrial::kName = "dialog";

namespace {

// Larger windows are allowed, but take hundreds of megabytes to draw.
int const kLargestShownSide = 1000; // pixels
int const kMostClicks = 8;

SimulatedDesktop &OpenDesktop() {
    static SimulatedDesktop desktop;
    return desktop;
}

glogRec *Load(std::function<glogRec *()> const &load) {
    try {
        glogRec *const glog = load();
        Require(glog != nullptr, "what loads without an error is a glog");
        return glog;
    } catch (LoadError const &error) {
        Require(std::string(error.what()).compare(0, DialogTrial::kName.size(), DialogTrial::kName) == 0,
                "an error begins with the dialog's name");
        Require(!error.Message().empty(), "an error says what is wrong");
        return nullptr;
    }
}

// A click in the middle of what each of the first items shows. Where that opens a menu, the key closes it.
std::string ClicksOn(glogRec *glog) {
    std::string script;
    int left = kMostClicks;
    for (GlogPane *pane : Glog::From(glog).Items()) {
        Rect const window = {0, 0, GetGlogHeight(glog), GetGlogWidth(glog)}, box = pane->GetDrawRectangle();
        Rect shown;
        if (VelaDrawing::SectRect(&window, &box, &shown) && left-- > 0)
            script += "click " + std::to_string((shown.left + shown.right) / 2) + ' ' +
                      std::to_string((shown.top + shown.bottom) / 2) + "\nkey Escape\n";
    }
    return script;
}

void Use(SimulatedDesktop &desktop, glogRec *glog) {
    if (GetGlogWidth(glog) <= kLargestShownSide && GetGlogHeight(glog) <= kLargestShownSide) {
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        Require(desktop.Picture(glog) != nullptr, "a shown glog has a picture");
        desktop.Play(ClicksOn(glog));
    }
    Require(!desktop.DumpTree(glog).empty(), "every glog can be described");
    DisposeGlog(glog);
}

} // namespace

void DialogTrial::Run(std::function<glogRec *()> const &load) {
    SimulatedDesktop &desktop = OpenDesktop();
    if (glogRec *const glog = Load(load))
        Use(desktop, glog);
    Require(DesktopRep::Of(desktop).Glogs().empty(), "nothing is left on the desktop");
}
