#include "tools/gallery/WellPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

namespace {

short const kBarThickness = 16; // pixels
enum Items { kView, kBarBelow, kBarBeside, kItemCount };

void Place(GlogPane *pane, Rect box) { pane->SetBox(&box); }

} // namespace

WellPane *WellPane::NewWellPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<WellPane> pane(new (std::nothrow) WellPane);
    if (!pane || !pane->CompoundPaneInit(owner, 0))
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    pane->SetBox(&box);
    return pane.release();
}

WellPane::WellPane() { SetNoErase(1); }

void WellPane::GlogItemInit() {
    CompoundPane::GlogItemInit();
    ArrangeItems();
}

void WellPane::SetBox(Rect *box) {
    CompoundPane::SetBox(box);
    ArrangeItems();
}

// The bars' frames lie on the frame of the well.
void WellPane::ArrangeItems() {
    if (NumSubpanes() < kItemCount)
        return;
    short const width = static_cast<short>(ItemWidth()), height = static_cast<short>(ItemHeight());
    short const right = static_cast<short>(width - kBarThickness);
    short const bottom = static_cast<short>(height - kBarThickness);
    Place(Get(kView), {1, 1, bottom, right});
    Place(Get(kBarBelow), {bottom, 0, height, static_cast<short>(right + 1)});
    Place(Get(kBarBeside), {0, right, static_cast<short>(bottom + 1), width});
}

void WellPane::DrawWell(Rect const &box) {
    VelaDrawing::RGBForeColor(kScrollBarBackgroundColor);
    VelaDrawing::PaintRect(&box);
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::PenNormal();
    VelaDrawing::FrameRect(&box);
}

void WellPane::DrawBackgroundGuts(OSRgn *) {
    SaveColors const colors;
    DrawWell(GetDrawRectangle());
}
