#include "dialogs/GroupPane.h"
#include "frame/ResourceReading.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

namespace {

double const kCorner = 12; // pixels, width and height of the ellipse that rounds the corners

} // namespace

GroupPane::GroupPane(Style style_)
    : style(style_) {
    SetNoErase(1); // a group is drawn on whatever it lies on
}

GroupPane *GroupPane::NewGroupPane(glogRec *owner, Style style) {
    std::unique_ptr<GroupPane> pane(new (std::nothrow) GroupPane(style));
    if (!pane || !pane->CompoundPaneInit(owner, 0))
        return nullptr;
    pane->SetUseLayout(true);
    return pane.release();
}

void GroupPane::SetArrangement(Arrangement arrangement) {
    SetUseLayout(arrangement != kFree);
    GetLayout()->SetAttributeFromString(GlogLayoutItem::kDirection,
                                        ResourceKey(arrangement == kRightward ? "horiz" : "vert"));
}

void GroupPane::SetLength(GlogLayoutItem::Attribute attribute, int pixels) {
    GetLayout()->SetAttribute(attribute, pixels, GlogLayoutItem::kPixels, UString());
}

void GroupPane::SetSpacing(int pixels) { SetLength(GlogLayoutItem::kSpacing, pixels); }

void GroupPane::SetInsets(int top, int left, int bottom, int right) {
    SetLength(GlogLayoutItem::kInsetTop, top);
    SetLength(GlogLayoutItem::kInsetLeft, left);
    SetLength(GlogLayoutItem::kInsetBottom, bottom);
    SetLength(GlogLayoutItem::kInsetRight, right);
}

void GroupPane::DrawBackgroundGuts(OSRgn *) {
    if (style != kPanel)
        return;
    SaveColors const colors;
    Rect const box = GetDrawRectangle();
    OS::RectBase<OS::RectTag> const plate(box);
    OSPort &port = OSPort::Current();
    port.SetForeColor(kDialogListBackgroundColor);
    port.PaintRoundRect(plate, OS::Size(kCorner, kCorner));
    port.SetForeColor(kPanelUnderline);
    port.PenNormal();
    port.FrameRoundRect(plate, OS::Size(kCorner, kCorner));
}
