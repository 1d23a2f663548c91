#include "desktop/editing/ParagraphIndex.h"
#include <algorithm>
#include <iterator>

namespace {

constexpr std::uint32_t kMeasured = 0x80000000u;
// Paragraphs of a block: beyond the first number it is divided into blocks of the second.
constexpr std::size_t kMostInBlock = 64, kUsualInBlock = 32;

// How many blocks before it an element of the tree stands for.
std::size_t Span(std::size_t element) { return element & (~element + 1); }

template <class Iterator> Iterator Plus(Iterator begin, std::size_t offset) {
    return begin + static_cast<std::ptrdiff_t>(offset);
}

} // namespace

ParagraphIndex::Sum &ParagraphIndex::Sum::operator+=(Sum const &other) {
    count += other.count;
    units += other.units;
    height += other.height;
    return *this;
}

ParagraphIndex::Sum &ParagraphIndex::Sum::operator-=(Sum const &other) {
    count -= other.count;
    units -= other.units;
    height -= other.height;
    return *this;
}

ParagraphIndex::Entry ParagraphIndex::Packed(Paragraph const &p) {
    return {p.units, std::min(p.height, kMeasured - 1) | (p.measured ? kMeasured : 0)};
}

std::uint32_t ParagraphIndex::HeightOf(Entry const &entry) { return entry.heightAndMark & ~kMeasured; }

ParagraphIndex::Sum ParagraphIndex::SumOf(Entry const &entry) {
    Sum sum;
    sum.count = 1;
    sum.units = entry.units;
    sum.height = HeightOf(entry);
    return sum;
}

ParagraphIndex::Sum ParagraphIndex::SumOf(Entries const &entries) {
    Sum sum;
    for (Entry const &entry : entries)
        sum += SumOf(entry);
    return sum;
}

ParagraphIndex::ParagraphIndex() {
    Insert({0, 0, Sum()}, Entries(1, Entry{0, 0}));
    Rebuild();
}

// The tree

void ParagraphIndex::Rebuild() {
    std::size_t const count = blocks.size();
    tree.assign(count + 1, Sum());
    all = Sum();
    for (std::size_t i = 1; i <= count; ++i) {
        all += blocks[i - 1].sum;
        tree[i] += blocks[i - 1].sum;
        if (std::size_t const above = i + Span(i); above <= count)
            tree[above] += tree[i];
    }
}

void ParagraphIndex::AddToTree(std::size_t block, Sum const &added, Sum const &removed) {
    for (std::size_t i = block + 1; i < tree.size(); i += Span(i)) {
        tree[i] += added;
        tree[i] -= removed;
    }
    all += added;
    all -= removed;
}

// The last entry that begins at the place or before.
ParagraphIndex::Place ParagraphIndex::Find(std::uint64_t Sum::*what, std::uint64_t target) const {
    std::size_t step = 1;
    while (step * 2 <= blocks.size())
        step *= 2;
    Place place{0, 0, Sum()};
    for (; step > 0; step /= 2) {
        std::size_t const next = place.block + step;
        if (next < blocks.size() && place.before.*what + tree[next].*what <= target) {
            place.block = next;
            place.before += tree[next];
        }
    }
    Entries const &entries = blocks[place.block].entries;
    for (; place.within + 1 < entries.size(); ++place.within) {
        Sum const sum = SumOf(entries[place.within]);
        if (place.before.*what + sum.*what > target)
            break;
        place.before += sum;
    }
    return place;
}

// Looking up

ParagraphIndex::Paragraph ParagraphIndex::At(std::size_t index) const {
    Place const place = Find(&Sum::count, index);
    Entry const &entry = blocks[place.block].entries[place.within];
    return {entry.units, HeightOf(entry), (entry.heightAndMark & kMeasured) != 0};
}

std::size_t ParagraphIndex::StartOf(std::size_t index) const {
    return index >= Count() ? Units() : static_cast<std::size_t>(Find(&Sum::count, index).before.units);
}

long long ParagraphIndex::TopOf(std::size_t index) const {
    return index >= Count() ? Height() : static_cast<long long>(Find(&Sum::count, index).before.height);
}

