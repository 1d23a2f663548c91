#include "tools/gallery/ChoiceButtonPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

namespace {

short const kTextInset = 12; // pixels
double const kCorner = 10;   // pixels, width and height of the ellipse that rounds the corners
int const kPlainFont = 0;
int const kChosenFont = 6;
int const kCentredVertically = 1;
int const kCentreAlignment = 2; // as the key has it

} // namespace

ChoiceButtonPane *ChoiceButtonPane::NewChoiceButtonPane(glogRec *owner, Rect const &box,
                                                        UString const &label) {
    std::unique_ptr<ChoiceButtonPane> pane(new (std::nothrow) ChoiceButtonPane);
    if (!pane || !pane->InitGlogButtonPane(owner, kEnabled))
        return nullptr;
    Rect place = box;
    pane->SetBox(&place);
    pane->label = label;
    return pane.release();
}

ChoiceButtonPane *ChoiceButtonPane::NewChoiceButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect const box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    UString const label = sheet->GetUStringItemValue(ResourceKey("ButtonText"));
    bool const centred = sheet->GetSInt32ItemValue(ResourceKey("Align")) == kCentreAlignment;
    ChoiceButtonPane *const pane = NewChoiceButtonPane(owner, box, label);
    if (pane)
        pane->centred = centred;
    return pane;
}

void ChoiceButtonPane::GetButtonText(UString &text) const { text = label; }

void ChoiceButtonPane::SetChosen(bool on) {
    if (on == chosen)
        return;
    chosen = on;
    Inval();
}

void ChoiceButtonPane::DrawPlate(Rect const &box) const {
    OS::RectBase<OS::RectTag> const plate(box);
    OSPort &port = OSPort::Current();
    port.SetForeColor(ButtonIsDown() ? kPanelUnderline : kDialogListBackgroundColor);
    port.PaintRoundRect(plate, OS::Size(kCorner, kCorner));
    port.SetForeColor(kPanelUnderline);
    port.PenNormal();
    port.FrameRoundRect(plate, OS::Size(kCorner, kCorner));
}

void ChoiceButtonPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Rect const box = GetDrawRectangle();
    if (chosen || ButtonIsDown())
        DrawPlate(box);
    Rect text = box;
    VelaDrawing::InsetRect(&text, centred ? 0 : kTextInset, 0);
    VelaDrawing::RGBForeColor(chosen ? kDialogActiveTextColor : kDialogInactiveTextColor);
    DrawTextLayoutInRect(layout, label, text, chosen ? kChosenFont : kPlainFont,
                         centred ? TextSettings::kAlignCenter : TextSettings::kAlignLeft,
                         TextSettings::kTruncateEnd, kCentredVertically, 0, 0, 0, 0.0f, 1.0f, 1.0f);
}
