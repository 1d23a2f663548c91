// The port's colours while a text field works.
#pragma once
#include "host/PortSavers.h"
#include "text/GTextPane.h"

// Sets the field's colours, unless it cannot be edited and has none of its own, and puts the port's back. The
// field may be gone by then.
class GTextPane::WithTextColors {
public:
    // For the pane that is about to work.
    explicit WithTextColors(GTextPane &pane) {
        if (pane.ColorsApply())
            pane.SetupColors();
    }

private:
    SaveColors const saved;
};
