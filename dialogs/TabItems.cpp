// Tabs in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "tabs/TabPane.h"
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0; // the loader numbers what it makes

class TabReporter : public MessageReporter<TabPane_Listener> {
public:
    using MessageReporter::MessageReporter;
    void TabSelected(TabPane *pane, int newItem, int oldItem) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*pane)
                                    .Text("message", std::string("TabSelected"))
                                    .Integer("item", newItem)
                                    .Integer("before", oldItem));
    }
};

void ReportTabs(GlogPane *pane) {
    if (TabPane *const tabs = dynamic_cast<TabPane *>(pane))
        new TabReporter(tabs);
}

bool DescribeTabs(GlogPane &pane, JsonLine &line) {
    TabPane *const tabs = dynamic_cast<TabPane *>(&pane);
    if (!tabs)
        return false;
    int const count = tabs->CountItems(), selected = tabs->GetSelectedItem();
    int hidden = 0;
    for (int i = 0; i < count; ++i)
        hidden += tabs->TabIsVisible(i) ? 0 : 1;
    line.Integer("selectedItem", selected).Integer("items", count).Integer("hidden", hidden);
    if (selected >= 0 && selected < count)
        line.Text("name", tabs->GetItemName(selected));
    return true;
}

// In the order of the tabs; those beyond the last tab have no use.
void TakeShortNames(TabPane &tabs, boost::shared_ptr<XMLLib::ContainerItem> const &names) {
    std::size_t const count = static_cast<std::size_t>(tabs.CountItems());
    for (std::size_t i = 0; names && i < names->GetNumItems() && i < count; ++i)
        tabs.SetItemShortName(static_cast<int>(i), XMLLib::UStringFromItem(names->GetNthItem(i))->Get());
}

GlogPane *MakeTabs(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<TabPane> tabs(new (std::nothrow) TabPane(glog, sheet));
    if (!tabs || !tabs->GetGlog())
        return nullptr;
    tabs->SetID(kNoNumber);
    int const selected = sheet->GetSInt32ItemValue(ResourceKey("Selected"));
    if (selected != 0 && selected >= tabs->CountItems())
        throw KeyFault("Selected", "there is no tab " + std::to_string(selected) + ": there are " +
                                       std::to_string(tabs->CountItems()) + ", counted from 0");
    if (selected != 0)
        tabs->SetSelectedItem_NoBroadcast(selected);
    TakeShortNames(*tabs, sheet->GetItemRes()->GetContainerItem(ResourceKey("ShortNames")));
    if (sheet->GetSInt32ItemValue(ResourceKey("FitToRect")) != 0)
        tabs->FitIntoRect(OptionalRect(sheet->GetItemRes(), "BoundsRect"));
    return tabs.release();
}

} // namespace

void AddTabItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeTabs);
    registry.Add(ItemType("Tabs")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Container("Items", KeyList().String("Tab").Repeated())
                               .Required()
                               .Container("ShortNames", KeyList().String("Tab").Repeated())
                               .Integer("Selected", 0, KeyList::kLargest)
                               .Flag("FitToRect"))
                     .MadeBy(MakeTabs)
                     .ReportedBy(ReportTabs));
}
