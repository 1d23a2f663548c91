#include "scrolling/GutterPane.h"
#include "scrolling/SingleAxis.h"
#include "scrolling/Truncation.h"

namespace {

SingleAxis LengthOf(GutterPane::GutterType type) { return SingleAxis(type == GutterPane::kRightGutter); }

} // namespace

GutterPane::GutterPane(glogRec *owner, GutterType type)
    : gutterType(type) {
    CompoundPaneInit(owner, 0);
}

int GutterPane::GetContainerHeight() { return container ? container->ItemHeight() : 0; }

int GutterPane::GetContainerWidth() { return container ? container->ItemWidth() : 0; }

int GutterPane::GetPaneRightEdgeOffset() { return 0; }

int GutterPane::GetPaneBottomEdgeOffset() { return 0; }

void GutterPane::InitializeBounds() {
    Rect border = GetLayout()->GetBorderRect();
    SetBox(&border);
    Resize({0, 0});
}

void GutterPane::SetBox(Rect *rect) {
    Rect const old = GetBounds();
    Rect box = *rect;
    if (gutterType == kRightGutter)
        box.bottom = Pixel16(GetContainerHeight() - GetPaneBottomEdgeOffset());
    else
        box.right = Pixel16(GetContainerWidth() - GetPaneRightEdgeOffset());
    GlogPane::SetBox(&box);
    SingleAxis const along = LengthOf(gutterType);
    if (along.Length(box) != along.Length(old))
        GutterLengthChanged(gutterType);
}

// One pixel beyond the edge, so that the strip's border and its container's become one line.
void GutterPane::Resize(Point) {
    Rect box;
    GetBox(&box);
    if (gutterType == kBottomGutter) {
        int const shift =
            GetContainerHeight() - (box.bottom - box.top) - box.top - GetPaneBottomEdgeOffset() + 1;
        box.top = Pixel16(box.top + shift);
        box.bottom = Pixel16(box.bottom + shift);
    } else {
        int const shift =
            GetContainerWidth() - (box.right - box.left) - box.left - GetPaneRightEdgeOffset() + 1;
        box.left = Pixel16(box.left + shift);
        box.right = Pixel16(box.right + shift);
    }
    Inval();
    SetBox(&box);
    Inval();
}

void GutterPane::ContainmentChanged() { Resize({0, 0}); }
