// The icons of a theme at one scale.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/resources/Atlas.h"
#include <array>
#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <tuple>
#include <unordered_map>
#include <vector>

class Surface;

// Icons come from one or more atlases, of which a later one goes before an earlier one: the library's, then
// those of the application. An atlas of another scale than the port's does, too: its icons are scaled.
class IconSet {
public:
    // Paths of the atlases; one that is broken throws std::runtime_error.
    explicit IconSet(std::vector<std::string> const &atlases);
    ~IconSet();
    IconSet(IconSet const &) = delete;
    IconSet &operator=(IconSet const &) = delete;

    // An icon, or the place where one is missing.
    struct Icon {
        int width, height; // logical pixels: the icon's own size, or its family's, or that of the mark for a
                           // missing one
        int layer = -1;    // -1: there is no artwork, not even the mark
        AtlasFormat::IconRecord const *record = nullptr;
    };
    // The icon; the artwork's mark for a missing icon, in the family's size, when there is none.
    Icon Find(short family, short index);
    // The size of a family's icons, in logical pixels; the mark's size for an unknown family.
    Icon FindFamily(short family) const;

    // The icon at that size in device pixels: straight from the atlas where that has it, else scaled and
    // kept. Only for icons with artwork; each side at least 1. Valid until the next call.
    PixelImage Image(Icon const &, int deviceWidth, int deviceHeight);
    // The same, that many times side by side and below each other, and kept: bars are covered by dozens of
    // small tiles, which costs more than all else in a bar. For the tiles of an area that starts at its top
    // left.
    PixelImage Tiles(Icon const &, int deviceWidth, int deviceHeight, DeviceRect const &area);

private:
    struct Layer;
    struct Scaled;
    // What was found last among the icons that share a place in the table.
    struct Found {
        short family, index;
        bool known = false;
        Icon icon;
    };
    static constexpr std::size_t kFoundPlaces = 128; // a power of two

    Icon Search(short family, short index) const;
    PixelImage Stored(Layer &, AtlasFormat::IconRecord const &, int choice);
    PixelImage ScaledImage(Icon const &, int deviceWidth, int deviceHeight);

    std::vector<std::unique_ptr<Layer>> layers;
    std::unordered_map<std::uint64_t, Scaled> scaled;
    typedef std::tuple<AtlasFormat::IconRecord const *, int, int, int, int> TilesKey; // size of one, how many
    std::map<TilesKey, Scaled> tiled;
    std::array<Found, kFoundPlaces> found;
};

// Draws the mark for a missing icon by lines alone, where not even that has artwork.
void DrawMissingIcon(PixelScope &, DeviceRect const &);
