// A pop-up menu of colours that draws itself: an agent shows the current colour across the whole pane, and
// decorators show each colour in the menu.
#pragma once
#include "menus/PopMPane.h"

class GlogStyleSheet;

class ColorMenuPane : public PopMPane {
public:
    // Makes the menu and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The key is "BoundsRect".
    static ColorMenuPane *NewColorMenuPane(glogRec *, GlogStyleSheet *);
    ~ColorMenuPane() override;

private:
    // Draws in the pane's place; what a click does is left to the pane.
    class Swatch : public PopMPane::Agent {
        void DrawGuts(PopMPane *, OSRgn *, bool &handled) override;
    };

    ColorMenuPane();
    void AddColors();

    Swatch swatch;
};
