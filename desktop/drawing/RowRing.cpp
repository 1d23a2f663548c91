#include "desktop/drawing/RowRing.h"
#include <algorithm>
#include <cstring>
#include <numeric>
#include <vector>

static void CopyRow(RowRing::Memory const &memory, DeviceRect const &box, int from, int to) {
    std::memcpy(memory.Row(to) + box.left, memory.Row(from) + box.left,
                static_cast<std::size_t>(box.Width()) * sizeof(std::uint32_t));
}

void RowRing::Turn(Memory const &memory, DeviceRect const &of, int distance) {
    bool const same =
        of.left == box.left && of.top == box.top && of.right == box.right && of.bottom == box.bottom;
    if (!same) {
        Settle(memory);
        box = of;
    }
    // What goes out at one end is not needed any more: there comes what has to stay at the other.
    int const rows = std::abs(distance);
    int const gone = distance < 0 ? box.top : box.bottom - rows;
    int const kept = distance < 0 ? box.bottom - rows : box.top;
    for (int i = 0; i < rows; ++i)
        CopyRow(memory, box, Place(kept + i), Place(gone + i));
    int const height = box.Height();
    by = ((by - distance) % height + height) % height;
}

// Each round takes one row out, and moves into each free place what belongs there.
void RowRing::Settle(Memory const &memory) {
    if (!IsTurned())
        return;
    int const height = box.Height();
    std::vector<std::uint32_t> first(static_cast<std::size_t>(box.Width()));
    for (int round = 0; round < std::gcd(height, by); ++round) {
        int free = box.top + round;
        std::copy_n(memory.Row(free) + box.left, box.Width(), first.data());
        for (int next = Place(free); next != box.top + round; next = Place(free)) {
            CopyRow(memory, box, next, free);
            free = next;
        }
        std::copy_n(first.data(), box.Width(), memory.Row(free) + box.left);
    }
    by = 0;
}

std::optional<int> RowRing::Shift(DeviceRect const &part) const {
    if (!IsTurned() || Misses(part))
        return 0;
    int const top = Place(part.top);
    if (!box.Contains(part) || top + part.Height() > box.bottom)
        return std::nullopt;
    return top - part.top;
}

bool RowRing::HasWholeRows(DeviceRect const &part) const {
    return !IsTurned() || Misses(part) || box.Contains(part);
}