std::size_t ParagraphIndex::AtUnit(std::size_t unit) const {
    return static_cast<std::size_t>(Find(&Sum::units, unit).before.count);
}

std::size_t ParagraphIndex::AtHeight(long long pixel) const {
    return pixel <= 0
               ? 0
               : static_cast<std::size_t>(Find(&Sum::height, static_cast<std::uint64_t>(pixel)).before.count);
}

// Changing

void ParagraphIndex::SetEntry(Place const &place, Entry entry) {
    Sum const before = SumOf(EntryAt(place)), after = SumOf(entry);
    EntryAt(place) = entry;
    blocks[place.block].sum += after;
    blocks[place.block].sum -= before;
    AddToTree(place.block, after, before);
}

void ParagraphIndex::SetHeight(std::size_t index, std::uint32_t height, bool measured) {
    Place const place = Find(&Sum::count, index);
    SetEntry(place, Packed({EntryAt(place).units, height, measured}));
}

void ParagraphIndex::Replace(std::size_t first, std::size_t count, std::vector<Paragraph> const &others) {
    if (count == others.size()) {
        for (std::size_t i = 0; i < count; ++i)
            SetEntry(Find(&Sum::count, first + i), Packed(others[i]));
        return;
    }
    Entries packed(others.size());
    std::transform(others.begin(), others.end(), packed.begin(), Packed);
    if (packed.empty() && count == Count())
        packed.push_back({0, 0});
    Place place = Find(&Sum::count, first);
    if (first >= Count()) // behind the last one
        place.within = blocks[place.block].entries.size();
    bool const inOneBlock = place.within + count <= blocks[place.block].entries.size();
    std::size_t const blocksBefore = blocks.size();
    Sum const sumBefore = blocks[place.block].sum;
    Remove(place, count);
    Insert(place, packed);
    if (inOneBlock && blocks.size() == blocksBefore)
        AddToTree(place.block, blocks[place.block].sum, sumBefore);
    else
        Rebuild();
}

// Leaves the tree as it is, and the first block there even when nothing is left of it.
void ParagraphIndex::Remove(Place const &place, std::size_t count) {
    std::size_t at = place.block, within = place.within;
    for (; count > 0; ++at, within = 0) {
        Block &block = blocks[at];
        std::size_t const taken = std::min(count, block.entries.size() - within);
        auto const first = Plus(block.entries.begin(), within);
        block.entries.erase(first, Plus(first, taken));
        block.sum = SumOf(block.entries);
        count -= taken;
    }
    auto const isEmpty = [](Block const &block) { return block.entries.empty(); };
    auto const second = Plus(blocks.begin(), std::min(place.block + 1, blocks.size()));
    auto const behind = std::max(second, Plus(blocks.begin(), at));
    blocks.erase(std::remove_if(second, behind, isEmpty), behind);
}

// Leaves the tree as it is.
void ParagraphIndex::Insert(Place const &place, Entries const &others) {
    if (blocks.empty())
        blocks.emplace_back();
    Block &block = blocks[place.block];
    block.entries.insert(Plus(block.entries.begin(), place.within), others.begin(), others.end());
    block.sum += SumOf(others);
    if (block.entries.empty())
        blocks.erase(Plus(blocks.begin(), place.block));
    else if (block.entries.size() > kMostInBlock)
        Divide(place.block);
}

void ParagraphIndex::Divide(std::size_t block) {
    Entries const whole = std::move(blocks[block].entries);
    std::vector<Block> parts;
    for (std::size_t start = 0; start < whole.size(); start += kUsualInBlock) {
        Block part;
        part.entries.assign(Plus(whole.begin(), start),
                            Plus(whole.begin(), std::min(start + kUsualInBlock, whole.size())));
        part.sum = SumOf(part.entries);
        parts.push_back(std::move(part));
    }
    blocks[block] = std::move(parts.front());
    blocks.insert(Plus(blocks.begin(), block + 1), std::make_move_iterator(std::next(parts.begin())),
                  std::make_move_iterator(parts.end()));
}
