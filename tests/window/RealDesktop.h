// What tests of a whole desktop on real windows share: waiting for it, and a hand on the mouse beside it.
#pragma once
#include "desktop/Desktop.h"
#include "host/Geometry.h"
#include <functional>
#include <gtest/gtest.h>
#include <string>

struct glogRec;

class RealDesktop : public testing::Test {
protected:
    RealDesktop()
        : desktop(DesktopOptions().Scale(1)) {}

    // Handles events until it is so; a failure if it never is.
    void WaitFor(std::function<bool()> const &isSo);
    // Shows the glog and waits until its content is at the place of the screen, and active.
    void ShowAt(glogRec *, Rect const &place);
    // Handles events while the hand is at work, in a thread of its own, and then what has come of it.
    void Beside(std::function<void()> const &hand);
    // Gives the lines to xdotool, which has done them when this returns. For the hand.
    static void Do(std::string const &lines);

    Desktop desktop;
};
