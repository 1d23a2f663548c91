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
            static_cast<std::size_t>(TilesFor(height_, kTileHeight))) {
    ForgetAll();
}

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

// Row by row through all tiles beside each other, in the order of the memory: the processor then fetches what
// comes next by itself. What is unknown of a tile stays so until all of it is taken: a tile may lie half in a
// view that scrolls, and half in a bar beside it that stays as it is.
void ShownPixels::TakeTiles(Surface::Rows const &rows, DeviceRect const &area, DeviceRect const &range,
                            int row) {
    parts.clear();
    for (int column = range.left; column < range.right; ++column) {
        DeviceRect const place = Place(column, row).Intersected(area);
        Tile &tile = At(column, row);
        tile.top = tile.bottom = place.top;
        parts.push_back({&tile, place, static_cast<std::size_t>(place.Width()) * sizeof(std::uint32_t),
                         place.Intersected(tile.unknown).Empty()});
    }
    TakeRows(rows);
    for (Part const &part : parts)
        if (!part.known && part.place.Contains(part.tile->unknown))
            part.tile->unknown = {0, 0, 0, 0};
}

void ShownPixels::TakeRows(Surface::Rows const &rows) {
    Part const *const first = parts.data(), *const end = first + parts.size();
    int const top = first->place.top, bottom = first->place.bottom;
    std::uint32_t *to = memory + static_cast<std::size_t>(top) * static_cast<std::size_t>(width);
    for (int y = top; y < bottom; ++y, to += width) {
        std::uint32_t const *const from = rows[y];
        for (Part const *part = first; part != end; ++part) {
            int const left = part->place.left;
            if (part->known && std::memcmp(to + left, from + left, part->bytes) == 0)
                continue;
            std::memcpy(to + left, from + left, part->bytes);
            Tile &tile = *part->tile;
            if (tile.top == tile.bottom)
                tile.top = y;
            tile.bottom = y + 1;
        }
    }
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
    Surface::Rows const rows = surface.RowsOf(area);
    DeviceRect const range = TilesOf(area);
    for (int row = range.top; row < range.bottom; ++row)
        TakeTiles(rows, area, range, row);
    std::size_t const first = changed.size();
    Collect(range, changed);
    for (std::size_t i = first; i < changed.size(); ++i)
        changed[i] = changed[i].Intersected(area);
}

void ShownPixels::Forget(Tile &tile, DeviceRect const &place, DeviceRect const &part) {
    if (part.Contains(place)) { // as of most, when a view scrolls
        tile.unknown = place;
        return;
    }
    DeviceRect const lost = part.Intersected(place);
    tile.unknown = tile.unknown.Empty() ? lost : tile.unknown.United(lost);
}

void ShownPixels::Forget(DeviceRect const &rect) {
    DeviceRect const part = rect.Intersected({0, 0, width, height});
    if (part.Empty())
        return;
    DeviceRect const range = TilesOf(part);
    for (int row = range.top; row < range.bottom; ++row)
        for (int column = range.left; column < range.right; ++column)
            Forget(At(column, row), Place(column, row), part);
}

void ShownPixels::ForgetAll() { Forget({0, 0, width, height}); }
