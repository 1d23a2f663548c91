#include "desktop/editing/TextFlow.h"
#include "desktop/type/FontLibrary.h"
#include <algorithm>
#include <iterator>

namespace {

// An average of running text, for guesses: a letter is half as wide as the font is high.
int const kWidthShare = 2;
// Beyond as many, what is laid out is dropped before something else is.
std::size_t const kMostLayouts = 512;

} // namespace

TextFlow::TextFlow(TextDocument &document_)
    : document(document_) {}

int TextFlow::LineHeightOf(EditStyle const &style) {
    return std::max(FontLibrary::Instance().Metrics(style.Font()).LineHeight(), 1);
}

int TextFlow::LineHeight() const { return LineHeightOf(document.Styles().At(0)); }

HeightGuess TextFlow::GuessFor(EditStyle const &style) const {
    HeightGuess guess;
    int const lineHeight = LineHeightOf(style), letter = std::max(lineHeight / kWidthShare, 1);
    guess.lineHeight = static_cast<std::uint32_t>(lineHeight);
    if (document.HasSeveralLines())
        guess.unitsPerLine = static_cast<std::uint32_t>(std::max(width / letter, 1));
    return guess;
}

void TextFlow::SetRoom(int width_, TextSettings::Alignment alignment_) {
    if (width == width_ && alignment == alignment_)
        return;
    width = width_;
    alignment = alignment_;
    layouts.clear();
    LooksChanged(GuessFor(document.Styles().At(0)));
}

void TextFlow::LooksChanged(HeightGuess const &guess) noexcept {
    layouts.clear();
    document.GuessHeights(guess);
}

void TextFlow::LooksChanged(std::size_t start, std::size_t end) {
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t const first = paragraphs.AtUnit(start), last = paragraphs.AtUnit(end);
    layouts.erase(layouts.lower_bound(first), layouts.upper_bound(last));
}

// Layouts of paragraphs behind the change go on under their new numbers: those that move away from it from
// the last on, so that none comes where another one still is.
void TextFlow::TextChanged(ParagraphChange const &change) noexcept {
    std::size_t const behind = change.first + change.removed;
    auto next = layouts.erase(layouts.lower_bound(change.first), layouts.lower_bound(behind));
    auto const renumber = [&](auto from) {
        auto node = layouts.extract(from);
        node.key() += change.added;
        node.key() -= change.removed;
        return layouts.insert(std::move(node)).position;
    };
    if (change.added < change.removed) {
        while (next != layouts.end())
            next = std::next(renumber(next));
    } else if (change.added > change.removed) {
        std::size_t count = static_cast<std::size_t>(std::distance(next, layouts.end()));
        for (auto last = layouts.end(); count > 0; --count)
            last = renumber(std::prev(last));
    }
}

ParagraphLayout const &TextFlow::LayoutOf(std::size_t paragraph) {
    auto const found = layouts.find(paragraph);
    if (found != layouts.end() && found->second->IsCurrent())
        return *found->second;
    if (layouts.size() >= kMostLayouts)
        layouts.clear();
    ParagraphIndex &paragraphs = document.Paragraphs();
    std::u16string const body = document.BodyOf(paragraph);
    std::size_t const start = paragraphs.StartOf(paragraph);
    std::unique_ptr<ParagraphLayout> made = std::make_unique<ParagraphLayout>(
        body, document.Styles().Slice(start, start + body.size()),
        ParagraphLayout::Room{width, document.HasSeveralLines(), alignment});
    paragraphs.SetHeight(paragraph, static_cast<std::uint32_t>(made->Height()), true);
    std::unique_ptr<ParagraphLayout> &layout = layouts[paragraph];
    layout = std::move(made);
    return *layout;
}

void TextFlow::ForgetAllBut(std::size_t first, std::size_t last) {
    layouts.erase(layouts.begin(), layouts.lower_bound(first));
    layouts.erase(layouts.upper_bound(last), layouts.end());
}

// Places

TextFlow::Spot TextFlow::SpotOf(std::size_t unit) const {
    std::size_t const paragraph = document.Paragraphs().AtUnit(unit);
    std::size_t const start = document.Paragraphs().StartOf(paragraph);
    return {paragraph, start, unit - start};
}

TextFlow::Place TextFlow::PlaceOf(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    ParagraphLayout const &layout = LayoutOf(spot.paragraph);
    ParagraphLayout::Line const &line = layout.Lines()[layout.LineAtUnit(spot.unit)];
    return {layout.LeftOf(spot.unit), document.Paragraphs().TopOf(spot.paragraph) + line.top, line.height};
}

