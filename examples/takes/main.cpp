// The program: the window with its behaviour, on a real desktop.
#include "Takes.h"
#include "desktop/Desktop.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include <iostream>

int main() {
    try {
        Desktop desktop;
        glogRec *glog = LoadGlog("takes.xml");
        Takes takes(glog);
        desktop.SetHitHandler([&](glogRec *, int item, int) {
            if (item == Takes::kDone)
                desktop.Quit();
        });
        ShowGlog(glog, kShowGlog);
        return desktop.Run();
    } catch (std::exception const &error) {
        std::cerr << error.what() << '\n';
        return 1;
    }
}
