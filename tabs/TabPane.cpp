#include "tabs/TabPane.h"
#include "buttons/PartHelpTag.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "tabs/TabMeasures.h"
#include <boost/make_shared.hpp>

namespace {

int const kNoNumber = 0, kNumberFromSheet = -1;

} // namespace

// Construction

TabPane::Item::Item(UString const &name_)
    : Item(name_, name_) {}

TabPane::Item::Item(UString const &name_, UString const &shortName_)
    : name(name_)
    , shortName(shortName_)
    , textLayout(boost::make_shared<OS::TextLayout>())
    , enabled(true) {}

TabPane::TabPane(std::vector<Item> const &items_)
    : items(items_)
    , tabPadding(TabMeasures::kPlainPadding)
    , minTabWidth(0)
    , hiddenCount(0)
    , selectedItem(items_.empty() ? -1 : 0)
    , textDrawingFlags(0)
    , textStyle(0)
    , textSize(0) {}

TabPane::TabPane(glogRec *owner, Rect const &bounds, std::vector<Item> const &items_, int unused)
    : TabPane(owner, kNoNumber, items_, unused) {
    Rect box = bounds;
    GlogPane::SetBox(&box);
    itemRects.clear();
}

TabPane::TabPane(glogRec *owner, int id, std::vector<Item> const &items_, int)
    : TabPane(items_) {
    if (GlogPaneInit(owner, static_cast<short>(id)))
        InstallHelp();
}

TabPane::TabPane(glogRec *owner, GlogStyleSheet *sheet)
    : TabPane(std::vector<Item>()) {
    if (!GlogPaneInit(owner, kNumberFromSheet))
        return;
    GetFromXML(sheet);
    InstallHelp();
    DemandItemRects();
    UpdateLayout();
}

TabPane::~TabPane() {}

void TabPane::InstallHelp() { SetHelpTagHelper(AutoPtr<HelpTagHelper>(new MultiHelpTagHelper)); }

void TabPane::GetFromXML(GlogStyleSheet *sheet) {
    boost::shared_ptr<XMLLib::ContainerItem> const resource = sheet->GetItemRes();
    Rect box = OptionalRect(resource, "BoundsRect");
    SetBox(&box);
    boost::shared_ptr<XMLLib::ContainerItem> const names = resource->GetContainerItem(ResourceKey("Items"));
    if (!names)
        FailMemFullError();
    for (std::size_t i = 0; i < names->GetNumItems(); ++i)
        if (boost::shared_ptr<XMLLib::UStringItem> const name = XMLLib::UStringFromItem(names->GetNthItem(i)))
            items.push_back(Item(name->Get()));
    selectedItem = items.empty() ? -1 : 0;
}

// Looks and behaviour

int TabPane::GetTabHeight() const { return TabMeasures::kHeight; }

int TabPane::GetMinTabWidth() const { return 0; }

int TabPane::GetNameExtraWidth(int) const { return 0; }

bool TabPane::ShouldAllowTabSwitch(int from, int to) const { return from != to; }

bool TabPane::WindowIsActive() const { return true; }

int TabPane::GetTabEndWidth() const { return TabMeasures::kEndWidth; }

int TabPane::GetTabBodyWidth() const { return TabMeasures::kBodyWidth; }

// Items

void TabPane::SetEnableItem(int item, bool enabled) {
    GetItem(item).enabled = enabled;
    Inval();
}

void TabPane::InsertItem(int item, Item const &inserted) {
    items.insert(items.begin() + item, inserted);
    ListChanged();
}

void TabPane::DeleteItem(int item) {
    items.erase(items.begin() + item);
    ListChanged();
}

void TabPane::DeleteAllItems() {
    items.clear();
    ListChanged();
}

void TabPane::SetItemName(int item, UString const &name) {
    GetItem(item).name = name;
    ListChanged();
}

void TabPane::SetItemShortName(int item, UString const &name) {
    GetItem(item).shortName = name;
    ListChanged();
}

void TabPane::ListChanged() {
    InvalItemRects();
    Inval();
}

// Selection

// The new item is read from the pane for each listener, one of which may have selected another.
void TabPane::SetSelectedItem(int item) {
    int const oldItem = selectedItem;
    selectedItem = item;
    PaneWatch const watch(this);
    if (Provider<TabPane_Listener>::HasDependents()) {
        TabPane *const self = this;
        Message3<TabPane_Listener, TabPane *, TabPane *, int, int, int, int> const message(
            &TabPane_Listener::TabSelected, &self, &selectedItem, &oldItem);
        Provider<TabPane_Listener>::BroadcastChange(message, nullptr);
    }
    if (watch.PaneExists())
        Inval();
}

// Help

void TabPane::AttachHelpTag(int item, LocalizedStrings::HelpTag const *tag) {
    Rect place = GetItemBox(item);
    VelaDrawing::InsetRect(&place, TabMeasures::kDeadEnd, 0);
    AttachPartHelpTag(*this, tag, place);
}
