// A flat button that stands for one of several choices; the chosen one stands out.
//
// Pressing it works as with any push button, and a click gives 1. Whoever listens decides what is chosen.
#pragma once
#include "buttons/GlogButtonPane.h"
#include "host/TextLayout.h"

class GlogStyleSheet;

class ChoiceButtonPane : public GlogButtonPane {
public:
    // Makes a button and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting.
    static ChoiceButtonPane *NewChoiceButtonPane(glogRec *, Rect const &box, UString const &label);
    // From "BoundsRect", "ButtonText", and "Align": 0 left, 2 centre.
    static ChoiceButtonPane *NewChoiceButtonPane(glogRec *, GlogStyleSheet *);

    void GetButtonText(UString &) const override;
    // Invalidates the pane when it changes.
    void SetChosen(bool);
    bool IsChosen() const { return chosen; }

protected:
    ChoiceButtonPane() {}
    void DrawGuts(OSRgn *updateRegion) override;

private:
    void DrawPlate(Rect const &) const;

    UString label;
    OS::TextLayout layout; // of the label
    bool chosen = false;
    bool centred = false;
};
