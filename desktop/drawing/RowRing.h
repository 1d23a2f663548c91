// Rows of pixels that scroll without being moved in memory.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstdint>
#include <optional>

// A box of a surface whose rows stand in memory as on a ring: a scroll step only changes where the ring
// begins, where to move half a megabyte would take as long as all that the step draws. Rows are put back in
// order when somebody wants to have them all.
class RowRing {
public:
    // The pixels of a surface, row by row without gaps.
    struct Memory {
        std::uint32_t *pixels;
        int width;
        std::uint32_t *Row(int y) const {
            return pixels + static_cast<std::size_t>(y) * static_cast<std::size_t>(width);
        }
    };

    bool IsTurned() const { return by != 0; }
    DeviceRect const &Box() const { return box; }
    // Moves what the box shows by less than half its height, down if it is positive. The rows that nothing
    // moves into keep their pixels. The rows of another box are put in order first.
    void Turn(Memory const &, DeviceRect const &box, int distance);
    void Settle(Memory const &);
    // Where the row of the box stands.
    int Place(int y) const { return by == 0 ? y : box.top + (y - box.top + by) % box.Height(); }
    // How many rows farther down in memory all of the part stands; nothing when it stands in several pieces,
    // or lies half in the box.
    std::optional<int> Shift(DeviceRect const &part) const;
    // Whether each row of the part stands in one piece.
    bool HasWholeRows(DeviceRect const &part) const;

private:
    bool Misses(DeviceRect const &part) const { return part.Intersected(box).Empty(); }

    DeviceRect box{0, 0, 0, 0};
    int by = 0; // rows; 0 when all stand where they are shown
};
