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

// Room for so many, and some for what comes next.
template <class T> void ReserveMore(std::vector<T> &list, std::size_t count) {
    if (count > list.capacity())
        list.reserve(std::max(count, 2 * list.capacity()));
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

ParagraphIndex::ParagraphIndex()
    : blocks(Divided(Entries(1, Entry{0, 0}))) {
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

ParagraphIndex::Replacement ParagraphIndex::Prepare(std::size_t first, std::size_t count,
                                                    std::vector<Paragraph> const &others) {
    Replacement made;
    made.first = first;
    Entries packed(others.size());
    std::transform(others.begin(), others.end(), packed.begin(), Packed);
    if (count == others.size()) {
        made.entries = std::move(packed);
        return made;
    }
    if (packed.empty() && count == Count())
        packed.push_back({0, 0});
    Place place = Find(&Sum::count, first);
    if (first >= Count()) // behind the last one
        place.within = blocks[place.block].entries.size();
    // What is left of the blocks at both ends goes on in new ones, with the others between.
    std::size_t last = place.block, end = place.within + count;
    while (end > blocks[last].entries.size())
        end -= blocks[last++].entries.size();
    Entries const &before = blocks[place.block].entries, &behind = blocks[last].entries;
    Entries whole;
    whole.reserve(place.within + packed.size() + behind.size() - end);
    whole.insert(whole.end(), before.begin(), Plus(before.begin(), place.within));
    whole.insert(whole.end(), packed.begin(), packed.end());
    whole.insert(whole.end(), Plus(behind.begin(), end), behind.end());
    made.firstBlock = place.block;
    made.numBlocks = last + 1 - place.block;
    made.blocks = Divided(std::move(whole));
    std::size_t const numBlocks = blocks.size() - made.numBlocks + made.blocks.size();
    ReserveMore(blocks, numBlocks);
    ReserveMore(tree, numBlocks + 1);
    return made;
}

void ParagraphIndex::Replace(Replacement &&others) noexcept {
    if (others.numBlocks == 0)
        TakeEntries(others);
    else
        TakeBlocks(others);
}

void ParagraphIndex::TakeEntries(Replacement const &others) {
    for (std::size_t i = 0; i < others.entries.size(); ++i)
        SetEntry(Find(&Sum::count, others.first + i), others.entries[i]);
}

void ParagraphIndex::TakeBlocks(Replacement &others) {
    auto const first = Plus(blocks.begin(), others.firstBlock);
    if (others.numBlocks == 1 && others.blocks.size() == 1) {
        Sum const sumBefore = first->sum;
        *first = std::move(others.blocks.front());
        AddToTree(others.firstBlock, first->sum, sumBefore);
        return;
    }
    std::size_t const common = std::min(others.numBlocks, others.blocks.size());
    auto const from = std::make_move_iterator(others.blocks.begin()),
               to = std::make_move_iterator(others.blocks.end());
    auto const behind = std::copy(from, Plus(from, common), first);
    if (common < others.numBlocks)
        blocks.erase(behind, Plus(first, others.numBlocks));
    else
        blocks.insert(behind, Plus(from, common), to);
    Rebuild();
}

std::vector<ParagraphIndex::Block> ParagraphIndex::Divided(Entries &&whole) {
    std::vector<Block> parts;
    if (whole.size() <= kMostInBlock) {
        if (!whole.empty()) {
            Sum const sum = SumOf(whole);
            parts.push_back({std::move(whole), sum});
        }
        return parts;
    }
    parts.reserve((whole.size() + kUsualInBlock - 1) / kUsualInBlock);
    for (std::size_t start = 0; start < whole.size(); start += kUsualInBlock) {
        Block part;
        part.entries.assign(Plus(whole.begin(), start),
                            Plus(whole.begin(), std::min(start + kUsualInBlock, whole.size())));
        part.sum = SumOf(part.entries);
        parts.push_back(std::move(part));
    }
    return parts;
}
