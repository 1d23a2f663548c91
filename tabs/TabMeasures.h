// The usual measures of tabs, in pixels.
#pragma once

namespace TabMeasures {

int const kHeight = 17;        // of a tab
int const kEndWidth = 6;       // of the icons at both ends
int const kBodyWidth = 18;     // of the tile between them
int const kPlainPadding = 11;  // on each side of a name
int const kLeastPadding = 3;   // the same where room is scarce
int const kOverflowWidth = 24; // of the tab of hidden items
short const kDeadEnd = 2;      // at each end of a tab, where clicks and help tags miss it

} // namespace TabMeasures
