#include "desktop/drawing/IconSet.h"
#include "desktop/drawing/AreaScale.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>

using namespace AtlasFormat;

namespace {

constexpr int kMissingIconSide = 16;
constexpr std::size_t kMostScaledImages = 1024;
// Asking for icons that are larger than any window would only eat memory.
constexpr int kLongestScaledSide = 8192;
constexpr std::size_t kMostTiledImages = 256;
constexpr int kTiledSide = 128; // device pixels that tiles are made up to

pixman_image_t *ViewOf(std::uint32_t const *pixels, int width, int height) {
    // Only ever a source, so that the pixels are not written to.
    return pixman_image_create_bits_no_clear(PIXMAN_a8r8g8b8, width, height,
                                             const_cast<std::uint32_t *>(pixels), width * kBytesPerPixel);
}

} // namespace

struct IconSet::Layer {
    explicit Layer(std::string const &path)
        : atlas(path)
        , images(static_cast<std::size_t>(atlas.IconCount()) * kImageChoices) {}
    ~Layer() {
        for (pixman_image_t *image : images)
            if (image)
                pixman_image_unref(image);
    }
    Layer(Layer const &) = delete;
    Layer &operator=(Layer const &) = delete;

    Atlas atlas;
    std::vector<pixman_image_t *> images; // of each icon its choices; null until first drawn
};

struct IconSet::Scaled {
    std::unique_ptr<Surface> surface;
    bool opaque;
    DeviceRect solid; // of tiles only
};

IconSet::IconSet(std::vector<std::string> const &atlases) {
    for (std::string const &path : atlases)
        layers.emplace_back(new Layer(path));
}

IconSet::~IconSet() {}

IconSet::Icon IconSet::FindFamily(short family) const {
    for (int i = static_cast<int>(layers.size()) - 1; i >= 0; --i)
        if (FamilyRecord const *record = layers[static_cast<std::size_t>(i)]->atlas.FindFamily(family))
            return {record->width, record->height, i, nullptr};
    return {kMissingIconSide, kMissingIconSide, -1, nullptr};
}

IconSet::Icon IconSet::Find(short family, short index) {
    constexpr unsigned kFamilyStep = 31; // so that the first icons of families do not all share a place
    Found &place =
        found[(static_cast<unsigned>(family) * kFamilyStep + static_cast<unsigned>(index)) % kFoundPlaces];
    if (!place.known || place.family != family || place.index != index)
        place = {family, index, true, Search(family, index)};
    return place.icon;
}

IconSet::Icon IconSet::Search(short family, short index) const {
    for (int i = static_cast<int>(layers.size()) - 1; i >= 0; --i) {
        Atlas const &atlas = layers[static_cast<std::size_t>(i)]->atlas;
        FamilyRecord const *record = atlas.FindFamily(family);
        if (IconRecord const *icon = record ? atlas.FindIcon(*record, index) : nullptr)
            return {icon->width, icon->height, i, icon};
    }
    Icon missing = family == kMissingIconFamily ? Icon{0, 0, -1, nullptr} : Search(kMissingIconFamily, 0);
    Icon const size = FindFamily(family);
    missing.width = size.width;
    missing.height = size.height;
    return missing;
}

PixelImage IconSet::Stored(Layer &layer, IconRecord const &icon, int choice) {
    ImageRecord const &record = icon.images[choice];
    pixman_image_t *&image =
        layer.images[static_cast<std::size_t>(layer.atlas.PlaceOf(icon)) * kImageChoices +
                     static_cast<std::size_t>(choice)];
    if (!image)
        image = ViewOf(layer.atlas.Pixels(record), record.width, record.height);
    return {image,
            record.width,
            record.height,
            (record.flags & kImageOpaque) != 0,
            (record.flags & kImageEmpty) != 0 || !image,
            {0, 0, 0, 0}};
}

