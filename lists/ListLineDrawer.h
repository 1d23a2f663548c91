// Draws the rows of a list.
#pragma once
#include "host/Geometry.h"
#include "host/LocalizedStrings.h"

class ListLineDrawer {
public:
    virtual ~ListLineDrawer();

    // Draws one row, from 0, whose box is in the list's coordinates. The ground is erased and the clip set to
    // what is to be drawn of the row, which may be one column. `hilite` is true for a row that shows as
    // selected: a list of the dialog style has painted the highlight already, a small one leaves it to the
    // drawer. The box may be changed and is not kept. Colours are those of GListPane::SetupColors.
    virtual void DrawLine(int line, Rect *rowBox, bool hilite) = 0;
    // The help tag of a cell, of a row and a logical column, in place of the tag of its column: writes where
    // it holds, its placement and place, and answers true. By default false, and nothing is written.
    virtual bool GetHelpTagForLogicalColumn(int line, int column, LocalizedStrings::HelpTag const *, Rect &,
                                            OS::Help::Placement &, double &location);
};
