#include "buttons/FrameButtonPane.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

namespace {

short const kFaceWidth = 24;  // pixels
short const kFaceHeight = 16; // pixels

// A button with this family gets the stock face under its icon.
short const kStockFaceMark = 1821;
short const kStockFaceFamily = 1608;
short const kFaceOff = 69, kFaceOn = 70, kFaceDisabled = 71;

short const kEnabledGray = 0;   // percent
short const kDisabledGray = 50; // percent

int const kShiftClicked = 2;

void SetFrameButtonState(FrameButtonPane *button, bool on) { button->SetState(on); }

} // namespace

void (*gfbSetState)(FrameButtonPane *, bool) = SetFrameButtonState;

FrameButtonPane::FrameButtonPane()
    : record()
    , state(0) {}

FrameButtonPane *FrameButtonPane::NewFrameButtonPane(glogRec *owner, gfbResRec *resource) {
    std::unique_ptr<FrameButtonPane> pane(new (std::nothrow) FrameButtonPane);
    if (!pane || !pane->InitFrameButtonPane(owner, resource))
        return nullptr;
    return pane.release();
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
FrameButtonPane *FrameButtonPane::NewFrameButtonPane(glogRec *owner,
                                                     boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    gfbResRec resource;
    resource.kind = gfbResRec::kKind;
    resource.origin = OptionalPoint(item, "Origin");
    UString const family = item->GetUStringItemValue(ResourceKey("ISetID"));
    resource.family = static_cast<short>(ISetIDMapper::Instance().GetID(family));
    resource.icon = static_cast<short>(item->GetSIntItemValue(ResourceKey("IconID")));
    resource.gutsOrigin = OptionalPoint(item, "GutsOrigin");
    resource.downOffset = static_cast<short>(item->GetSIntItemValue(ResourceKey("DownOffset")));
    resource.hiliteWhenDown = static_cast<short>(item->GetSIntItemValue(ResourceKey("HiliteWhenDown")));
    return NewFrameButtonPane(owner, &resource);
}

FrameButtonPane *FrameButtonPane::InitFrameButtonPane(glogRec *owner, gfbResRec *resource) {
    if (!InitGlogButtonPane(owner, kEnabled))
        return nullptr;
    record = *resource;
    Rect box;
    box.top = record.origin.v;
    box.left = record.origin.h;
    box.bottom = static_cast<short>(box.top + record.downOffset + kFaceHeight);
    box.right = static_cast<short>(box.left + record.downOffset + kFaceWidth);
    SetBox(&box);
    return this;
}

void FrameButtonPane::SetState(unsigned char newState) {
    unsigned char const on = newState != 0;
    if (on == state)
        return;
    state = on;
    Inval();
}

void FrameButtonPane::ToggleState() {
    state = !state;
    Inval();
}

void FrameButtonPane::Depress() { GlogButtonPane::Depress(); }

void FrameButtonPane::Release() { GlogButtonPane::Release(); }

void FrameButtonPane::DoDrawButtonFace(short h, short v) { Draw1Icon(record.family, record.icon, h, v); }

short FrameButtonPane::FaceIcon() const {
    if (GetMode() != kEnabled)
        return kFaceDisabled;
    return state ? kFaceOn : kFaceOff;
}

void FrameButtonPane::SetIconColor() const {
    GrayForeColor(GetMode() != kEnabled ? kDisabledGray : kEnabledGray);
}

void FrameButtonPane::DrawGuts(OSRgn *) {
    Rect const r = GetDrawRectangle();
    short const iconH = static_cast<short>(r.left + record.gutsOrigin.h);
    short const iconV = static_cast<short>(r.top + record.gutsOrigin.v);

    if (record.family == kStockFaceMark) {
        Draw1Icon(kStockFaceFamily, FaceIcon(), r.left, r.top);
    } else {
        SetIconColor();
        DoDrawButtonFace(iconH, iconV);
    }
    // Also after a face that was the icon itself: a subclass may draw quite another one.
    if (record.family > 0) {
        SetIconColor();
        Draw1Icon(record.family, record.icon, iconH, iconV);
    }
}

int FrameButtonPane::HandleClick(EventRecordAdapter *event) {
    int const result = GlogButtonPane::HandleClick(event);
    // The pane itself may be gone by now; the event is not.
    return result > 0 && ShiftEvent(event) ? kShiftClicked : result;
}