PixelImage IconSet::Image(Icon const &icon, int deviceWidth, int deviceHeight) {
    Layer &layer = *layers[static_cast<std::size_t>(icon.layer)];
    ImageRecord const &smallest = icon.record->images[0];
    int const choice = (deviceWidth > smallest.width ? kWiderImage : 0) |
                       (deviceHeight > smallest.height ? kTallerImage : 0);
    ImageRecord const &fitting = icon.record->images[choice];
    if (fitting.width == deviceWidth && fitting.height == deviceHeight)
        return Stored(layer, *icon.record, choice);
    return ScaledImage(icon, deviceWidth, deviceHeight);
}

PixelImage IconSet::ScaledImage(Icon const &icon, int deviceWidth, int deviceHeight) {
    Layer &layer = *layers[static_cast<std::size_t>(icon.layer)];
    int const width = std::min(deviceWidth, kLongestScaledSide);
    int const height = std::min(deviceHeight, kLongestScaledSide);
    constexpr int kSideBits = 14, kPlaceBits = 24; // a side fits the limit above, a place the largest file
    std::uint64_t const key =
        ((static_cast<std::uint64_t>(icon.layer) << kPlaceBits | layer.atlas.PlaceOf(*icon.record))
             << kSideBits |
         static_cast<std::uint64_t>(width))
            << kSideBits |
        static_cast<std::uint64_t>(height);
    auto kept = scaled.find(key);
    if (kept == scaled.end()) {
        if (scaled.size() >= kMostScaledImages)
            scaled.clear();
        // The largest of the four images is the most exact.
        ImageRecord const &best = icon.record->images[kWiderImage | kTallerImage];
        std::unique_ptr<Surface> surface(new Surface(width, height));
        ScalePixels(layer.atlas.Pixels(best), best.width, best.height, surface->Pixels(), width, height);
        bool const opaque = surface->IsOpaque();
        kept = scaled.emplace(key, Scaled{std::move(surface), opaque, {0, 0, 0, 0}}).first;
    }
    return {kept->second.surface->PixmanImage(), width, height, kept->second.opaque, false, {0, 0, 0, 0}};
}

// How many tiles make one along a side of the area; always as many or one, so that few images are kept.
static int TilesAlong(int tile, int area) { return area > tile ? std::max(kTiledSide / tile, 1) : 1; }

PixelImage IconSet::Tiles(Icon const &icon, int deviceWidth, int deviceHeight, DeviceRect const &area) {
    PixelImage const tile = Image(icon, deviceWidth, deviceHeight);
    int const across = TilesAlong(tile.width, area.Width()), down = TilesAlong(tile.height, area.Height());
    if (tile.empty || (across == 1 && down == 1))
        return tile;
    int const width = across * tile.width, height = down * tile.height;
    TilesKey const key(icon.record, tile.width, tile.height, across, down);
    auto kept = tiled.find(key);
    if (kept == tiled.end()) {
        if (tiled.size() >= kMostTiledImages)
            tiled.clear();
        std::unique_ptr<Surface> surface(new Surface(width, height));
        for (int top = 0; top < height; top += tile.height)
            for (int left = 0; left < width; left += tile.width)
                pixman_image_composite32(PIXMAN_OP_SRC, tile.pixels, nullptr, surface->PixmanImage(), 0, 0, 0,
                                         0, left, top, tile.width, tile.height);
        DeviceRect const solid = surface->OpaquePart();
        kept = tiled.emplace(key, Scaled{std::move(surface), tile.opaque, solid}).first;
    }
    return {kept->second.surface->PixmanImage(), width, height, tile.opaque, false, kept->second.solid};
}

void DrawMissingIcon(PixelScope &pixels, DeviceRect const &r) {
    static OS::RGBAColor const kMark(0.85, 0.2, 0.45, 1.0);
    constexpr int kThickness = 1;
    pixels.FillFrame(
        r, {r.left + kThickness, r.top + kThickness, r.right - kThickness, r.bottom - kThickness}, kMark);
    // One diagonal, stretched to the shape of the box.
    int const width = r.Width(), height = r.Height();
    for (int y = 1; y < height - 1; ++y) {
        int const left = r.left + y * width / height, right = r.left + (y + 1) * width / height;
        pixels.Fill({left, r.top + y, std::max(right, left + kThickness), r.top + y + 1}, kMark);
    }
}
