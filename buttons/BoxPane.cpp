#include "buttons/BoxPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"

BoxPane::BoxPane(glogRec *owner, Rect &box) {
    if (GlogPaneInit(owner, 0))
        GlogPane::SetBox(&box);
}

BoxPane::BoxPane(glogRec *owner, GlogStyleSheet *sheet) {
    if (!GlogPaneInit(owner, 0))
        return;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    GlogPane::SetBox(&box);
}

void BoxPane::DrawGuts(OSRgn *) {}
