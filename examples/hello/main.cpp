// Opens a dialog and tells which of its buttons was pressed.
#include "buttons/GlogButtonPane.h"
#include "desktop/SimulatedDesktop.h"
#include "dialogs/FindItem.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include <iostream>

struct Printer : GlogButtonPaneListener {
    void GlogButtonPressed(GlogButtonPane *button) override {
        std::cout << "button " << button->GetID() << std::endl;
    }
};

int main(int argc, char **argv) {
    // The simulated desktop takes its clicks from a script and needs no display.
    bool const simulated = argc > 1 && argv[1] == std::string("--simulated");
    std::unique_ptr<Desktop> desktop(simulated ? new SimulatedDesktop : new Desktop);
    if (simulated)
        static_cast<SimulatedDesktop &>(*desktop).Script("click @2\nclick @1");
    glogRec *glog = LoadGlog("hello.xml");
    Printer printer;
    for (short id : {1, 2})
        printer.DependUpon(FindItem<GlogButtonPane>(glog, id));
    ShowGlog(glog, kShowGlog);
    return desktop->Run();
}
