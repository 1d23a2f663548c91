// The system's clipboard, as text.
#pragma once
#include "host/UString.h"

namespace Clipboard {

// Empty without text, and without a desktop.
UString Text();
// Zeros, where the clipboard would end, become U+FFFD. Without effect without a desktop.
void SetText(UString const &);

} // namespace Clipboard
