#include "desktop/editing/ParagraphBreaks.h"
#include <algorithm>
#include <unicode/uchar.h>
#include <unicode/utf16.h>

namespace {

constexpr char16_t kNextLine = 0x85, kLineSeparator = 0x2028, kParagraphSeparator = 0x2029;
// How far back a better place is looked for, where a paragraph has to be cut.
constexpr std::size_t kFarthestBack = 256;

// Whether a cut before the unit would tear a character apart.
bool GoesOn(std::u16string_view text, std::size_t at) {
    UChar32 c;
    U16_GET(text.data(), 0, at, text.size(), c);
    return U16_IS_TRAIL(text[at]) || u_hasBinaryProperty(c, UCHAR_GRAPHEME_EXTEND) || c == 0x200D ||
           text[at - 1] == 0x200D;
}

// A place to cut at or before the one given: behind a space if there is one nearby.
std::size_t CutOf(std::u16string_view text, std::size_t longest) {
    std::size_t const farthest = longest - kFarthestBack;
    for (std::size_t at = longest; at > farthest; --at)
        if (text[at - 1] == ' ' && !GoesOn(text, at))
            return at;
    return ParagraphBreaks::Fitting(text, longest);
}

// Where text is cut that has no break: its length if it is not.
std::size_t LengthOfOpen(std::u16string_view text) {
    if (text.size() > ParagraphBreaks::kLongestWord &&
        text.substr(0, ParagraphBreaks::kLongestWord).find(u' ') == text.npos)
        return CutOf(text, ParagraphBreaks::kLongestWord);
    return text.size() > ParagraphBreaks::kLongestParagraph ? CutOf(text, ParagraphBreaks::kLongestParagraph)
                                                            : text.size();
}

} // namespace

bool ParagraphBreaks::IsBreak(char16_t c) {
    return (c >= '\n' && c <= '\r') || c == kNextLine || c == kLineSeparator || c == kParagraphSeparator;
}

std::size_t ParagraphBreaks::Fitting(std::u16string_view text, std::size_t room) {
    if (text.size() <= room)
        return text.size();
    for (std::size_t at = room; at > 0 && at + kFarthestBack > room; --at)
        if (!GoesOn(text, at))
            return at;
    return room > kFarthestBack ? room : 0;
}

std::size_t ParagraphBreaks::BreakLength(std::u16string_view paragraph) {
    std::size_t const size = paragraph.size();
    if (size == 0 || !IsBreak(paragraph[size - 1]))
        return 0;
    return size > 1 && paragraph[size - 1] == '\n' && paragraph[size - 2] == '\r' ? 2 : 1;
}

std::vector<std::uint32_t> ParagraphBreaks::Split(std::u16string_view text, bool atEndOfText) {
    std::vector<std::uint32_t> lengths;
    bool open = true; // the last paragraph has no break
    for (std::size_t at = 0; at < text.size();) {
        std::u16string_view const rest = text.substr(at);
        // One unit more may be looked at, for the second of a pair.
        std::size_t const most = std::min(rest.size(), kLongestParagraph);
        auto const found =
            std::find_if(rest.begin(), rest.begin() + static_cast<std::ptrdiff_t>(most), IsBreak);
        std::size_t const body = static_cast<std::size_t>(found - rest.begin());
        std::size_t length = LengthOfOpen(body == most ? rest : rest.substr(0, body));
        open = body == most || length < body;
        if (!open)
            length += rest[length] == '\r' && length + 1 < rest.size() && rest[length + 1] == '\n' ? 2 : 1;
        lengths.push_back(static_cast<std::uint32_t>(length));
        at += length;
    }
    if (atEndOfText && (lengths.empty() || !open))
        lengths.push_back(0);
    return lengths;
}
