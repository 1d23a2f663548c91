#include "desktop/editing/ShownText.h"
#include "desktop/editing/ParagraphBreaks.h"
#include <algorithm>
#include <unicode/uchar.h>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

namespace {

constexpr char32_t kReplacement = 0xFFFD;
// No script puts as many marks on a letter. Shaping them takes a time that grows with the square of their
// number.
constexpr int kMostMarks = 30;

bool IsPlain(char16_t c) { return (c >= 0x20 && c < 0x7F) || c == '\t'; }

char32_t Shown(UChar32 c) {
    bool const control = (c < 0x20 && c != '\t') || (c >= 0x7F && c < 0xA0);
    if (c <= 0xFFFF && ParagraphBreaks::IsBreak(static_cast<char16_t>(c)))
        return ' ';
    return control || U_IS_SURROGATE(c) ? kReplacement : static_cast<char32_t>(c);
}

bool IsMark(UChar32 c) { return (U_GET_GC_MASK(c) & U_GC_M_MASK) != 0; }

std::size_t FirstAt(std::vector<std::uint32_t> const &places, std::uint32_t place) {
    return static_cast<std::size_t>(std::lower_bound(places.begin(), places.end(), place) - places.begin());
}

} // namespace

ShownText::ShownText(std::u16string_view text)
    : units(text.size()) {
    utf8.reserve(text.size());
    if (std::all_of(text.begin(), text.end(), IsPlain)) {
        utf8.assign(text.begin(), text.end());
        return;
    }
    bytes.reserve(text.size() + 1);
    characters.reserve(text.size() + 1);
    int marks = 0; // one behind the other
    for (std::size_t i = 0; i < text.size();) {
        std::size_t const start = i;
        UChar32 c;
        U16_NEXT(text.data(), i, text.size(), c);
        marks = IsMark(c) ? marks + 1 : 0;
        Add(i - start, marks > kMostMarks ? kReplacement : Shown(c));
    }
    Add(1, 0); // the end
    utf8.pop_back();
}

void ShownText::Add(std::size_t unitCount, char32_t shown) {
    std::uint32_t const character = characters.empty() ? 0 : characters.back() + 1;
    bytes.insert(bytes.end(), unitCount, static_cast<std::uint32_t>(utf8.size()));
    characters.insert(characters.end(), unitCount, character);
    char encoded[U8_MAX_LENGTH];
    std::size_t length = 0;
    U8_APPEND_UNSAFE(encoded, length, static_cast<UChar32>(shown));
    utf8.append(encoded, length);
}

int ShownText::ByteOf(std::size_t unit) const {
    std::size_t const at = std::min(unit, units);
    return static_cast<int>(bytes.empty() ? at : bytes[at]);
}

std::size_t ShownText::CharacterOf(std::size_t unit) const {
    std::size_t const at = std::min(unit, units);
    return characters.empty() ? at : characters[at];
}

std::size_t ShownText::UnitOfByte(int byte) const {
    return bytes.empty() ? static_cast<std::size_t>(byte) : FirstAt(bytes, static_cast<std::uint32_t>(byte));
}

std::size_t ShownText::UnitOfCharacter(std::size_t character) const {
    return characters.empty() ? character : FirstAt(characters, static_cast<std::uint32_t>(character));
}
