// An icon button that counts while it is held down; a label shows the count.
#pragma once
#include "buttons/GIconButtonPane.h"

class GlogStyleSheet;

class HoldButtonPane : public GIconButtonPane {
public:
    // Makes a button and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect"; "FamilyID" and "Num", where its five icons are: off, on, disabled,
    // off held down, on held down; "TextID", the number of the label; and "Mode", 1 to disable the button.
    static HoldButtonPane *NewHoldButtonPane(glogRec *, GlogStyleSheet *);

    // Counts.
    void DoButtonPress(int modifiers) override;
    // The button stays off.
    short ClickAction(int modifiers) override;

private:
    explicit HoldButtonPane(int label)
        : labelID(label)
        , count(0) {}

    int labelID;
    int count;
};
