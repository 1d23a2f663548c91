#include "buttons/OvalButtonPane.h"
#include "buttons/ButtonLabel.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/PortSavers.h"
#include "host/glogRec.h"
#include <memory>
#include <new>

namespace {

short const kLabelList = 4323;
int const kLabelFont = 0;

// How style sheets tell the layout properties of oval buttons from those of other panes.
int const kLayoutPaneType = 18;

short const kButtonHeight = 19; // pixels
short const kPieceWidth = 16;   // pixels
short const kFaceFamily = 1841;
short const kNormalFace = 0, kPressedFace = 3;
short const kLeftCap = 0, kMiddle = 1, kRightCap = 2; // counted from the face's first icon

short const kPressedTextDrop = 1; // pixels
short const kTextLift = 2;        // pixels off the bottom of the text rectangle

} // namespace

OvalButtonPane::OvalButtonPane() {}

OvalButtonPane *OvalButtonPane::NewOvalButtonPane(glogRec *owner, gobResRec *resource) {
    std::unique_ptr<OvalButtonPane> pane(new (std::nothrow) OvalButtonPane);
    if (!pane || !pane->InitOvalButtonPane(owner, resource))
        return nullptr;
    return pane.release();
}

OvalButtonPane *OvalButtonPane::NewOvalButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect const bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    gobResRec resource;
    resource.kind = gobResRec::kKind;
    resource.top = bounds.top;
    resource.left = bounds.left;
    resource.width = static_cast<short>(bounds.right - bounds.left);
    resource.text = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("TextNum")));
    resource.mode = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("Mode")));
    return NewOvalButtonPane(owner, &resource);
}

OvalButtonPane *OvalButtonPane::InitOvalButtonPane(glogRec *owner, gobResRec *resource) {
    Point const topLeft = {resource->top, resource->left};
    return InitOvalButtonPane(owner, topLeft, resource->width, resource->text, resource->mode);
}

OvalButtonPane *OvalButtonPane::InitOvalButtonPane(glogRec *owner, Point topLeft, short width, short textNum,
                                                   short initialMode) {
    if (!InitGlogButtonPane(owner, static_cast<unsigned char>(initialMode)))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, owner->GetStyleSheet());
    Rect box;
    box.top = topLeft.v;
    box.left = topLeft.h;
    box.bottom = static_cast<short>(topLeft.v + kButtonHeight);
    box.right = static_cast<short>(topLeft.h + width);
    SetBox(&box);
    label = LocalizedStrings::GetString(kLabelList, textNum);
    return this;
}

void OvalButtonPane::GetButtonText(UString &text) const { text = label; }

// By value, as the interface has it. NOLINTNEXTLINE(performance-unnecessary-value-param)
void OvalButtonPane::SetButtonText(UString text) { label = text; }

void OvalButtonPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Rect r = GetDrawRectangle();
    ClearColors();
    DrawFace(r);

    if (ButtonIsDown()) {
        r.top = static_cast<short>(r.top + kPressedTextDrop);
        r.bottom = static_cast<short>(r.bottom + kPressedTextDrop);
    }
    ButtonLabel::SetColor(GetMode());
    r.bottom = static_cast<short>(r.bottom - kTextLift);
    ButtonLabel::Draw(layout, label, r, kLabelFont);
}

void OvalButtonPane::DrawFace(Rect const &r) const {
    short const face = ButtonIsDown() ? kPressedFace : kNormalFace;
    Draw1Icon(kFaceFamily, static_cast<short>(face + kLeftCap), r.left, r.top);
    DrawMiddle(r, static_cast<short>(face + kMiddle));
    Draw1Icon(kFaceFamily, static_cast<short>(face + kRightCap), static_cast<short>(r.right - kPieceWidth),
              r.top);
}

// Fills what the caps leave with whole pieces; the clip cuts the last one short, so that any width works.
void OvalButtonPane::DrawMiddle(Rect const &r, short icon) const {
    int const pieces = (r.right - r.left) / kPieceWidth - 1; // 0 or fewer where the caps meet or overlap
    Rect middle = r;
    middle.left = static_cast<short>(r.left + kPieceWidth);
    middle.right = static_cast<short>(r.right - kPieceWidth);
    WithClipRect const clip(middle);
    for (int i = 0; i < pieces; ++i)
        Draw1Icon(kFaceFamily, icon, static_cast<short>(middle.left + i * kPieceWidth), r.top);
}
