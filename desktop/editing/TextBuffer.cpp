#include "desktop/editing/TextBuffer.h"
#include <algorithm>
#include <new>

namespace {

// A larger text has a larger gap, but never one that weighs beside it.
constexpr std::size_t kSmallestGap = 32, kLargestGap = 1 << 16, kGapShare = 16;

} // namespace

std::u16string TextBuffer::Copy(std::size_t start, std::size_t end) const {
    std::u16string copy;
    copy.reserve(end - start);
    AppendTo(copy, start, end);
    return copy;
}

void TextBuffer::AppendTo(std::u16string &copy, std::size_t start, std::size_t end) const {
    std::size_t const beforeGap = std::min(end, gapStart);
    if (start < beforeGap)
        copy.append(units.data() + start, beforeGap - start);
    std::size_t const behind = std::max(start, gapStart);
    if (behind < end)
        copy.append(units.data() + behind + (gapEnd - gapStart), end - behind);
}

bool TextBuffer::Equals(std::u16string_view other) const {
    if (other.size() != Size())
        return false;
    auto const begin = units.begin();
    auto const gap = static_cast<std::ptrdiff_t>(gapStart), end = static_cast<std::ptrdiff_t>(gapEnd);
    return std::equal(begin, begin + gap, other.begin()) &&
           std::equal(begin + end, units.end(), other.begin() + gap);
}

void TextBuffer::MoveGap(std::size_t to) {
    auto const at = [this](std::size_t place) { return units.begin() + static_cast<std::ptrdiff_t>(place); };
    std::size_t const room = gapEnd - gapStart;
    if (to < gapStart)
        std::copy_backward(at(to), at(gapStart), at(gapEnd));
    else if (to > gapStart)
        std::copy(at(gapEnd), at(to + room), at(gapStart));
    gapStart = to;
    gapEnd = to + room;
}

void TextBuffer::WidenGap(std::size_t atLeast) {
    std::size_t const spare = std::clamp(Size() / kGapShare, kSmallestGap, kLargestGap);
    std::size_t const more = atLeast + spare - (gapEnd - gapStart);
    std::vector<char16_t> wider;
    wider.reserve(units.size() + more);
    auto const gap = units.begin() + static_cast<std::ptrdiff_t>(gapStart);
    wider.assign(units.begin(), gap);
    wider.resize(gapEnd + more);
    wider.insert(wider.end(), units.begin() + static_cast<std::ptrdiff_t>(gapEnd), units.end());
    units.swap(wider);
    gapEnd += more;
}

void TextBuffer::MakeRoom(std::size_t removed, std::size_t inserted) {
    if (gapEnd - gapStart + removed < inserted)
        WidenGap(inserted - removed);
}

void TextBuffer::Replace(std::size_t start, std::size_t removed, std::u16string_view inserted) {
    MakeRoom(removed, inserted.size());
    MoveGap(start);
    gapEnd += removed;
    std::copy(inserted.begin(), inserted.end(), units.begin() + static_cast<std::ptrdiff_t>(gapStart));
    gapStart += inserted.size();
    // What a large deletion left.
    std::size_t const room = gapEnd - gapStart;
    if (room > 2 * kLargestGap && room > Size())
        GiveBack();
}

void TextBuffer::GiveBack() {
    std::vector<char16_t> tight;
    try {
        tight.reserve(Size());
    } catch (std::bad_alloc const &) {
        return; // then it is kept
    }
    auto const begin = units.begin();
    tight.assign(begin, begin + static_cast<std::ptrdiff_t>(gapStart));
    tight.insert(tight.end(), begin + static_cast<std::ptrdiff_t>(gapEnd), units.end());
    units.swap(tight);
    gapStart = gapEnd = units.size();
}
