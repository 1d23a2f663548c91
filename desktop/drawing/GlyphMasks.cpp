#include "desktop/drawing/GlyphMasks.h"
#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <pixman.h>

namespace {

// An interface has a few fonts of a few hundred glyphs; Chinese has thousands.
std::size_t const kMostFonts = 64;
int const kMostMasks = 8192;
std::uint32_t const kLastGlyph = 0xFFFF; // of a font file
int const kLargestSide = 1024;           // device pixels; larger glyphs are Cairo's

// Pixman drops masks only when nobody keeps its cache from doing so, which is why it always is: whoever has
// found a mask may keep it until all go.
class MaskStore {
public:
    static MaskStore &Instance() {
        static MaskStore store;
        return store;
    }
    GlyphMasks &Of(cairo_scaled_font_t *font, DeviceScale scale) {
        if (last && last->IsOf(font, scale))
            return *last;
        auto const isIt = [&](std::unique_ptr<GlyphMasks> const &masks) { return masks->IsOf(font, scale); };
        auto place = std::find_if(fonts.begin(), fonts.end(), isIt);
        if (place == fonts.end()) {
            if (fonts.size() >= kMostFonts || count >= kMostMasks)
                DropAll();
            fonts.push_back(std::make_unique<GlyphMasks>(font, scale));
            place = fonts.end() - 1;
        }
        last = place->get();
        return *last;
    }
    pixman_glyph_cache_t *Cache() const { return cache; }
    void CountOne() { ++count; }

private:
    MaskStore() { MakeCache(); }
    ~MaskStore() { DropCache(); }
    MaskStore(MaskStore const &) = delete;
    MaskStore &operator=(MaskStore const &) = delete;
    void MakeCache() {
        cache = pixman_glyph_cache_create();
        if (cache)
            pixman_glyph_cache_freeze(cache);
    }
    void DropCache() {
        if (!cache)
            return;
        pixman_glyph_cache_thaw(cache);
        pixman_glyph_cache_destroy(cache);
    }
    void DropAll() {
        last = nullptr;
        fonts.clear();
        count = 0;
        DropCache();
        MakeCache();
    }

    pixman_glyph_cache_t *cache = nullptr;
    std::vector<std::unique_ptr<GlyphMasks>> fonts;
    GlyphMasks *last = nullptr;
    int count = 0;
};

// A glyph drawn by Cairo in a colour that no font has, on pixels that are clear.
class GlyphPicture {
public:
    GlyphPicture(cairo_scaled_font_t *font, double factor, std::uint32_t index);
    ~GlyphPicture() {
        if (surface)
            cairo_surface_destroy(surface);
    }
    GlyphPicture(GlyphPicture const &) = delete;
    GlyphPicture &operator=(GlyphPicture const &) = delete;

    bool IsDrawn() const { return drawn; }
    // Whether it is nothing but that colour, more or less covering.
    bool IsMask() const;
    // Of the pixels that are not clear, seen from the glyph's place.
    DeviceRect Ink() const;
    std::uint8_t Coverage(int x, int y) const {
        return static_cast<std::uint8_t>(Row(y)[x - box.left] >> kAlphaShift);
    }

private:
    static int const kAlphaShift = 24;
    std::uint32_t const *Row(int y) const {
        return reinterpret_cast<std::uint32_t const *>(cairo_image_surface_get_data(surface) +
                                                       static_cast<std::ptrdiff_t>(y - box.top) * stride);
    }

