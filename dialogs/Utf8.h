// Texts of programs and files as panes take them.
#pragma once
#include "host/UString.h"
#include <string>

namespace Utf8 {

// Broken sequences become U+FFFD; so do lone surrogates on the way back.
UString ToUString(std::string const &utf8);
std::string FromUString(UString const &);

} // namespace Utf8