// Laying the paragraph out may show that the pixel lies in the next one after all.
TextFlow::Spot TextFlow::SpotAtHeight(long long v, std::size_t &line) {
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t paragraph = paragraphs.AtHeight(v);
    while (v >= paragraphs.TopOf(paragraph) + LayoutOf(paragraph).Height() &&
           paragraph + 1 < paragraphs.Count())
        ++paragraph;
    long long const within = v - paragraphs.TopOf(paragraph);
    ParagraphLayout const &layout = LayoutOf(paragraph);
    line = layout.LineAtHeight(static_cast<int>(std::clamp<long long>(within, 0, layout.Height())));
    return {paragraph, paragraphs.StartOf(paragraph), 0};
}

std::size_t TextFlow::UnitAt(int h, long long v) {
    std::size_t line = 0;
    Spot const spot = SpotAtHeight(v, line);
    return spot.start + LayoutOf(spot.paragraph).UnitAt(line, h);
}

std::size_t TextFlow::CharacterAt(int h, long long v) {
    std::size_t line = 0;
    Spot const spot = SpotAtHeight(v, line);
    return spot.start + LayoutOf(spot.paragraph).CharacterAt(line, h);
}

// Steps

std::size_t TextFlow::Before(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    if (spot.unit > 0)
        return spot.start + LayoutOf(spot.paragraph).Before(spot.unit);
    if (spot.paragraph == 0)
        return 0;
    std::size_t const former = spot.paragraph - 1;
    std::size_t const start = document.Paragraphs().StartOf(former);
    std::size_t const body = document.BodyOf(former).size();
    // A paragraph that was cut has nothing at its end that could be stepped over.
    return start + body < spot.start ? start + body : start + LayoutOf(former).Before(body);
}

std::size_t TextFlow::After(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    ParagraphLayout const &layout = LayoutOf(spot.paragraph);
    std::size_t const next = layout.After(spot.unit);
    if (next > spot.unit || spot.paragraph + 1 == document.Paragraphs().Count())
        return spot.start + next;
    return document.Paragraphs().StartOf(spot.paragraph + 1);
}

// Leaving a paragraph goes on in the order of the text.
std::size_t TextFlow::Step(std::size_t unit, bool toTheRight) {
    Spot const spot = SpotOf(unit);
    ParagraphLayout const &layout = LayoutOf(spot.paragraph);
    std::size_t within = spot.unit;
    if (layout.Step(within, toTheRight))
        return spot.start + within;
    bool const onward = toTheRight != layout.IsRightToLeft();
    if (!onward && spot.paragraph > 0)
        return Before(spot.start);
    if (onward && spot.paragraph + 1 < document.Paragraphs().Count())
        return document.Paragraphs().StartOf(spot.paragraph + 1);
    return unit;
}

std::size_t TextFlow::WordBefore(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    return spot.unit > 0 ? spot.start + LayoutOf(spot.paragraph).WordStartBefore(spot.unit) : Before(unit);
}

std::size_t TextFlow::WordAfter(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    std::size_t const end = LayoutOf(spot.paragraph).WordEndAfter(spot.unit);
    return end > spot.unit ? spot.start + end : After(unit);
}

void TextFlow::WordAround(std::size_t unit, std::size_t &start, std::size_t &end) {
    Spot const spot = SpotOf(unit);
    LayoutOf(spot.paragraph).WordAround(spot.unit, start, end);
    start += spot.start;
    end += spot.start;
}

std::size_t TextFlow::DeletionStart(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    return spot.unit > 0 ? spot.start + LayoutOf(spot.paragraph).DeletionStart(spot.unit) : Before(unit);
}

std::size_t TextFlow::LineStart(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    ParagraphLayout const &layout = LayoutOf(spot.paragraph);
    return spot.start + layout.Lines()[layout.LineAtUnit(spot.unit)].start;
}

std::size_t TextFlow::LineEnd(std::size_t unit) {
    Spot const spot = SpotOf(unit);
    ParagraphLayout const &layout = LayoutOf(spot.paragraph);
    std::size_t const line = layout.LineAtUnit(spot.unit);
    std::size_t const end = layout.Lines()[line].end;
    if (line + 1 == layout.Lines().size())
        return spot.start + end;
    return spot.start + std::max(layout.Before(end), layout.Lines()[line].start);
}

ParagraphLayout::Range TextFlow::ExtentOf(std::size_t unit) {
    ParagraphLayout::Range extent(0, 0);
    for (ParagraphLayout::Line const &line : LayoutOf(SpotOf(unit).paragraph).Lines()) {
        extent.first = std::min(extent.first, line.left);
        extent.second = std::max(extent.second, line.left + line.width);
    }
    return extent;
}

bool TextFlow::IsRightToLeft(std::size_t unit) { return LayoutOf(SpotOf(unit).paragraph).IsRightToLeft(); }

void TextFlow::ParagraphAround(std::size_t unit, std::size_t &start, std::size_t &end) const {
    Spot const spot = SpotOf(unit);
    start = spot.start;
    end = document.Paragraphs().StartOf(spot.paragraph + 1);
}
