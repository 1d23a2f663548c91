// What the tests of the scroll bar share: an upright bar and a level one with one client each.
#pragma once
#include "desktop/windows/PlatformConventions.h"
#include "host/GlogLayout.h"
#include "host/Icons.h"
#include "tests/PaneTest.h"
#include "tests/scrolling/RecordingClient.h"

// Arrows where the platform wants them, until the end of the scope.
class ArrowsTogether {
public:
    ArrowsTogether() { PlatformConventions::scrollArrowsTogetherAtEnd = true; }
    ~ArrowsTogether() { PlatformConventions::scrollArrowsTogetherAtEnd = false; }
};

class ScrollBarTest : public PaneTest {
protected:
    typedef std::vector<std::string> Log;
    enum Part { kUpArrow, kThumb, kDownArrow }; // indices of the subpanes

    // An upright bar's box from {10, 20}, a level one's from {10, 50}.
    static Rect UprightBox(int length) { return Rect{10, 20, static_cast<short>(10 + length), 36}; }
    static Rect LevelBox(int length) { return Rect{10, 50, 26, static_cast<short>(50 + length)}; }

    ScrollBarPane *NewBar(short flags, Rect bounds, short edgeH = 0, short edgeV = 0) {
        sbarResRec record = {sbarResRec::kType, flags, bounds, edgeH, edgeV};
        return ScrollBarPane::NewScrollBarPane(glog, &record);
    }
    ScrollBarPane *Upright(int length = 130, short flags = 0) { return NewBar(flags, UprightBox(length)); }
    ScrollBarPane *Level(int length = 130, short flags = 0) {
        return NewBar(static_cast<short>(flags | ScrollBarPane::kHorizontalBar), LevelBox(length));
    }
    // The bar with the client, at a position.
    ScrollBarPane *Live(ScrollBarPane *bar, int position = 0) {
        bar->SetClient(&client);
        client.position = position;
        bar->Set(position, client.greatest);
        return bar;
    }

    // The rectangle of a part, from the bar's top left.
    static Rect BoxOfPart(ScrollBarPane &bar, Part part) {
        WithPerformLayoutRectUpdate const settled(&bar);
        return bar.Get(part)->GetBounds();
    }
    static int LengthOf(ScrollBarPane &bar, Part part) {
        Rect const r = BoxOfPart(bar, part);
        return bar.IsHorizontal() ? r.right - r.left : r.bottom - r.top;
    }

    // The drawing calls of a part, or of all behind the parts.
    Lines DrawingOfPart(ScrollBarPane &bar, Part part, OSRgn *region = nullptr) {
        GlogPane &pane = *bar.Get(part);
        WithPerformLayoutRectUpdate const settled(&bar);
        return Traced(pane, [&] { (pane.*&Opened<GlogPane>::DrawGuts)(region); });
    }
    // Whether the thumb is drawn, and the trough as that of a live bar.
    bool LooksLive(ScrollBarPane &bar) { return Only("Draw1Icon", DrawingOfPart(bar, kThumb)).size() > 2; }
    bool ArrowLooksLive(ScrollBarPane &bar, Part arrow) {
        GlogPane &pane = *bar.Get(arrow);
        Rect const box = BoxOfPart(bar, arrow);
        short const idle = static_cast<short>((bar.IsHorizontal() ? 32 : 26) + (arrow == kUpArrow ? 0 : 3));
        return DrawingOfPart(bar, arrow) == Traced(pane, [&] { Draw1Icon(1000, idle, box.left, box.top); });
    }
    bool IsLive(ScrollBarPane &bar) {
        bool const live = LooksLive(bar);
        EXPECT_EQ(ArrowLooksLive(bar, kUpArrow), live);
        EXPECT_EQ(ArrowLooksLive(bar, kDownArrow), live);
        return live;
    }

    RecordingClient client;
};
