// Short ways to write texts in tests.
#pragma once
#include "desktop/resources/Utf.h"
#include "host/UString.h"
#include <ostream>
#include <string_view>

inline UString U(std::string_view utf8) { return Utf::FromUtf8(utf8); }

inline void PrintTo(UString const &text, std::ostream *out) { *out << '"' << Utf::ToUtf8(text) << '"'; }
