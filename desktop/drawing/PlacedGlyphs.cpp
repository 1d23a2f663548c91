#include "desktop/drawing/PlacedGlyphs.h"
#include <cmath>

namespace {

// Beyond these a text is so large, or so far away, that nothing of it can show.
double const kFarthest = 1 << 20;

int Nearest(double place) { return static_cast<int>(std::floor(place + 0.5)); } // as Cairo rounds

} // namespace

void PlacedGlyphs::Add(std::uint32_t glyph, double h, double v) {
    GlyphMasks::Mask const *const mask = masks.Find(glyph);
    if (!mask || !mask->glyph || !(std::fabs(h) < kFarthest) || !(std::fabs(v) < kFarthest))
        return;
    Place const place = {Nearest(h), Nearest(v), mask};
    DeviceRect const own = place.Ink();
    if (places.empty()) {
        ink = own;
    } else {
        overlaps = overlaps || (!own.Intersected(ink).Empty() && Overlap(place));
        ink = ink.United(own);
    }
    places.push_back(place);
    glyphs.push_back({place.h, place.v, mask->glyph});
}

static bool HaveCommonInk(GlyphMasks::Mask const &a, DeviceRect const &placeOfA, GlyphMasks::Mask const &b,
                          DeviceRect const &placeOfB) {
    DeviceRect const both = placeOfA.Intersected(placeOfB);
    for (int y = both.top; y < both.bottom; ++y) {
        std::uint8_t const *const rowOfA =
            a.pixels + static_cast<std::ptrdiff_t>(y - placeOfA.top) * a.stride;
        std::uint8_t const *const rowOfB =
            b.pixels + static_cast<std::ptrdiff_t>(y - placeOfB.top) * b.stride;
        for (int x = both.left; x < both.right; ++x)
            if (rowOfA[x - placeOfA.left] != 0 && rowOfB[x - placeOfB.left] != 0)
                return true;
    }
    return false;
}

// Nearly always it is the glyph before that a letter leans over. Of a text where it may be any, nobody looks
// at all of them.
bool PlacedGlyphs::Overlap(Place const &place) const {
    if (places.size() > kOfLabel)
        return true;
    DeviceRect const own = place.Ink();
    for (std::size_t i = places.size(); i-- > 0;)
        if (HaveCommonInk(*place.mask, own, *places[i].mask, places[i].Ink()))
            return true;
    return false;
}

// Where two glyphs share a pixel, what they cover of it adds up before it is coloured, as Cairo has it.
void PlacedGlyphs::Draw(pixman_image_t *target, pixman_image_t *color) const {
    pixman_glyph_cache_t *const cache = GlyphMasks::Cache();
    int const count = static_cast<int>(glyphs.size());
    if (overlaps)
        pixman_composite_glyphs(PIXMAN_OP_OVER, color, target, PIXMAN_a8, ink.left, ink.top, ink.left,
                                ink.top, ink.left, ink.top, ink.Width(), ink.Height(), cache, count,
                                glyphs.data());
    else
        pixman_composite_glyphs_no_mask(PIXMAN_OP_OVER, color, target, 0, 0, 0, 0, cache, count,
                                        glyphs.data());
}
