#include "desktop/resources/Utf.h"
#include <climits>
#include <stdexcept>
#include <unicode/ustring.h>

namespace {

constexpr UChar32 kReplacement = 0xFFFD;

// ICU counts in 32 bits; nothing that a user interface shows comes near.
std::int32_t CheckedLength(std::size_t length) {
    if (length > INT32_MAX / 4)
        throw std::length_error("text is too long");
    return static_cast<std::int32_t>(length);
}

} // namespace

UString Utf::FromUtf8(std::string_view utf8) {
    if (utf8.empty())
        return UString();
    // One byte never gives more than one unit.
    std::int32_t const size = CheckedLength(utf8.size());
    std::u16string units(utf8.size(), u'\0');
    std::int32_t length = 0;
    UErrorCode status = U_ZERO_ERROR;
    u_strFromUTF8WithSub(&units[0], size, &length, utf8.data(), size, kReplacement, nullptr, &status);
    units.resize(static_cast<std::size_t>(length));
    return FromUnits(units);
}

std::string Utf::ToUtf8(UString const &text) {
    std::u16string_view const units = View(text);
    if (units.empty())
        return std::string();
    // One unit never gives more than three bytes; a pair gives four.
    constexpr std::int32_t kMostBytesPerUnit = 3;
    std::int32_t const size = CheckedLength(units.size());
    std::string utf8(units.size() * kMostBytesPerUnit, '\0');
    std::int32_t length = 0;
    UErrorCode status = U_ZERO_ERROR;
    u_strToUTF8WithSub(&utf8[0], size * kMostBytesPerUnit, &length, units.data(), size, kReplacement, nullptr,
                       &status);
    utf8.resize(static_cast<std::size_t>(length));
    return utf8;
}
