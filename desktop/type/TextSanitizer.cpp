#include "desktop/type/TextSanitizer.h"
#include <algorithm>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

namespace {

constexpr UChar32 kReplacement = 0xFFFD;
constexpr UChar32 kNextLine = 0x85, kLineSeparator = 0x2028, kParagraphSeparator = 0x2029;

bool IsLineBreak(UChar32 c) {
    return (c >= '\n' && c <= '\r') || c == kNextLine || c == kLineSeparator || c == kParagraphSeparator;
}

bool IsUnfit(UChar32 c) {
    bool const control = (c < 0x20 && c != '\t') || (c >= 0x7F && c < 0xA0);
    return control || U_IS_SURROGATE(c);
}

void Append(std::string &utf8, UChar32 c) {
    char bytes[U8_MAX_LENGTH];
    std::size_t length = 0;
    U8_APPEND_UNSAFE(bytes, length, c);
    utf8.append(bytes, length);
}

std::string Sanitize(std::u16string_view text, char lineBreak) {
    std::string utf8;
    utf8.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        UChar32 c;
        U16_NEXT(text.data(), i, text.size(), c);
        if (c == '\r' && i < text.size() && text[i] == u'\n')
            continue; // the line feed breaks the line
        if (IsLineBreak(c))
            utf8 += lineBreak;
        else
            Append(utf8, IsUnfit(c) ? kReplacement : c);
    }
    return utf8;
}

} // namespace

std::string TextSanitizer::OneLine(std::u16string_view text) {
    return Sanitize(text.substr(0, std::min(text.size(), kMaxLineUnits)), ' ');
}

std::string TextSanitizer::Lines(std::u16string_view text) { return Sanitize(text, '\n'); }
