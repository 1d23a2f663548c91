#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/PageDrawing.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>
#include <cmath>

namespace {

constexpr std::uint32_t kFullAlpha = 0xFF;
constexpr double kLargest8 = 255.0, kLargest16 = 65535.0;
// What is left of an icon that is drawn as disabled.
constexpr std::uint16_t kFadedAlpha = 0x6666;
constexpr double kOpaque = 1.0;

double Unit(double value) { return value > 0.0 ? std::min(value, 1.0) : 0.0; } // what is not a number gives 0

std::uint32_t Component8(double value) {
    return static_cast<std::uint32_t>(std::lround(Unit(value) * kLargest8));
}

std::uint16_t Component16(double value) {
    return static_cast<std::uint16_t>(std::lround(Unit(value) * kLargest16));
}

pixman_color_t PremultipliedColor(OS::RGBAColor const &color) {
    double alpha = Unit(color.a);
    return {Component16(Unit(color.r) * alpha), Component16(Unit(color.g) * alpha),
            Component16(Unit(color.b) * alpha), Component16(alpha)};
}

// As pixman takes a colour for pixels of 8 bits.
std::uint32_t Pixel8(pixman_color_t const &color) {
    auto const upper = [](std::uint16_t component) { return static_cast<std::uint32_t>(component >> 8); };
    return upper(color.alpha) << 24 | upper(color.red) << 16 | upper(color.green) << 8 | upper(color.blue);
}

// Of so few pixels a row is done before a function of a library has begun: tiles of a scroll bar, shadows.
constexpr int kNarrow = 16;

void CopyNarrowRow(std::uint32_t const *from, int width, std::uint32_t *to) {
    for (int i = 0; i < width; ++i)
        to[i] = from[i];
}

// One colour everywhere.
class SolidImage {
public:
    explicit SolidImage(pixman_color_t const &color)
        : image(pixman_image_create_solid_fill(&color)) {}
    ~SolidImage() {
        if (image)
            pixman_image_unref(image);
    }
    SolidImage(SolidImage const &) = delete;
    SolidImage &operator=(SolidImage const &) = delete;
    pixman_image_t *Get() const { return image; }

private:
    pixman_image_t *image;
};

pixman_image_t *FadingMask() {
    static SolidImage const mask({0, 0, 0, kFadedAlpha});
    return mask.Get();
}

// Makes an image repeat for the scope's lifetime. Images are shared, so that it must not stay that way.
class WithRepeat {
public:
    WithRepeat(pixman_image_t *image_, bool repeats)
        : image(repeats ? image_ : nullptr) {
        if (image)
            pixman_image_set_repeat(image, PIXMAN_REPEAT_NORMAL);
    }
    ~WithRepeat() {
        if (image)
            pixman_image_set_repeat(image, PIXMAN_REPEAT_NONE);
    }
    WithRepeat(WithRepeat const &) = delete;
    WithRepeat &operator=(WithRepeat const &) = delete;

private:
    pixman_image_t *image;
};

// For tiles, of which there are many, this is several times as fast as a call of pixman for each.
void CopyRows(pixman_image_t *from, int fromH, int fromV, Surface &to, DeviceRect const &part) {
    std::uint32_t const *const pixels = pixman_image_get_data(from);
    int const stride = pixman_image_get_stride(from) / static_cast<int>(sizeof(std::uint32_t));
    int const width = part.Width();
    std::uint32_t const *source = pixels + static_cast<std::ptrdiff_t>(fromV) * stride + fromH;
    std::uint32_t *target = to.Row(part.top) + part.left;
    for (int y = part.top; y < part.bottom; ++y, source += stride, target += to.Width())
        if (width <= kNarrow)
            CopyNarrowRow(source, width, target);
        else
            std::copy_n(source, width, target);
}

// Of the part, whose top left corner lies at that place of the tile, what the tile has pixels for.
void CopyTile(pixman_image_t *tile, int fromH, int fromV, DeviceRect const &solid, Surface &to,
              DeviceRect const &part) {
    int const h = part.left - fromH, v = part.top - fromV;
    DeviceRect const covered =
        part.Intersected({solid.left + h, solid.top + v, solid.right + h, solid.bottom + v});
    if (!covered.Empty())
        CopyRows(tile, covered.left - h, covered.top - v, to, covered);
}

// Drawing a tile at a time is faster than having pixman repeat an image row by row, but for the smallest.
constexpr int kSmallestTile = 64; // device pixels

// How far `place` lies behind the start of its tile; `first` is where any tile starts.
int InTile(int place, int first, int length) {
    int const rest = (place - first) % length;
    return rest < 0 ? rest + length : rest;
}

// Calls for every piece of the part that lies in one tile, with where in the tile it begins.
template <class Draw>
void ForEachTile(DeviceRect const &part, int left, int top, int width, int height, Draw draw) {
    for (int y = part.top, fromV = InTile(part.top, top, height); y < part.bottom;) {
        int const nextY = std::min(y + height - fromV, part.bottom);
        for (int x = part.left, fromH = InTile(part.left, left, width); x < part.right;) {
            int const nextX = std::min(x + width - fromH, part.right);
            draw(DeviceRect{x, y, nextX, nextY}, fromH, fromV);
            x = nextX;
            fromH = 0;
        }
        y = nextY;
        fromV = 0;
    }
}

} // namespace

