#include "desktop/drawing/RoundCorners.h"
#include "desktop/drawing/PathDrawing.h"
#include "desktop/drawing/PixelScope.h"
#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <list>
#include <tuple>

namespace {

std::size_t const kMostMasks = 32; // more kinds of corners than this are hardly ever seen at once

typedef std::tuple<int, int, double, double, int> MaskKey;

// The latest masks, the one that was used last in front.
std::list<std::pair<MaskKey, ShapeMask>> &Masks() {
    static std::list<std::pair<MaskKey, ShapeMask>> masks;
    return masks;
}

int CornerSide(double radius, int line) { return std::max(static_cast<int>(std::ceil(radius)), line); }

} // namespace

void RoundCorners::AppendPath(cairo_t *context, DeviceRect const &r) const {
    PathDrawing::AppendRoundRect(context, r, radiusH, radiusV);
    if (line == 0)
        return;
    cairo_set_fill_rule(context, CAIRO_FILL_RULE_EVEN_ODD);
    PathDrawing::AppendRoundRect(context, {r.left + line, r.top + line, r.right - line, r.bottom - line},
                                 radiusH - line, radiusV - line);
}

ShapeMask const &RoundCorners::MaskFor(int width, int height) const {
    auto &masks = Masks();
    MaskKey const key(width, height, radiusH, radiusV, line);
    auto const known =
        std::find_if(masks.begin(), masks.end(), [&](auto const &entry) { return entry.first == key; });
    if (known != masks.end()) {
        masks.splice(masks.begin(), masks, known);
        return masks.front().second;
    }
    masks.emplace_front(std::piecewise_construct, std::forward_as_tuple(key),
                        std::forward_as_tuple(DeviceRect{0, 0, width, height}, [&](cairo_t *context) {
                            AppendPath(context, {0, 0, width, height});
                            cairo_fill(context);
                        }));
    if (masks.size() > kMostMasks)
        masks.pop_back();
    return masks.front().second;
}

void RoundCorners::DrawStraightParts(PixelScope &pixels, DeviceRect const &outer, DeviceRect const &middle,
                                     OS::RGBAColor const &color) const {
    int const top = line ? outer.top + line : middle.top, bottom = line ? outer.bottom - line : middle.bottom;
    int const left = line ? outer.left + line : middle.left, right = line ? outer.right - line : middle.right;
    pixels.Fill({middle.left, outer.top, middle.right, top}, color);
    pixels.Fill({outer.left, middle.top, left, middle.bottom}, color);
    pixels.Fill({right, middle.top, outer.right, middle.bottom}, color);
    pixels.Fill({middle.left, bottom, middle.right, outer.bottom}, color);
    if (line == 0)
        pixels.Fill(middle, color);
}

void RoundCorners::Draw(PixelScope &pixels, DeviceRect const &r, OS::RGBAColor const &color) const {
    if (r.Empty() || !pixels.Meets(r))
        return;
    if (2 * line >= std::min(r.Width(), r.Height()) && line > 0) { // the frame leaves nothing inside
        RoundCorners{radiusH, radiusV, 0}.Draw(pixels, r, color);
        return;
    }
    int const width = std::min(r.Width(), 2 * CornerSide(std::min(radiusH, r.Width() / 2.0), line));
    int const height = std::min(r.Height(), 2 * CornerSide(std::min(radiusV, r.Height() / 2.0), line));
    int const leftSide = (width + 1) / 2, topSide = (height + 1) / 2;
    DeviceRect const middle{r.left + leftSide, r.top + topSide, r.right - (width - leftSide),
                            r.bottom - (height - topSide)};
    DrawStraightParts(pixels, r, middle, color);

    pixman_image_t *const mask = MaskFor(width, height).Image();
    pixels.FillThrough(mask, 0, 0, {r.left, r.top, middle.left, middle.top}, color);
    pixels.FillThrough(mask, leftSide, 0, {middle.right, r.top, r.right, middle.top}, color);
    pixels.FillThrough(mask, 0, topSide, {r.left, middle.bottom, middle.left, r.bottom}, color);
    pixels.FillThrough(mask, leftSide, topSide, {middle.right, middle.bottom, r.right, r.bottom}, color);
}
