#include "desktop/editing/TextDocument.h"
#include "desktop/editing/ParagraphBreaks.h"
#include <algorithm>

TextDocument::TextDocument(bool severalLines_)
    : severalLines(severalLines_) {
    GuessHeights(guess);
}

std::u16string TextDocument::BodyOf(std::size_t paragraph) const {
    std::size_t const start = paragraphs.StartOf(paragraph);
    std::u16string body = buffer.Copy(start, start + paragraphs.At(paragraph).units);
    if (severalLines)
        body.resize(body.size() - ParagraphBreaks::BreakLength(body));
    return body;
}

TextFragment TextDocument::FragmentOf(std::size_t start, std::size_t end) const {
    return {buffer.Copy(start, end), styles.Slice(start, end)};
}

TextDocument::Replacement TextDocument::Prepare(std::size_t start, std::size_t removed,
                                                TextFragment const &fragment) {
    Replacement made;
    made.start = start;
    made.removed = removed;
    made.inserted = fragment.units;
    made.styles = styles.Replaced(start, removed, fragment.units.size(), fragment.looks, buffer.Size());
    buffer.MakeRoom(removed, fragment.units.size());
    PrepareParagraphs(made);
    return made;
}

ParagraphChange TextDocument::Replace(Replacement &&made) noexcept {
    styles.Take(std::move(made.styles));
    buffer.Replace(made.start, made.removed, made.inserted);
    paragraphs.Replace(std::move(made.paragraphs));
    return made.change;
}

// A paragraph that the next one belongs to if it has room: it was cut, or ends with the first half of a pair.
bool TextDocument::EndsOpen(std::size_t paragraph) const {
    std::size_t const end = paragraphs.StartOf(paragraph + 1);
    return end > 0 && (!ParagraphBreaks::IsBreak(buffer[end - 1]) || buffer[end - 1] == '\r');
}

void TextDocument::PrepareParagraphs(Replacement &made) {
    std::size_t const start = made.start, end = made.start + made.removed;
    std::size_t first = paragraphs.AtUnit(start), last = paragraphs.AtUnit(end);
    if (first > 0 && paragraphs.StartOf(first) == start && EndsOpen(first - 1))
        --first;
    if (last + 1 < paragraphs.Count() && EndsOpen(last))
        ++last;
    bool const toEnd = last + 1 == paragraphs.Count();
    std::vector<std::uint32_t> const lengths =
        LengthsWith(made, paragraphs.StartOf(first), paragraphs.StartOf(last + 1), toEnd);
    std::vector<ParagraphIndex::Paragraph> added;
    added.reserve(lengths.size());
    for (std::uint32_t length : lengths)
        added.push_back({length, guess.Of(length), false});
    // A paragraph that is merely another one keeps its height until it is seen: mostly it is the same.
    std::size_t const count = last - first + 1;
    if (count == added.size())
        for (std::size_t i = 0; i < count; ++i)
            added[i].height = paragraphs.At(first + i).height;
    made.paragraphs = paragraphs.Prepare(first, count, added);
    made.change = {first, count, added.size()};
}

// The paragraphs that what lies between the two places will be.
std::vector<std::uint32_t> TextDocument::LengthsWith(Replacement const &made, std::size_t from,
                                                     std::size_t to, bool toEnd) const {
    std::size_t const size = to - from - made.removed + made.inserted.size();
    if (!severalLines)
        return {static_cast<std::uint32_t>(size)};
    std::u16string text;
    text.reserve(size);
    buffer.AppendTo(text, from, made.start);
    text += made.inserted;
    buffer.AppendTo(text, made.start + made.removed, to);
    return ParagraphBreaks::Split(text, toEnd);
}

void TextDocument::GuessHeights(HeightGuess const &kind) {
    guess = kind;
    paragraphs.ForgetHeights([&](std::uint32_t units) { return guess.Of(units); });
}
