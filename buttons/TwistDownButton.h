// A triangle that opens and closes something.
//
// It is pressed like any push button, and each completed press flips it before the listeners are told.
#pragma once
#include "buttons/GlogButtonPane.h"

class TwistDownButton : public GlogButtonPane {
public:
    // Makes a closed button of 13 x 13 pixels at (0, 0) and attaches it to the glog, which owns it from then
    // on; null when memory or glog is wanting. The owner moves it to its place.
    static TwistDownButton *NewTwistDownButton(glogRec *);

    // Whether the triangle points down.
    bool IsOpen() const { return open; }

    // Flips the button, but for the release with which the mouse slides off it.
    void Release() override;

protected:
    TwistDownButton();
    void DrawGuts(OSRgn *updateRegion) override;

private:
    bool open;
};
