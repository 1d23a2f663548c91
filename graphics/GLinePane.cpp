#include "graphics/GLinePane.h"
#include "frame/ResourceReading.h"
#include "graphics/GLine.h"
#include "host/CompoundPane.h"
#include "host/GlogStyleSheet.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0;
int const kAlong = 1, kAcross = 3; // pixels by which the box is larger than the line is long and wide

struct Line {
    Point from, to;
};

// Through the middle of the rectangle, along its longer side.
Line MiddleOf(Rect const &r) {
    int const width = r.right - r.left, height = r.bottom - r.top;
    if (width <= height) {
        short const middle = static_cast<short>(width / 2 + r.left);
        return {{r.top, middle}, {r.bottom, middle}};
    }
    short const middle = static_cast<short>(height / 2 + r.top);
    return {{middle, r.left}, {middle, r.right}};
}

} // namespace

GLinePane::GLinePane()
    : vertical(false) {}

GLinePane::~GLinePane() {}

GLinePane *GLinePane::NewGLinePane(glogRec *owner, GLineResRec *record) {
    std::unique_ptr<GLinePane> pane(new (std::nothrow) GLinePane);
    return pane && pane->Init(owner, *record) ? pane.release() : nullptr;
}

GLinePane *GLinePane::NewGLinePane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect const line = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    GLineResRec record;
    record.kind = GLineResRec::kKind;
    record.top = std::min(line.top, line.bottom);
    record.left = std::min(line.left, line.right);
    record.bottom = std::max(line.top, line.bottom);
    record.right = std::max(line.left, line.right);
    return NewGLinePane(owner, &record);
}

bool GLinePane::Init(glogRec *owner, GLineResRec const &record) {
    if (!GlogPaneInit(owner, kNoNumber))
        return false;
    vertical = record.left == record.right;
    Rect box;
    box.top = record.top;
    box.left = record.left;
    box.bottom = Pixel16(record.bottom + (vertical ? kAlong : kAcross));
    box.right = Pixel16(record.right + (vertical ? kAcross : kAlong));
    SetBox(&box);
    return true;
}

void GLinePane::DrawGuts(OSRgn *) {
    Prepare();
    Rect r = GetDrawRectangle();
    if (container && container->UsesLayout()) {
        Line const line = MiddleOf(r);
        DrawGLine(line.from, line.to);
        return;
    }
    r.right = static_cast<short>(r.right - (vertical ? kAcross : kAlong));
    r.bottom = static_cast<short>(r.bottom - (vertical ? kAlong : kAcross));
    DrawGLine({r.top, r.left}, {r.bottom, r.right});
}
