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

ParagraphChange TextDocument::Replace(std::size_t start, std::size_t removed, TextFragment const &fragment) {
    styles.Replace(start, removed, fragment.units.size(), fragment.looks, buffer.Size());
    return ReplaceParagraphs(start, removed, fragment.units);
}

// A paragraph that the next one belongs to if it has room: it was cut, or ends with the first half of a pair.
bool TextDocument::EndsOpen(std::size_t paragraph) const {
    std::size_t const end = paragraphs.StartOf(paragraph + 1);
    return end > 0 && (!ParagraphBreaks::IsBreak(buffer[end - 1]) || buffer[end - 1] == '\r');
}

ParagraphChange TextDocument::ReplaceParagraphs(std::size_t start, std::size_t removed,
                                                std::u16string_view inserted) {
    std::size_t first = paragraphs.AtUnit(start), last = paragraphs.AtUnit(start + removed);
    if (first > 0 && paragraphs.StartOf(first) == start && EndsOpen(first - 1))
        --first;
    if (last + 1 < paragraphs.Count() && EndsOpen(last))
        ++last;
    bool const toEnd = last + 1 == paragraphs.Count();
    std::size_t const from = paragraphs.StartOf(first);
    std::size_t const to = paragraphs.StartOf(last + 1) - removed + inserted.size();
    buffer.Replace(start, removed, inserted);

    std::vector<std::uint32_t> lengths;
    if (severalLines)
        lengths = ParagraphBreaks::Split(buffer.Copy(from, to), toEnd);
    else
        lengths.push_back(static_cast<std::uint32_t>(to - from));
    std::vector<ParagraphIndex::Paragraph> added;
    added.reserve(lengths.size());
    for (std::uint32_t length : lengths)
        added.push_back({length, guess.Of(length), false});
    // A paragraph that is merely another one keeps its height until it is seen: mostly it is the same.
    std::size_t const count = last - first + 1;
    if (count == added.size())
        for (std::size_t i = 0; i < count; ++i)
            added[i].height = paragraphs.At(first + i).height;
    paragraphs.Replace(first, count, added);
    return {first, count, added.size()};
}

void TextDocument::GuessHeights(HeightGuess const &kind) {
    guess = kind;
    paragraphs.ForgetHeights([&](std::uint32_t units) { return guess.Of(units); });
}
