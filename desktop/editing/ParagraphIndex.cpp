#include "desktop/editing/ParagraphIndex.h"
#include <algorithm>

namespace {

constexpr std::uint32_t kMeasured = 0x80000000u;

// How many entries before it an element of the sums stands for.
std::size_t Span(std::size_t element) { return element & (~element + 1); }

} // namespace

ParagraphIndex::Entry ParagraphIndex::Packed(Paragraph const &p) {
    return {p.units, std::min(p.height, kMeasured - 1) | (p.measured ? kMeasured : 0)};
}

std::uint32_t ParagraphIndex::HeightOf(Entry const &entry) { return entry.heightAndMark & ~kMeasured; }

ParagraphIndex::ParagraphIndex()
    : entries(1) {
    Rebuild();
}

ParagraphIndex::Paragraph ParagraphIndex::At(std::size_t index) const {
    Entry const &entry = entries[index];
    return {entry.units, HeightOf(entry), (entry.heightAndMark & kMeasured) != 0};
}

void ParagraphIndex::Rebuild() {
    std::size_t const count = entries.size();
    unitSums.assign(count + 2, 0);
    heightSums.assign(count + 2, 0);
    for (std::size_t i = 1; i <= count; ++i) {
        unitSums[i] += entries[i - 1].units;
        heightSums[i] += HeightOf(entries[i - 1]);
        unitSums[count + 1] += entries[i - 1].units;
        heightSums[count + 1] += HeightOf(entries[i - 1]);
        std::size_t const above = i + Span(i);
        if (above <= count) {
            unitSums[above] += unitSums[i];
            heightSums[above] += heightSums[i];
        }
    }
}

template <class Sum>
void ParagraphIndex::Add(std::vector<Sum> &sums, std::size_t index, std::int64_t difference) {
    if (difference == 0)
        return;
    for (std::size_t i = index + 1; i <= entries.size(); i += Span(i))
        sums[i] = static_cast<Sum>(sums[i] + static_cast<std::uint64_t>(difference));
    sums.back() = static_cast<Sum>(sums.back() + static_cast<std::uint64_t>(difference));
}

template <class Sum>
std::uint64_t ParagraphIndex::SumBefore(std::vector<Sum> const &sums, std::size_t index) {
    std::uint64_t sum = 0;
    for (std::size_t i = index; i > 0; i -= Span(i))
        sum += sums[i];
    return sum;
}

std::size_t ParagraphIndex::StartOf(std::size_t index) const {
    return static_cast<std::size_t>(SumBefore(unitSums, index));
}

long long ParagraphIndex::TopOf(std::size_t index) const {
    return static_cast<long long>(SumBefore(heightSums, index));
}

// The last entry that begins at the place or before.
template <class Sum>
std::size_t ParagraphIndex::Find(std::vector<Sum> const &sums, std::uint64_t place) const {
    std::size_t step = 1, found = 0;
    while (step * 2 <= entries.size())
        step *= 2;
    for (; step > 0; step /= 2) {
        std::size_t const next = found + step;
        if (next <= entries.size() && sums[next] <= place) {
            found = next;
            place -= sums[next];
        }
    }
    return std::min(found, entries.size() - 1);
}

std::size_t ParagraphIndex::AtUnit(std::size_t unit) const { return Find(unitSums, unit); }

std::size_t ParagraphIndex::AtHeight(long long pixel) const {
    return pixel <= 0 ? 0 : Find(heightSums, static_cast<std::uint64_t>(pixel));
}

void ParagraphIndex::SetHeight(std::size_t index, std::uint32_t height, bool measured) {
    Entry &entry = entries[index];
    std::uint32_t const before = HeightOf(entry);
    entry = Packed({entry.units, height, measured});
    Add(heightSums, index, static_cast<std::int64_t>(HeightOf(entry)) - before);
}

void ParagraphIndex::Replace(std::size_t first, std::size_t count, std::vector<Paragraph> const &others) {
    if (count == others.size()) {
        for (std::size_t i = 0; i < count; ++i) {
            Entry &entry = entries[first + i];
            std::int64_t const units = entry.units;
            entry.units = others[i].units;
            Add(unitSums, first + i, static_cast<std::int64_t>(others[i].units) - units);
            SetHeight(first + i, others[i].height, others[i].measured);
        }
        return;
    }
    auto const place = entries.begin() + static_cast<std::ptrdiff_t>(first);
    auto const behind = entries.erase(place, place + static_cast<std::ptrdiff_t>(count));
    std::vector<Entry> packed(others.size());
    std::transform(others.begin(), others.end(), packed.begin(), Packed);
    entries.insert(behind, packed.begin(), packed.end());
    if (entries.empty())
        entries.push_back({0, 0});
    Rebuild();
}
