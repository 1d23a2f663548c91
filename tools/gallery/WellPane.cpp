#include "tools/gallery/WellPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

WellPane *WellPane::NewWellPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<WellPane> pane(new (std::nothrow) WellPane);
    if (!pane || !pane->GlogPaneInit(owner, 0))
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    pane->SetBox(&box);
    return pane.release();
}

void WellPane::DrawWell(Rect const &box) {
    VelaDrawing::RGBForeColor(kScrollBarBackgroundColor);
    VelaDrawing::PaintRect(&box);
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::PenNormal();
    VelaDrawing::FrameRect(&box);
}

void WellPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    DrawWell(GetDrawRectangle());
}
