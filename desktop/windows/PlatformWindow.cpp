#include "desktop/windows/PlatformWindow.h"
#include "desktop/drawing/Surface.h"

std::unique_ptr<Surface> PlatformWindow::NewSurface(int deviceWidth, int deviceHeight) {
    return std::unique_ptr<Surface>(new Surface(deviceWidth, deviceHeight));
}
