// The glyphs of a font as masks of device pixels.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstdint>
#include <memory>
#include <vector>

typedef struct _cairo_scaled_font cairo_scaled_font_t; // NOLINT(bugprone-reserved-identifier)
typedef struct pixman_glyph_cache_t pixman_glyph_cache_t;

// Cairo asks a hundred questions before it draws a text: what its operator does beyond the ink, whether the
// font still fits the matrix, what the clip leaves. A list of short texts takes longer for those than for its
// pixels. So glyphs are drawn by Cairo once, each as a mask, and pixman puts the masks where they belong.
class GlyphMasks {
public:
    struct Mask {
        void const *glyph = nullptr;          // pixman's; null where there is no ink
        DeviceRect ink{0, 0, 0, 0};           // seen from the glyph's place
        std::uint8_t const *pixels = nullptr; // the ink's, row by row, `stride` bytes each
        int stride = 0;
    };

    // The font's masks at the scale; the font has to be one of scale 1. Kept for later calls, but not without
    // end: a call may drop those of all fonts.
    static GlyphMasks &Of(cairo_scaled_font_t *, DeviceScale);
    // What pixman draws the masks with.
    static pixman_glyph_cache_t *Cache();

    GlyphMasks(cairo_scaled_font_t *, DeviceScale);
    ~GlyphMasks();
    GlyphMasks(GlyphMasks const &) = delete;
    GlyphMasks &operator=(GlyphMasks const &) = delete;

    // Null for a glyph that is more than a mask, as those in colours are. Made at the first call for it.
    Mask const *Find(std::uint32_t glyph) {
        if (glyph < found.size() && found[glyph])
            return found[glyph]->drawable ? &found[glyph]->mask : nullptr;
        return Make(glyph);
    }
    bool IsOf(cairo_scaled_font_t *font_, DeviceScale scale_) const {
        return font_ == font && scale_ == scale;
    }

private:
    struct Entry {
        Mask mask;
        bool drawable = false;
        std::vector<std::uint8_t> pixels;
    };
    Mask const *Make(std::uint32_t glyph);

    cairo_scaled_font_t *font; // holds a reference
    DeviceScale scale;
    std::vector<std::unique_ptr<Entry>> found; // by the glyph's number
};