void PixelScope::PrepareGround(DeviceRect const &visible, Hides hides) {
    if (!device->ground.Waits())
        return;
    if (hides == Hides::kAll)
        device->ground.Cover(visible, device->clip);
    else
        device->ground.Prepare(visible, device->clip);
}

template <class Draw> void PixelScope::ForEachVisible(DeviceRect const &r, Hides hides, Draw draw) {
    DeviceRect box = r.Intersected(device->clipBounds);
    if (box.Empty())
        return;
    port.touched.Add(box);
    PrepareGround(box, hides);
    if (device->clipIsBox) {
        draw(box);
        return;
    }
    int count = 0;
    pixman_box32_t const *clip = pixman_region32_rectangles(&device->clip, &count);
    for (; count > 0 && clip->y1 < box.bottom; --count, ++clip) { // from top to bottom
        DeviceRect part = box.Intersected({clip->x1, clip->y1, clip->x2, clip->y2});
        if (!part.Empty())
            draw(part);
    }
}

void PixelScope::FindPixel(OS::RGBAColor const &color) {
    if (device->IsColor(color))
        return;
    double const alpha = Unit(color.a);
    device->color = color;
    device->pixel = Component8(alpha) << 24 | Component8(Unit(color.r) * alpha) << 16 |
                    Component8(Unit(color.g) * alpha) << 8 | Component8(Unit(color.b) * alpha);
    device->solid = device->pixel >> 24 == kFullAlpha;
}

void PixelScope::FillBox(DeviceRect const &r, OS::RGBAColor const &color) {
    if (port.page) {
        PageDrawing::Fill(device->UpdateContext(port), r, color);
        return;
    }
    FindPixel(color);
    if (device->solid) {
        ForEachVisible(r, Hides::kAll,
                       [&](DeviceRect const &part) { port.surface->Fill(part, device->pixel); });
        return;
    }
    pixman_color_t const over = PremultipliedColor(color);
    if (r.Width() <= kNarrow) {
        ForEachVisible(r, Hides::kNotAll,
                       [&](DeviceRect const &part) { port.surface->Blend(part, Pixel8(over)); });
        return;
    }
    ForEachVisible(r, Hides::kNotAll, [&](DeviceRect const &part) {
        pixman_box32_t box = {part.left, part.top, part.right, part.bottom};
        pixman_image_fill_boxes(PIXMAN_OP_OVER, port.surface->PixmanImage(), &over, 1, &box);
    });
}

void PixelScope::Cover(OS::RGBAColor const &color) { FillBox(device->clipBounds, color); }

void PixelScope::LayGround(OS::RGBAColor const &color) {
    if (port.page) {
        FillBox(device->clipBounds, color);
        return;
    }
    port.touched.Add(device->clipBounds);
    FindPixel(color);
    device->ground.Begin(*port.surface, device->clip, device->pixel);
}

void PixelScope::FillFrame(DeviceRect const &outer, DeviceRect const &inner, OS::RGBAColor const &color) {
    if (inner.Empty()) {
        Fill(outer, color);
        return;
    }
    Fill({outer.left, outer.top, outer.right, inner.top}, color);
    Fill({outer.left, inner.top, inner.left, inner.bottom}, color);
    Fill({inner.right, inner.top, outer.right, inner.bottom}, color);
    Fill({outer.left, inner.bottom, outer.right, outer.bottom}, color);
}

