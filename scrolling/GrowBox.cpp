#include "scrolling/GrowBox.h"
#include "frame/ResourceReading.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <memory>
#include <new>

namespace {

short const kFamily = 1000;
short const kSide = 15; // pixels
enum GrowIcon {
    kLeftBorder = 20,
    kTopBorder = 21,
    kBothBorders = 22,
    kFirstColor = 23,
    kPlain = 24,
    kSecondColor = 25
};
enum FlatIcon { kFlatPlain = 83, kFlatLeftBorder = 84, kFlatTopBorder = 85 };
int const kFirstColorNumber = 1, kSecondColorNumber = 2;

short IconFor(growResRec const &record) {
    if (record.color == kFirstColorNumber)
        return kFirstColor;
    if (record.color == kSecondColorNumber)
        return kSecondColor;
    if (record.borderLeft && record.borderTop)
        return kBothBorders;
    if (record.borderLeft)
        return kLeftBorder;
    return record.borderTop ? kTopBorder : kPlain;
}

short FlatIconFor(short icon) {
    if (icon == kLeftBorder)
        return kFlatLeftBorder;
    return icon == kTopBorder ? kFlatTopBorder : kFlatPlain;
}

Rect CornerOf(Rect const &port) {
    return {static_cast<short>(port.bottom - kSide), static_cast<short>(port.right - kSide), port.bottom,
            port.right};
}

} // namespace

GrowBox::GrowBox()
    : icon(kPlain) {}

GrowBox::~GrowBox() {}

GrowBox *GrowBox::InitGrowBox(glogRec *owner, short id, growResRec *record) {
    std::unique_ptr<GrowBox> box(new (std::nothrow) GrowBox);
    if (!box || !box->GlogPaneInit(owner, id))
        return nullptr;
    if (record)
        box->TakeFrom(*record);
    box->GoToCorner();
    return box.release();
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
GrowBox *GrowBox::InitGrowBox(glogRec *owner, short id, boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    growResRec record;
    record.kind = growResRec::kKind;
    record.limits = XMLLib::GetRect(item, ResourceKey("LimitsRect"));
    record.borderLeft = static_cast<unsigned char>(item->GetSIntItemValue(ResourceKey("BorderLeft")));
    record.borderTop = static_cast<unsigned char>(item->GetSIntItemValue(ResourceKey("BorderTop")));
    record.color = static_cast<int>(item->GetSIntItemValue(ResourceKey("Color")));
    return InitGrowBox(owner, id, &record);
}

void GrowBox::TakeFrom(growResRec const &record) {
    GetGlog()->SetMinSize(record.limits.left, record.limits.top);
    GetGlog()->SetMaxSize(record.limits.right, record.limits.bottom);
    icon = IconFor(record);
}

void GrowBox::GoToCorner() {
    Rect box = CornerOf(GetLocalPortRect(GetGlog()->GetPort()));
    SetBox(&box);
}

void GrowBox::Resize(Point) {
    if (IsInLayout() || !GetGlog())
        return;
    Prepare();
    Rect box = CornerOf(GetLocalPortRect(GetGlog()->GetPort()));
    Inval();
    SetBox(&box);
    Inval();
}

void GrowBox::ContainmentChanged() { Resize({0, 0}); }

int GrowBox::HandleClick(EventRecordAdapter *) { return -1; }

void GrowBox::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Rect const bounds = GetBounds();
    if (OS::Services::ShowsGrowBoxes() && !GetGlog()->IsContained()) {
        Draw1Icon(kFamily, icon, bounds.left, bounds.top);
        return;
    }
    VelaDrawing::PenNormal();
    if (icon != kSecondColor)
        DrawFlat(bounds);
    DrawBorders(bounds);
}

void GrowBox::DrawFlat(Rect const &bounds) const {
    SetBackgroundColor(icon == kFirstColor ? glog->GetContentColor() : kScrollBarBackgroundColor);
    VelaDrawing::EraseRect(&bounds);
    Draw1Icon(kFamily, FlatIconFor(icon), bounds.left, bounds.top);
}

void GrowBox::DrawBorders(Rect const &bounds) const {
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::MoveTo(bounds.left, bounds.top);
    switch (icon) {
    case kLeftBorder:
        VelaDrawing::LineTo(bounds.left, bounds.bottom);
        break;
    case kTopBorder:
        VelaDrawing::LineTo(bounds.right, bounds.top);
        break;
    case kBothBorders:
        VelaDrawing::LineTo(bounds.right, bounds.top);
        VelaDrawing::MoveTo(bounds.left, bounds.top);
        VelaDrawing::LineTo(bounds.left, bounds.bottom);
        break;
    case kFirstColor:
    case kSecondColor:
        break;
    default:
        VelaDrawing::LineTo(bounds.left, bounds.top); // the corner alone
    }
}
