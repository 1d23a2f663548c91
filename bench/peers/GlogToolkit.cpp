#include "bench/peers/GlogToolkit.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/PlatformWindow.h"

void FinishDrawing(glogRec *glog) {
    UpdateGlog(glog);
    Glog::From(glog).Window()->Finish();
}
