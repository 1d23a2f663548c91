#include "tools/gallery/BackdropPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogLayout.h"
#include "host/GlogStyleSheet.h"
#include <memory>
#include <new>

BackdropPane *BackdropPane::NewBackdropPane(glogRec *owner, GlogStyleSheet *sheet) {
    short const picture = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("Num")));
    std::unique_ptr<BackdropPane> pane(new (std::nothrow) BackdropPane(picture));
    if (!pane || !pane->GlogPaneInit(owner, 0))
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    pane->SetBox(&box);
    return pane.release();
}

void BackdropPane::DrawGuts(OSRgn *) { image.Draw(GetDrawRectangle()); }
