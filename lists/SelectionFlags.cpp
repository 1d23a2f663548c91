#include "lists/SelectionFlags.h"
#include <algorithm>
#include <limits>
#include <new>
#include <stdexcept>

namespace {

std::size_t const kBlock = 4096; // rows

std::size_t BlockOf(int row) { return static_cast<std::size_t>(row) / kBlock; }
std::size_t NumBlocks(std::size_t rows) { return (rows + kBlock - 1) / kBlock; }

// Bit 0 and the sign are what the flag tells.
short Narrowed(int flag) {
    int const least = std::numeric_limits<short>::min(), greatest = std::numeric_limits<short>::max();
    if (flag >= least && flag <= greatest)
        return static_cast<short>(flag);
    bool const isOdd = (flag & 1) != 0;
    if (flag > 0)
        return static_cast<short>(isOdd ? greatest : greatest - 1);
    return static_cast<short>(isOdd ? least + 1 : least);
}

} // namespace

std::size_t SelectionFlags::EndOfBlock(std::size_t block) const {
    return std::min((block + 1) * kBlock, flags.size());
}

// Sizes

void SelectionFlags::SetCount(int count) {
    std::size_t const rows = static_cast<std::size_t>(std::max(count, 0));
    try {
        nonZero.reserve(NumBlocks(rows));
        flags.resize(rows, 0);
    } catch (std::length_error const &) {
        throw std::bad_alloc();
    }
    if (flags.capacity() / 2 > rows)
        flags.shrink_to_fit();
    CountAnew();
    oddLast = std::min(oddLast, Count() - 1);
}

void SelectionFlags::Clear() {
    Flags().swap(flags);
    nonZero.clear();
    oddLast = kNone;
}

void SelectionFlags::CountAnew() {
    nonZero.assign(NumBlocks(flags.size()), 0);
    for (std::size_t block = 0; block < nonZero.size(); ++block) {
        auto const begin = flags.begin() + static_cast<std::ptrdiff_t>(block * kBlock);
        auto const end = flags.begin() + static_cast<std::ptrdiff_t>(EndOfBlock(block));
        nonZero[block] = static_cast<unsigned short>(end - begin - std::count(begin, end, 0));
    }
}

void SelectionFlags::Insert(int row) {
    int const place = std::clamp(row, 0, Count());
    nonZero.reserve(NumBlocks(flags.size() + 1));
    flags.insert(flags.begin() + place, 0);
    CountAnew();
    NormaliseAllNextTime();
}

void SelectionFlags::Remove(int row) {
    if (!Has(row))
        return;
    flags.erase(flags.begin() + row);
    CountAnew();
    NormaliseAllNextTime();
}

// Where flags of a gesture are may have moved.
void SelectionFlags::NormaliseAllNextTime() {
    if (oddLast == kNone)
        return;
    oddFirst = 0;
    oddLast = Count() - 1;
}

// Flags

void SelectionFlags::Set(int row, int flag) {
    if (!Has(row))
        return;
    short const former = flags[static_cast<std::size_t>(row)];
    short const present = Narrowed(flag);
    flags[static_cast<std::size_t>(row)] = present;
    int const change = (present != 0) - (former != 0);
    unsigned short &count = nonZero[BlockOf(row)];
    count = static_cast<unsigned short>(count + change);
    if (present == 0 || present == 1)
        return;
    oddFirst = oddLast == kNone ? row : std::min(oddFirst, row);
    oddLast = std::max(oddLast, row);
}

void SelectionFlags::SetAllToZero() {
    for (std::size_t block = 0; block < nonZero.size(); ++block) {
        if (nonZero[block] == 0)
            continue;
        std::fill(flags.begin() + static_cast<std::ptrdiff_t>(block * kBlock),
                  flags.begin() + static_cast<std::ptrdiff_t>(EndOfBlock(block)), short(0));
        nonZero[block] = 0;
    }
    oddLast = kNone;
}

void SelectionFlags::SetZerosToOne() {
    for (short &flag : flags)
        flag = flag == 0 ? short(1) : flag;
    for (std::size_t block = 0; block < nonZero.size(); ++block)
        nonZero[block] = static_cast<unsigned short>(EndOfBlock(block) - block * kBlock);
}

void SelectionFlags::Normalise() {
    int const first = oddFirst, last = oddLast;
    oddLast = kNone;
    for (int row = first; row <= last; ++row)
        Set(row, IsSelected(row) ? 1 : 0);
}

// Looking

int SelectionFlags::NumNonZero() const {
    int count = 0;
    for (unsigned short const inBlock : nonZero)
        count += inBlock;
    return count;
}

int SelectionFlags::FirstNonZero() const {
    for (std::size_t block = 0; block < nonZero.size(); ++block) {
        if (nonZero[block] == 0)
            continue;
        auto const begin = flags.begin() + static_cast<std::ptrdiff_t>(block * kBlock);
        auto const found = std::find_if(begin, flags.end(), [](short flag) { return flag != 0; });
        return static_cast<int>(found - flags.begin());
    }
    return kNone;
}

int SelectionFlags::FirstSelectedFrom(int row) const {
    for (int i = std::max(row, 0); Has(i); ++i) {
        if (nonZero[BlockOf(i)] == 0)
            i = static_cast<int>(EndOfBlock(BlockOf(i)) - 1);
        else if (IsSelected(i))
            return i;
    }
    return kNone;
}

int SelectionFlags::LastSelectedTo(int row) const {
    for (int i = std::min(row, Count() - 1); Has(i); --i) {
        if (nonZero[BlockOf(i)] == 0)
            i = static_cast<int>(BlockOf(i) * kBlock);
        else if (IsSelected(i))
            return i;
    }
    return kNone;
}
