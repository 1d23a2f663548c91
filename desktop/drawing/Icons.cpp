#include "host/Icons.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/IconStore.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include <algorithm>

namespace {

JsonLine Call(char const *operation, short family, short index) {
    return DrawingTrace::Call(operation).Integer("family", family).Integer("icon", index);
}

// The icon stretched over `whole`, as far as it lies in `box`.
void DrawIcon(PixelScope &pixels, IconSet &set, IconSet::Icon const &icon, DeviceRect const &whole,
              DeviceRect const &box) {
    if (whole.Empty() || box.Empty() || !pixels.Meets(box))
        return;
    if (icon.layer < 0)
        DrawMissingIcon(pixels, box);
    else
        pixels.DrawImage(set.Image(icon, whole.Width(), whole.Height()), whole.left, whole.top, box, true);
}

// Tiles of the given size over a rectangle in local coordinates, from its top left corner on, cut at its
// right and bottom edges.
void DrawTiles(PixelScope &pixels, DeviceScale scale, IconSet &set, IconSet::Icon const &icon, Rect const &r,
               int tileWidth, int tileHeight) {
    DeviceRect const box = pixels.ToDevice(r);
    if (tileWidth < 1 || tileHeight < 1 || box.Empty() || !pixels.Meets(box))
        return;
    bool const alike = scale.MovesExactly(tileWidth) && scale.MovesExactly(tileHeight);
    if (alike && icon.layer >= 0) { // all tiles have the same size in device pixels: one call repeats them
        DeviceRect const first = pixels.ToDevice(r.left, r.top, r.left + tileWidth, r.top + tileHeight);
        if (!first.Empty())
            pixels.DrawImage(set.Tiles(icon, first.Width(), first.Height(), box), first.left, first.top, box,
                             true);
        return;
    }
    for (int top = r.top; top < r.bottom; top += tileHeight) {
        if (!pixels.Meets(pixels.ToDevice(r.left, top, r.right, top + tileHeight)))
            continue;
        for (int left = r.left; left < r.right; left += tileWidth) {
            DeviceRect const tile = pixels.ToDevice(left, top, left + tileWidth, top + tileHeight);
            DrawIcon(pixels, set, icon, tile, tile.Intersected(box));
        }
    }
}

// What the calls below have in common: where to draw, and what from.
class IconDrawing {
public:
    IconDrawing()
        : port(DrawingPort::CurrentPort()) {}
    template <class Draw> void Run(Draw draw) {
        if (!port)
            return;
        PixelScope pixels(*port);
        if (pixels.CanDraw())
            draw(pixels, IconStore::Instance().ForScale(port->Scale()));
    }
    DeviceScale Scale() const { return port->Scale(); }

private:
    DrawingPort *port;
};

} // namespace

void Draw1Icon(short family, short index, short h, short v) {
    if (DrawingTrace::On())
        DrawingTrace::Write(Call("Draw1Icon", family, index).Integer("h", h).Integer("v", v));
    IconDrawing().Run([&](PixelScope &pixels, IconSet &set) {
        IconSet::Icon const icon = set.Find(family, index);
        DeviceRect const box = pixels.ToDevice(h, v, h + icon.width, v + icon.height);
        DrawIcon(pixels, set, icon, box, box);
    });
}

void Draw1Icon(short family, short index, Rect const &r) {
    if (DrawingTrace::On())
        DrawingTrace::Write(Call("Draw1Icon", family, index).Box("rect", r));
    IconDrawing().Run([&](PixelScope &pixels, IconSet &set) {
        DeviceRect const box = pixels.ToDevice(r);
        DrawIcon(pixels, set, set.Find(family, index), box, box);
    });
}

Rect GetIconBounds(short family) {
    IconSet::Icon const size = IconStore::Instance().AnyScale().FindFamily(family);
    return {0, 0, static_cast<short>(size.height), static_cast<short>(size.width)};
}

OSRgn const &GetIconRegion(short family, short index) { return IconStore::Instance().Outline(family, index); }

void TileIcon(Rect const *r, short family, short index, short tileWidth, short tileHeight) {
    if (DrawingTrace::On())
        DrawingTrace::Write(Call("TileIcon", family, index)
                                .Box("rect", *r)
                                .Integer("tileWidth", tileWidth)
                                .Integer("tileHeight", tileHeight));
    IconDrawing drawing;
    drawing.Run([&](PixelScope &pixels, IconSet &set) {
        DrawTiles(pixels, drawing.Scale(), set, set.Find(family, index), *r, tileWidth, tileHeight);
    });
}

// All three pieces get the rectangle's height. The right cap keeps its right end where the rectangle is
// narrower than both caps: each then has half of the width.
void TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag> const &rect, short family, short firstIndex) {
    Rect const r = WholeRect(rect);
    if (DrawingTrace::On())
        DrawingTrace::Write(Call("TileIconInRectWithEndCaps", family, firstIndex).Box("rect", r));
    IconDrawing drawing;
    drawing.Run([&](PixelScope &pixels, IconSet &set) {
        IconSet::Icon const left = set.Find(family, firstIndex);
        IconSet::Icon const middle = set.Find(family, static_cast<short>(firstIndex + 1));
        IconSet::Icon const right = set.Find(family, static_cast<short>(firstIndex + 2));
        int const width = r.right - r.left;
        int leftEnd = r.left + left.width, rightStart = r.right - right.width;
        if (leftEnd > rightStart)
            leftEnd = rightStart = r.left + width / 2;
        DrawIcon(pixels, set, left, pixels.ToDevice(r.left, r.top, r.left + left.width, r.bottom),
                 pixels.ToDevice(r.left, r.top, leftEnd, r.bottom));
        DrawIcon(pixels, set, right, pixels.ToDevice(r.right - right.width, r.top, r.right, r.bottom),
                 pixels.ToDevice(rightStart, r.top, r.right, r.bottom));
        Rect const between = {r.top, SaturatedPixel(leftEnd), r.bottom, SaturatedPixel(rightStart)};
        DrawTiles(pixels, drawing.Scale(), set, middle, between, middle.width, r.bottom - r.top);
    });
}
