// A push button that asks something in a modal dialog; a label shows the answer.
#pragma once
#include "buttons/OvalButtonPane.h"

class AskButtonPane : public OvalButtonPane {
public:
    // Makes a button and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect", "ButtonText", and "TextID", the number of the label.
    static AskButtonPane *NewAskButtonPane(glogRec *, GlogStyleSheet *);

protected:
    // Asks when the button was pressed.
    int HandleClick(EventRecordAdapter *) override;

private:
    explicit AskButtonPane(short label)
        : labelID(label) {}

    short labelID;
};
