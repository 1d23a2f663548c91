// Glyphs of one font, at places on a surface.
#pragma once
#include "desktop/drawing/GlyphMasks.h"
#include <boost/container/small_vector.hpp>
#include <pixman.h>

class PlacedGlyphs {
public:
    explicit PlacedGlyphs(GlyphMasks &masks_)
        : masks(masks_) {}

    // The place is in device pixels, and taken to the nearest whole one. A glyph that is more than a mask is
    // left out.
    void Add(std::uint32_t glyph, double h, double v);

    // What the glyphs cover; empty when there is nothing to be seen.
    DeviceRect const &Ink() const { return ink; }
    // Draws all that lies within the target's clip.
    void Draw(pixman_image_t *target, pixman_image_t *color) const;

private:
    struct Place {
        int h, v;
        GlyphMasks::Mask const *mask;
        DeviceRect Ink() const {
            return {mask->ink.left + h, mask->ink.top + v, mask->ink.right + h, mask->ink.bottom + v};
        }
    };
    static std::size_t const kOfLabel = 64;
    bool Overlap(Place const &) const;

    GlyphMasks &masks;
    boost::container::small_vector<Place, kOfLabel> places;
    boost::container::small_vector<pixman_glyph_t, kOfLabel> glyphs;
    DeviceRect ink{0, 0, 0, 0};
    bool overlaps = false; // some pixel has ink of two glyphs
};
