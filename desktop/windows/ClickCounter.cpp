#include "desktop/windows/ClickCounter.h"
#include "desktop/windows/InputEvent.h"
#include "desktop/windows/PlatformConventions.h"
#include <cstdlib>

int ClickCounter::Count(InputEvent const &press) {
    Take(press, GoesOn(press) ? count + 1 : 1);
    return count;
}

void ClickCounter::Take(InputEvent const &press, int count_) {
    window = press.window;
    button = press.button;
    h = press.h;
    v = press.v;
    time = press.time;
    count = count_;
}

bool ClickCounter::GoesOn(InputEvent const &press) const {
    return window && press.window == window && press.button == button &&
           press.time - time <= PlatformConventions::doubleClickSeconds &&
           std::abs(press.h - h) <= PlatformConventions::doubleClickDistance &&
           std::abs(press.v - v) <= PlatformConventions::doubleClickDistance;
}

void ClickCounter::Forget(PlatformWindow const *gone) {
    if (window == gone)
        window = nullptr;
}
