// What labels of the gallery say.
#pragma once
#include "host/UString.h"

struct glogRec;

namespace LabelText {

// The label with that number of the glog shows the text; without effect when there is no such label.
void Show(glogRec *, int labelID, UString const &);
UString OfNumber(int); // in digits

} // namespace LabelText