void PixelScope::DrawImage(PixelImage const &image, int left, int top, DeviceRect const &box, bool fades) {
    if (image.empty)
        return;
    bool const faded = fades && port.state.fadedIcons;
    if (port.page) {
        cairo_t *const context = device->UpdateContext(port);
        if (port.state.darken != 0)
            PageDrawing::FillThrough(context, image.pixels, left, top, box, port.Ink());
        else
            PageDrawing::DrawImage(context, image.pixels, left, top, box,
                                   faded ? kFadedAlpha / kLargest16 : kOpaque);
        return;
    }
    bool const repeats =
        left > box.left || top > box.top || left + image.width < box.right || top + image.height < box.bottom;
    bool const inTiles = repeats && image.width * image.height >= kSmallestTile;
    DeviceRect const solid = image.opaque ? DeviceRect{0, 0, image.width, image.height} : image.solid;
    if (inTiles && !solid.Empty() && !faded && port.state.darken == 0) {
        ForEachVisible(box, image.opaque ? Hides::kAll : Hides::kNotAll, [&](DeviceRect const &visible) {
            ForEachTile(visible, left, top, image.width, image.height,
                        [&](DeviceRect const &part, int fromH, int fromV) {
                            CopyTile(image.pixels, fromH, fromV, solid, *port.surface, part);
                        });
        });
        return;
    }
    WithRepeat repeating(image.pixels, repeats && !inTiles);
    pixman_image_t *target = port.surface->PixmanImage();
    auto compose = [&](pixman_op_t operation, pixman_image_t *source, pixman_image_t *mask) {
        auto const drawPart = [&](DeviceRect const &part, int fromH, int fromV) {
            pixman_image_composite32(operation, source, mask, target, fromH, fromV, fromH, fromV, part.left,
                                     part.top, part.Width(), part.Height());
        };
        bool const hides = operation == PIXMAN_OP_SRC;
        ForEachVisible(box, hides ? Hides::kAll : Hides::kNotAll, [&](DeviceRect const &part) {
            if (inTiles)
                ForEachTile(part, left, top, image.width, image.height, drawPart);
            else
                drawPart(part, part.left - left, part.top - top);
        });
    };
    if (port.state.darken != 0)
        compose(PIXMAN_OP_OVER, SolidImage(PremultipliedColor(port.Ink())).Get(), image.pixels);
    else if (faded)
        compose(PIXMAN_OP_OVER, image.pixels, FadingMask());
    else
        compose(image.opaque ? PIXMAN_OP_SRC : PIXMAN_OP_OVER, image.pixels, nullptr);
}

pixman_image_t *PixelScope::InkImage() {
    OS::RGBAColor const ink = port.Ink();
    if (!device->inkImage || !DrawingPort::Device::Same(device->ink, ink)) {
        if (device->inkImage)
            pixman_image_unref(device->inkImage);
        pixman_color_t const color = PremultipliedColor(ink);
        device->inkImage = pixman_image_create_solid_fill(&color);
        device->ink = ink;
    }
    return device->inkImage;
}

void PixelScope::DrawGlyphs(PlacedGlyphs const &glyphs, DeviceRect const &cut) {
    DeviceRect const visible = glyphs.Ink().Intersected(device->clipBounds).Intersected(cut);
    if (visible.Empty())
        return;
    pixman_image_t *const color = InkImage(), *const target = port.surface->PixmanImage();
    if (!color)
        return;
    port.touched.Add(visible);
    PrepareGround(visible, Hides::kNotAll);
    bool const allVisible = device->clipIsBox && visible.Contains(glyphs.Ink());
    if (!allVisible) {
        pixman_region32_t clip;
        pixman_region32_init(&clip);
        pixman_region32_intersect_rect(&clip, &device->clip, visible.left, visible.top,
                                       static_cast<unsigned>(visible.Width()),
                                       static_cast<unsigned>(visible.Height()));
        pixman_image_set_clip_region32(target, &clip);
        pixman_region32_fini(&clip);
    }
    glyphs.Draw(target, color);
    if (!allVisible)
        pixman_image_set_clip_region32(target, nullptr);
}

void PixelScope::FillThrough(pixman_image_t *mask, int fromH, int fromV, DeviceRect const &box,
                             OS::RGBAColor const &color) {
    if (!mask || !Meets(box))
        return;
    OS::RGBAColor const ink = port.state.darken != 0 ? port.Ink() : color;
    if (port.page) {
        PageDrawing::FillThrough(device->UpdateContext(port), mask, box.left - fromH, box.top - fromV, box,
                                 ink);
        return;
    }
    SolidImage const solid(PremultipliedColor(ink));
    ForEachVisible(box, Hides::kNotAll, [&](DeviceRect const &part) {
        pixman_image_composite32(PIXMAN_OP_OVER, solid.Get(), mask, port.surface->PixmanImage(), 0, 0,
                                 part.left - box.left + fromH, part.top - box.top + fromV, part.left,
                                 part.top, part.Width(), part.Height());
    });
}
