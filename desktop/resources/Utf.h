// Between UTF-8 outside and UTF-16 inside.
#pragma once
#include "host/UString.h"
#include <cstring>
#include <string>
#include <string_view>

namespace Utf {
// Broken sequences become U+FFFD.
UString FromUtf8(std::string_view);
std::string ToUtf8(UString const &); // lone surrogates become U+FFFD
// The units themselves; valid until the string changes.
std::u16string_view View(UString const &);
UString FromUnits(std::u16string_view);
// Whether both have the same units. Faster than their own operator, which compares unit by unit.
inline bool SameUnits(std::u16string_view a, std::u16string_view b) {
    return a.size() == b.size() &&
           (a.empty() || std::memcmp(a.data(), b.data(), a.size() * sizeof(char16_t)) == 0);
}
} // namespace Utf
