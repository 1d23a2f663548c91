// Groups and spacers in dialogs.
#include "dialogs/GroupPane.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/SpacerPane.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"

namespace {

long long const kLargestInset = 1000; // pixels

KeyList InsetKeys() {
    return KeyList()
        .Integer("top", 0, kLargestInset)
        .Integer("left", 0, kLargestInset)
        .Integer("bottom", 0, kLargestInset)
        .Integer("right", 0, kLargestInset);
}

// Without a rectangle the group has the size of what is in it.
void SetPlace(GroupPane *group, boost::shared_ptr<XMLLib::ContainerItem> const &item) {
    if (!item->GetContainerItem(ResourceKey("BoundsRect"))) {
        Point const origin = OptionalPoint(item, "Origin");
        Rect box = {origin.v, origin.h, origin.v, origin.h};
        group->SetBox(&box);
        group->SetSizeToLayout(true);
        return;
    }
    Rect box = OptionalRect(item, "BoundsRect");
    group->SetBox(&box);
}

void SetInsets(GroupPane *group, GlogStyleSheet *sheet) {
    boost::shared_ptr<XMLLib::ContainerItem> const insets = sheet->GetContainerItem(ResourceKey("Insets"));
    if (!insets)
        return;
    auto const inset = [&](char const *edge) {
        return static_cast<int>(insets->GetSIntItemValue(ResourceKey(edge)));
    };
    group->SetInsets(inset("top"), inset("left"), inset("bottom"), inset("right"));
}

GroupPane::Arrangement ArrangementNamed(UString const &word) {
    if (word == ResourceKey("free"))
        return GroupPane::kFree;
    return word == ResourceKey("horiz") ? GroupPane::kRightward : GroupPane::kDownward;
}

GlogPane *MakeGroup(glogRec *glog, GlogStyleSheet *sheet) {
    bool const panel = sheet->GetUStringItemValue(ResourceKey("Style")) == ResourceKey("panel");
    GroupPane *const group = GroupPane::NewGroupPane(glog, panel ? GroupPane::kPanel : GroupPane::kPlain);
    if (!group)
        return nullptr;
    group->SetArrangement(ArrangementNamed(sheet->GetUStringItemValue(ResourceKey("Direction"))));
    group->SetSpacing(sheet->GetSInt32ItemValue(ResourceKey("Spacing")));
    SetInsets(group, sheet);
    SetPlace(group, sheet->GetItemRes());
    return group;
}

GlogPane *MakeSpacer(glogRec *glog, GlogStyleSheet *) { return SpacerPane::NewSpacerPane(glog); }

} // namespace

void AddGroupItems(ItemRegistry &registry) {
    registry.Add(ItemType("Group")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Point("Origin")
                               .Word("Direction", {"vert", "horiz", "free"})
                               .Integer("Spacing", 0, kLargestInset)
                               .Attributes("Insets", InsetKeys())
                               .Word("Style", {"plain", "panel"}))
                     .MadeBy(MakeGroup)
                     .HoldsItems());
    registry.Add(ItemType("Spacer").MadeBy(MakeSpacer));
}
