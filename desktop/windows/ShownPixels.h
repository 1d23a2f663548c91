// What of a window's pixels has to be shown anew.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/Surface.h"
#include <cstdint>
#include <vector>

// A copy of the pixels that a window shows, in memory that whoever shows them reads as well. That memory is
// far away for two processors at once: to compare with it is cheap, to write to it and to have it read is
// not. So only what differs goes there, which of a list that was drawn anew a line further down is little.
class ShownPixels {
public:
    // The memory is the caller's, width * height pixels, and must outlive this. Nothing of it is shown yet.
    ShownPixels(std::uint32_t *memory, int width, int height);

    int Width() const { return width; }
    int Height() const { return height; }

    // Copies what differs within the area from the surface, which must be as large as the memory; the area
    // must lie within both. What has to be shown is added to `changed`: rectangles that do not overlap, and
    // reach over what is the same where more of them would cost more than that.
    void Take(Surface const &, DeviceRect const &area, std::vector<DeviceRect> &changed);
    // The rectangle is not shown as it stands here any more.
    void Forget(DeviceRect const &);
    void ForgetAll();

private:
    // A part of the picture that is looked at in one go.
    struct Tile {
        DeviceRect unknown;      // in the picture; all else of the tile is shown as it stands here
        int top = 0, bottom = 0; // rows that differ; equal: none
    };
    int TilesAcross() const;
    Tile &At(int column, int row);
    DeviceRect Place(int column, int row) const;
    void TakeTiles(Surface::Rows const &, DeviceRect const &area, DeviceRect const &range, int row);
    struct Part { // of a tile, to be taken
        Tile *tile;
        DeviceRect place;
        std::size_t bytes; // of a row
        bool known;        // all of it
    };
    void TakeRows(Surface::Rows const &); // of all parts
    static void Forget(Tile &, DeviceRect const &place, DeviceRect const &part);
    void Collect(DeviceRect const &tiles, std::vector<DeviceRect> &changed);

    std::uint32_t *memory;
    int width, height;
    std::vector<Tile> tiles; // row by row
    std::vector<Part> parts; // that are being taken; kept for its memory
};
