#include "buttons/SuccessiveIconsPane.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"
#include "host/Icons.h"
#include "host/VelaDrawing.h"
#include <memory>
#include <new>

SuccessiveIconsPane::SuccessiveIconsPane(glogRec *owner, SuccessiveIconsResRec *resource)
    : SuccessiveIconsPane(owner, resource->bounds, resource->family, resource->baseIcon, resource->width) {}

SuccessiveIconsPane::SuccessiveIconsPane(glogRec *owner, Rect box, int iconFamily, int firstIcon,
                                         int iconWidth)
    : family(iconFamily)
    , baseIcon(firstIcon)
    , width(iconWidth) {
    if (GlogPaneInit(owner, 0))
        GlogPane::SetBox(&box);
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
SuccessiveIconsPane *
SuccessiveIconsPane::NewSuccessiveIconsPane(glogRec *owner, boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    UString const name = item->GetUStringItemValue(ResourceKey("FamilyID"));
    int const family = ISetIDMapper::Instance().GetID(name);
    int const baseIcon = static_cast<int>(item->GetSIntItemValue(ResourceKey("BaseIcon")));
    int const width = static_cast<int>(item->GetSIntItemValue(ResourceKey("Width")));
    std::unique_ptr<SuccessiveIconsPane> pane(new (std::nothrow) SuccessiveIconsPane(
        owner, OptionalRect(item, "BoundsRect"), family, baseIcon, width));
    return pane && pane->GetGlog() ? pane.release() : nullptr;
}

void SuccessiveIconsPane::GetIconData(int &iconFamily, int &firstIcon, int &iconWidth) {
    iconFamily = family;
    firstIcon = baseIcon;
    iconWidth = width;
}

int SuccessiveIconsPane::HandleClick(EventRecordAdapter *) { return 0; }

void SuccessiveIconsPane::DrawGuts(OSRgn *updateRegion) {
    VelaDrawing::NarrowClip(updateRegion);
    Rect box;
    GetBox(&box);
    // The last icon may stand out of the box: the clip cuts it.
    int icon = baseIcon;
    for (int x = box.left; x < box.right; x += width, ++icon)
        Draw1Icon(static_cast<short>(family), static_cast<short>(icon), static_cast<short>(x), box.top);
    ForceNextPrepare(); // the clip is narrower than Prepare left it
}
