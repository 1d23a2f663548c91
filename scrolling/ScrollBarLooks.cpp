// How a scroll bar looks.
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/Truncation.h"

namespace {

short const kFamily = 1000;
short const kShortestThumbOfPieces = 16; // pixels
int const kThumbEnds = 7;                // pixels that the start and the end piece keep from the middle

// Icons of one orientation, and places along it in pixels. The two differ by a pixel here and there.
struct Looks {
    short trough, deadTrough;
    short troughTileWidth, troughTileHeight;
    short startCap;
    int startCapBefore; // the trough's start
    int startCapReach;  // how far behind the trough's start what is drawn may begin for the cap to be drawn
    short endCap;
    int endCapBefore; // the trough's end
    short shortThumb;
    short thumbStart, thumbEnd;
    int thumbEndBefore; // the thumb's end
    short thumbMiddle;
    short middleTileWidth, middleTileHeight;
};

Looks const kVerticalLooks = {42, 43, 14, 16, 16, 2, 6, 17, 6, 38, 68, 64, 7, 66, 16, 9};
Looks const kHorizontalLooks = {40, 41, 16, 14, 19, 3, 5, 18, 7, 39, 69, 65, 8, 67, 10, 16};

class ThumbArea {
public:
    ThumbArea(bool horizontal, Rect const &drawn_)
        : along(!horizontal)
        , looks(horizontal ? kHorizontalLooks : kVerticalLooks)
        , drawn(drawn_) {}

    void DrawTrough(Rect const &bounds, bool live) const {
        TileIcon(&bounds, kFamily, live ? looks.trough : looks.deadTrough, looks.troughTileWidth,
                 looks.troughTileHeight);
    }

    // Caps outside of what is drawn are left out.
    void DrawCaps(Rect const &bounds) const {
        if (along.Start(bounds) + looks.startCapReach >= along.Start(drawn))
            DrawAt(looks.startCap, bounds, along.Start(bounds) - looks.startCapBefore);
        if (along.End(bounds) - looks.endCapBefore <= along.End(drawn))
            DrawAt(looks.endCap, bounds, along.End(bounds) - looks.endCapBefore);
    }

    // One pixel beside the trough, which is narrower.
    void DrawThumb(Rect thumb) const {
        SingleAxis const across = along.Across();
        across.Start(thumb) = Pixel16(across.Start(thumb) - 1);
        across.End(thumb) = Pixel16(across.End(thumb) - 1);
        if (along.Length(thumb) < kShortestThumbOfPieces) {
            DrawAt(looks.shortThumb, thumb, along.Start(thumb));
            return;
        }
        DrawAt(looks.thumbStart, thumb, along.Start(thumb));
        DrawAt(looks.thumbEnd, thumb, along.End(thumb) - looks.thumbEndBefore);
        along.Start(thumb) = Pixel16(along.Start(thumb) + kThumbEnds);
        along.End(thumb) = Pixel16(along.End(thumb) - kThumbEnds);
        TileIcon(&thumb, kFamily, looks.thumbMiddle, looks.middleTileWidth, looks.middleTileHeight);
    }

private:
    // Beside the near side of the rectangle.
    void DrawAt(short icon, Rect const &beside, int place) const {
        Point where;
        along.Place(where) = Pixel16(place);
        along.Across().Place(where) = along.Across().Start(beside);
        Draw1Icon(kFamily, icon, where.h, where.v);
    }

    SingleAxis along;
    Looks const &looks;
    Rect const &drawn;
};

} // namespace

int ScrollBarPane::GetMinLength() const { return 49; }

int ScrollBarPane::GetScrollBarWidth() const { return 16; }

int ScrollBarPane::GetFrameWidth() const { return 1; }

int ScrollBarPane::GetArrowPaneLength() const { return 14; }

int ScrollBarPane::GetMinThumbLength() const { return 16; }

short ScrollBarPane::GetArrowIconID(Orientation o, ScrollDirection towards) const {
    short const kUp = 26, kDown = 29, kLeft = 32, kRight = 35;
    if (o == kVertical)
        return towards == kTowardStart ? kUp : kDown;
    return towards == kTowardStart ? kLeft : kRight;
}

void ScrollBarPane::DrawBackgroundGuts(OSRgn *updateRegion) { DrawBackground(updateRegion); }

void ScrollBarPane::DrawBackground(OSRgn *) {
    Rect const bounds = GetBounds();
    VelaDrawing::RGBForeColor(kScrollBarBackgroundColor);
    VelaDrawing::PaintRect(&bounds);
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::PenNormal();
    Rect frame = bounds;
    if (flags & kEndBorderOutside)
        Along().End(frame) = Pixel16(Along().End(frame) + 1);
    if (flags & kStartBorderOutside)
        Along().Start(frame) = Pixel16(Along().Start(frame) - 1);
    VelaDrawing::FrameRect(&frame);
}

void ScrollBarPane::DrawThumbArea(OSRgn *updateRegion, bool live, Rect bounds, Rect thumbRect) {
    Rect const drawn = CarbonUtils::GetRgnBounds(updateRegion);
    ThumbArea const area(IsHorizontal(), drawn);
    area.DrawTrough(bounds, live);
    if (!live)
        return;
    area.DrawCaps(bounds);
    area.DrawThumb(thumbRect);
}
