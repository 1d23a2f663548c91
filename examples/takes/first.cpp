// Opens the window and waits until it is closed.
#include "desktop/Desktop.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"

int main() {
    Desktop desktop;
    glogRec *glog = LoadGlog("takes.xml");
    ShowGlog(glog, kShowGlog);
    return desktop.Run();
}
