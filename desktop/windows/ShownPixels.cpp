#include "desktop/windows/ShownPixels.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>
#include <cstring>

static int const kTileWidth = 64, kTileHeight = 16; // pixels
// A rectangle more costs about as much as to show this many rows of a tile.
static int const kRowsOfARectangle = 32;

static int TilesFor(int pixels, int tile) { return (pixels + tile - 1) / tile; }

ShownPixels::ShownPixels(std::uint32_t *memory_, int width_, int height_)
    : memory(memory_)
    , width(width_)
    , height(height_)
    , tiles(static_cast<std::size_t>(TilesAcross()) *
            static_cast<std::size_t>(TilesFor(height_, kTileHeight))) {}

int ShownPixels::TilesAcross() const { return TilesFor(width, kTileWidth); }

ShownPixels::Tile &ShownPixels::At(int column, int row) {
    return tiles[static_cast<std::size_t>(row) * static_cast<std::size_t>(TilesAcross()) +
                 static_cast<std::size_t>(column)];
}

DeviceRect ShownPixels::Place(int column, int row) const {
    int const left = column * kTileWidth, top = row * kTileHeight;
    return {left, top, std::min(left + kTileWidth, width), std::min(top + kTileHeight, height)};
}

static DeviceRect TilesOf(DeviceRect const &area) {
    return {area.left / kTileWidth, area.top / kTileHeight, TilesFor(area.right, kTileWidth),
            TilesFor(area.bottom, kTileHeight)};
}

static bool SameSize(DeviceRect const &a, DeviceRect const &b) {
    return a.Width() == b.Width() && a.Height() == b.Height();
}

// A tile of which a part is taken stays unknown if it was.
void ShownPixels::TakeTile(Surface const &surface, DeviceRect const &area, int column, int row) {
    Tile &tile = At(column, row);
    DeviceRect const place = Place(column, row), part = place.Intersected(area);
    std::size_t const bytes = static_cast<std::size_t>(part.Width()) * sizeof(std::uint32_t);
    tile.top = tile.bottom = part.top;
    for (int y = part.top; y < part.bottom; ++y) {
        std::uint32_t const *const from = surface.Row(y) + part.left;
        std::uint32_t *const to =
            memory + static_cast<std::size_t>(y) * static_cast<std::size_t>(width) + part.left;
        if (tile.known && std::memcmp(to, from, bytes) == 0)
            continue;
        std::memcpy(to, from, bytes);
        if (tile.top == tile.bottom)
            tile.top = y;
        tile.bottom = y + 1;
    }
    tile.known = tile.known || SameSize(part, place);
}

// Runs of differing rows down each column of tiles; what is alike in neighbouring columns becomes one.
void ShownPixels::Collect(DeviceRect const &range, std::vector<DeviceRect> &changed) {
    std::size_t before = changed.size(); // where the runs of the column before begin
    for (int column = range.left; column < range.right; ++column) {
        std::size_t const begin = changed.size();
        DeviceRect const across = Place(column, 0);
        for (int row = range.top; row < range.bottom; ++row) {
            Tile const &tile = At(column, row);
            if (tile.top == tile.bottom)
                continue;
            if (changed.size() > begin && tile.top - changed.back().bottom <= kRowsOfARectangle)
                changed.back().bottom = tile.bottom;
            else
                changed.push_back({across.left, tile.top, across.right, tile.bottom});
        }
        bool const alike = column > range.left && begin - before == changed.size() - begin &&
                           std::equal(changed.begin() + static_cast<std::ptrdiff_t>(before),
                                      changed.begin() + static_cast<std::ptrdiff_t>(begin),
                                      changed.begin() + static_cast<std::ptrdiff_t>(begin),
                                      [&](DeviceRect const &a, DeviceRect const &b) {
                                          return a.right == b.left && a.top == b.top && a.bottom == b.bottom;
                                      });
        if (alike) {
            for (std::size_t i = before; i < begin; ++i)
                changed[i].right = across.right;
            changed.resize(begin);
        } else {
            before = begin;
        }
    }
}

void ShownPixels::Take(Surface const &surface, DeviceRect const &area, std::vector<DeviceRect> &changed) {
    if (area.Empty())
        return;
    DeviceRect const range = TilesOf(area);
    for (int row = range.top; row < range.bottom; ++row)
        for (int column = range.left; column < range.right; ++column)
            TakeTile(surface, area, column, row);
    std::size_t const first = changed.size();
    Collect(range, changed);
    for (std::size_t i = first; i < changed.size(); ++i)
        changed[i] = changed[i].Intersected(area);
}

void ShownPixels::Forget(DeviceRect const &rect) {
    DeviceRect const part = rect.Intersected({0, 0, width, height});
    if (part.Empty())
        return;
    DeviceRect const range = TilesOf(part);
    for (int row = range.top; row < range.bottom; ++row)
        for (int column = range.left; column < range.right; ++column)
            At(column, row).known = false;
}

void ShownPixels::ForgetAll() { Forget({0, 0, width, height}); }
