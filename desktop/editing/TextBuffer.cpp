#include "desktop/editing/TextBuffer.h"
#include <algorithm>

namespace {

// A larger text has a larger gap, but never one that weighs beside it.
constexpr std::size_t kSmallestGap = 32, kLargestGap = 1 << 16, kGapShare = 16;

} // namespace

std::u16string TextBuffer::Copy(std::size_t start, std::size_t end) const {
    std::u16string copy;
    copy.reserve(end - start);
    std::size_t const beforeGap = std::min(end, gapStart);
    if (start < beforeGap)
        copy.append(units.data() + start, beforeGap - start);
    std::size_t const behind = std::max(start, gapStart);
    if (behind < end)
        copy.append(units.data() + behind + (gapEnd - gapStart), end - behind);
    return copy;
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

void TextBuffer::Replace(std::size_t start, std::size_t removed, std::u16string_view inserted) {
    MoveGap(start);
    gapEnd += removed;
    if (gapEnd - gapStart < inserted.size())
        WidenGap(inserted.size());
    std::copy(inserted.begin(), inserted.end(), units.begin() + static_cast<std::ptrdiff_t>(gapStart));
    gapStart += inserted.size();
    // What a large deletion left is given back.
    std::size_t const room = gapEnd - gapStart;
    if (room > 2 * kLargestGap && room > Size()) {
        std::vector<char16_t> tight;
        std::u16string const all = Copy(0, Size());
        tight.assign(all.begin(), all.end());
        units.swap(tight);
        gapStart = gapEnd = units.size();
    }
}