    DeviceRect box{0, 0, 0, 0};
    cairo_surface_t *surface = nullptr;
    int stride = 0;
    bool drawn = false;
};

GlyphPicture::GlyphPicture(cairo_scaled_font_t *font, double factor, std::uint32_t index) {
    int const kMargin = 2; // hinting may move an edge
    cairo_glyph_t const glyph = {index, 0, 0};
    cairo_text_extents_t extents;
    cairo_scaled_font_glyph_extents(font, &glyph, 1, &extents);
    double const left = std::floor(extents.x_bearing * factor), top = std::floor(extents.y_bearing * factor);
    double const right = std::ceil((extents.x_bearing + extents.width) * factor);
    double const bottom = std::ceil((extents.y_bearing + extents.height) * factor);
    if (!(right - left < kLargestSide) || !(bottom - top < kLargestSide) || std::fabs(left) > kLargestSide ||
        std::fabs(top) > kLargestSide)
        return;
    box = {static_cast<int>(left) - kMargin, static_cast<int>(top) - kMargin,
           static_cast<int>(right) + kMargin, static_cast<int>(bottom) + kMargin};
    surface = cairo_image_surface_create(CAIRO_FORMAT_ARGB32, box.Width(), box.Height());
    stride = cairo_image_surface_get_stride(surface);
    cairo_t *const context = cairo_create(surface);
    cairo_translate(context, -box.left, -box.top);
    cairo_scale(context, factor, factor);
    cairo_set_source_rgb(context, 1, 0, 1);
    cairo_set_scaled_font(context, font);
    cairo_show_glyphs(context, &glyph, 1);
    drawn = cairo_status(context) == CAIRO_STATUS_SUCCESS;
    cairo_destroy(context);
    cairo_surface_flush(surface);
}

bool GlyphPicture::IsMask() const {
    std::uint32_t const kRedAndBlue = 0x10001;
    for (int y = box.top; y < box.bottom; ++y)
        for (int x = box.left; x < box.right; ++x) {
            std::uint32_t const coverage = Coverage(x, y);
            if (Row(y)[x - box.left] != (coverage << kAlphaShift | coverage * kRedAndBlue))
                return false;
        }
    return true;
}

DeviceRect GlyphPicture::Ink() const {
    DeviceRect ink = {box.right, box.bottom, box.left, box.top};
    for (int y = box.top; y < box.bottom; ++y)
        for (int x = box.left; x < box.right; ++x)
            if (Coverage(x, y) != 0)
                ink = ink.United({x, y, x + 1, y + 1});
    return ink;
}

} // namespace

GlyphMasks &GlyphMasks::Of(cairo_scaled_font_t *font, DeviceScale scale) {
    return MaskStore::Instance().Of(font, scale);
}

pixman_glyph_cache_t *GlyphMasks::Cache() { return MaskStore::Instance().Cache(); }

GlyphMasks::GlyphMasks(cairo_scaled_font_t *font_, DeviceScale scale_)
    : font(cairo_scaled_font_reference(font_))
    , scale(scale_) {}

GlyphMasks::~GlyphMasks() { cairo_scaled_font_destroy(font); }

// Pixman copies the mask.
static void const *Insert(void *font, std::uint32_t index, DeviceRect const &ink,
                          std::vector<std::uint8_t> &pixels, int stride) {
    pixman_glyph_cache_t *const cache = GlyphMasks::Cache();
    if (!cache)
        return nullptr;
    pixman_image_t *const image = pixman_image_create_bits_no_clear(
        PIXMAN_a8, ink.Width(), ink.Height(), reinterpret_cast<std::uint32_t *>(pixels.data()), stride);
    if (!image)
        return nullptr;
    void const *const glyph =
        pixman_glyph_cache_insert(cache, font, reinterpret_cast<void *>(static_cast<std::uintptr_t>(index)),
                                  -ink.left, -ink.top, image);
    pixman_image_unref(image);
    return glyph;
}

GlyphMasks::Mask const *GlyphMasks::Make(std::uint32_t index) {
    if (index > kLastGlyph)
        return nullptr;
    if (index >= found.size())
        found.resize(index + 1);
    std::unique_ptr<Entry> entry(new Entry);
    GlyphPicture const picture(font, scale.Factor(), index);
    if (picture.IsDrawn() && picture.IsMask()) {
        DeviceRect const ink = picture.Ink();
        Mask &mask = entry->mask;
        entry->drawable = ink.Empty();
        if (!ink.Empty()) {
            int const kAligned = 4; // pixman's rows begin at whole words
            mask.ink = ink;
            mask.stride = (ink.Width() + kAligned - 1) / kAligned * kAligned;
            entry->pixels.resize(static_cast<std::size_t>(mask.stride) *
                                 static_cast<std::size_t>(ink.Height()));
            mask.pixels = entry->pixels.data();
            std::uint8_t *row = entry->pixels.data();
            for (int y = ink.top; y < ink.bottom; ++y, row += mask.stride)
                for (int x = ink.left; x < ink.right; ++x)
                    row[x - ink.left] = picture.Coverage(x, y);
            mask.glyph = Insert(this, index, ink, entry->pixels, mask.stride);
            entry->drawable = mask.glyph != nullptr;
            MaskStore::Instance().CountOne();
        }
    }
    found[index] = std::move(entry);
    return found[index]->drawable ? &found[index]->mask : nullptr;
}
