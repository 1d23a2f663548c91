// What labels of the gallery say.
#pragma once
#include "host/UString.h"

class GlogPane;
struct glogRec;

namespace LabelText {

// The label with that number of the glog shows the text; without effect when there is no such label.
void Show(glogRec *, int labelID, UString const &);
// The same for a pane that is a label; any other, and null, has no effect.
void Show(GlogPane *, UString const &);
UString OfNumber(int);                // in digits
UString WithMinus(char const *ascii); // with a minus sign in place of each hyphen
// Written as in the user's language: with so many decimals, or with a mark between thousands.
UString OfDecimal(double, int decimals);
UString OfThousands(int); // not below 0

} // namespace LabelText
