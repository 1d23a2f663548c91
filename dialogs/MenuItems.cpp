// Pop-up menus and note durations in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/TruncateWord.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "menus/DurationNotePane.h"
#include "menus/ScrollBarPopupMenuPane.h"
#include <algorithm>
#include <memory>
#include <new>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0; // the loader numbers what it makes
short const kEmptyMenu = 137;
long long const kLargest = KeyList::kLargest;
long long const kLastPulldown = kPulldownNarrow;
long long const kLargestFace = 255;
long long const kLargestFlags = 255;
int const kDeepest = 3; // menus within each other

char const kItemsKey[] = "MenuItems";
char const kItemKey[] = "MenuItem";
char const kDurationKey[] = "Duration";
char const kDurationsKey[] = "MenuDurations";

int Number(Container const &item, char const *key) {
    return static_cast<int>(item->GetSIntItemValue(ResourceKey(key)));
}

bool Has(Container const &item, char const *key) { return item->GetSInt32Item(ResourceKey(key)) != nullptr; }

// Messages

class MenuReporter : public MessageReporter<PopUpMenuListener> {
public:
    MenuReporter(Provider<PopUpMenuListener> *provider, GlogPane &pane_)
        : MessageReporter(provider)
        , pane(pane_) {}
    void ListenToMenuChange(PopUpMenu *, short item) override {
        if (MessageTrace::On())
            MessageTrace::Write(
                MessageTrace::Begin(pane).Text("message", std::string("MenuChange")).Integer("item", item));
    }
    void ListenToItemSelected(PopUpMenu *, OSMenuHandle &, UString const &name, short item) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(pane)
                                    .Text("message", std::string("ItemSelected"))
                                    .Text("submenu", name)
                                    .Integer("item", item));
    }

private:
    GlogPane &pane; // which the reporter goes with
};

void ReportMenu(GlogPane *pane) {
    if (PopMPane *const menu = dynamic_cast<PopMPane *>(pane))
        new MenuReporter(menu, *menu);
}

class DurationReporter : public MessageReporter<DurationNotePane_Listener> {
public:
    using MessageReporter::MessageReporter;
    void DurationValueChanged(DurationNotePane *pane) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*pane)
                                    .Text("message", std::string("DurationValueChanged"))
                                    .Integer("numerator", pane->GetDurationValue().first)
                                    .Integer("denominator", pane->GetDurationValue().second));
    }
};

void ReportDuration(GlogPane *pane) {
    if (DurationNotePane *const notes = dynamic_cast<DurationNotePane *>(pane))
        new DurationReporter(notes);
}

// Tree dump

bool DescribeMenu(GlogPane &pane, JsonLine &line) {
    PopMPane *const menu = dynamic_cast<PopMPane *>(&pane);
    if (!menu)
        return false;
    UString name;
    menu->GetCurItemName(name);
    line.Integer("selectedItem", menu->GetSelectedItem())
        .Integer("items", menu->CountItems())
        .Text("name", name)
        .Flag("enabled", menu->GetMenuHandle().IsEnabled());
    return true;
}

bool DescribeDuration(GlogPane &pane, JsonLine &line) {
    DurationNotePane *const notes = dynamic_cast<DurationNotePane *>(&pane);
    if (!notes)
        return false;
    line.Integer("numerator", notes->GetDurationValue().first)
        .Integer("denominator", notes->GetDurationValue().second);
    return true;
}

// Pop-up menus

// The items, and below them those of their submenus.
KeyList ItemKeys(int depth) {
    KeyList keys;
    keys.String("Text").Required().Integer("Icon", 0, kLargest).Flag("Checked").Flag("Disabled");
    if (depth > 1)
        keys.Container("SubmenuItems", KeyList().Container(kItemKey, ItemKeys(depth - 1)).Repeated());
    return keys;
}

// Calls the function with each item of the container, if there is one.
template <class Function> void ForEachItem(Container const &items, Function const &function) {
    for (std::size_t i = 0; items && i < items->GetNumItems(); ++i)
        function(XMLLib::ContainerFromItem(items->GetNthItem(i)));
}

void SetLook(OSMenuHandle menu, Container const &item) {
    short const number = menu.NumMenuItems();
    menu.SetMenuItemIcon(number, static_cast<short>(Number(item, "Icon")));
    menu.SetMenuItemCheck(number, Number(item, "Checked") != 0);
    menu.SetItemEnabled(number, menu.IsItemEnabled(number) && Number(item, "Disabled") == 0);
}

void AddToSubmenu(PopUpMenu &owner, OSMenuHandle submenu, Container const &items) {
    ForEachItem(items, [&](Container const &item) {
        UString const text = item->GetUStringItemValue(ResourceKey("Text"));
        Container const below = item->GetContainerItem(ResourceKey("SubmenuItems"));
        if (below)
            AddToSubmenu(owner, owner.AppendNewEmptyHierarchicalMenu(text, submenu), below);
        else if (text == ResourceKey("-"))
            submenu.AppendMenuSeparator();
        else
            submenu.AppendItem(text);
        SetLook(submenu, item);
    });
}

void AddItems(PopUpMenu &menu, Container const &items) {
    ForEachItem(items, [&](Container const &item) {
        UString const text = item->GetUStringItemValue(ResourceKey("Text"));
        Container const below = item->GetContainerItem(ResourceKey("SubmenuItems"));
        if (below)
            AddToSubmenu(menu, menu.AppendNewEmptyHierarchicalMenu(text), below);
        else
            menu.AddItem(text, PopUpMenu::kDashIsSeparator);
        SetLook(menu.GetMenuHandle(), item);
    });
}

// Item numbers are 16 bits wide.
std::size_t MostItems(Container const &items) {
    std::size_t most = items ? items->GetNumItems() : 0;
    ForEachItem(items, [&](Container const &item) {
        most = std::max(most, MostItems(item->GetContainerItem(ResourceKey("SubmenuItems"))));
    });
    return most;
}

void RequireItemCount(Container const &item) {
    if (MostItems(item->GetContainerItem(ResourceKey(kItemsKey))) > static_cast<std::size_t>(kLargest))
        throw KeyFault(kItemsKey, "a menu has at most " + std::to_string(kLargest) + " items");
}

void RequireMenu(short id) {
    if (!OSMenuHandle::IsSingletonMenu(id))
        throw KeyFault("MenuID", "there is no menu of the id " + std::to_string(id));
}

short MenuOf(Container const &item) {
    short const id = static_cast<short>(Has(item, "MenuID") ? Number(item, "MenuID") : kEmptyMenu);
    RequireMenu(id);
    return id;
}

// What a dialog says of a pop-up beside what the pane reads itself.
void SetUp(PopMPane &pane, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    AddItems(pane, item->GetContainerItem(ResourceKey(kItemsKey)));
    int const count = pane.CountItems();
    if (Number(item, "Selected") > count)
        throw KeyFault("Selected", "there is no item " + std::to_string(Number(item, "Selected")) +
                                       ": the menu has " + std::to_string(count));
    if (Has(item, "Selected"))
        pane.SelectItem(static_cast<short>(Number(item, "Selected")));
    if (Has(item, "Enabled"))
        pane.EnableMenu(Number(item, "Enabled") != 0);
    if (Has(item, "Pulldown"))
        pane.SetPulldownLocation(PopupMenuPulldown(Number(item, "Pulldown")));
    pane.SetTruncation(TruncateWord::Of(sheet, TextSettings::kTruncateMiddle));
    pane.SetTextFace(static_cast<short>(Number(item, "Face")));
    pane.DisplayIconOnly(Number(item, "IconOnly") != 0);
    if (Number(item, "FitToItem") != 0)
        pane.ResizeToCurSel();
}

GlogPane *MakePopUpMenu(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    RequireItemCount(item);
    Rect bounds = OptionalRect(item, "BoundsRect");
    std::unique_ptr<PopMPane> pane(PopMPane::NewPopMPane(
        glog, kNoNumber, static_cast<short>(Number(item, "Flags")), &bounds, MenuOf(item)));
    if (pane)
        SetUp(*pane, sheet);
    return pane.release();
}

GlogPane *MakePopUpMenuFromRecord(glogRec *glog, RecordBytes &bytes) {
    popMMResRec record;
    record.kind = bytes.Short();
    record.flags = bytes.Short();
    record.bounds = bytes.ReadRect();
    LoadError::Place const place = bytes.Place();
    record.menuID = bytes.Short();
    if (!OSMenuHandle::IsSingletonMenu(record.menuID))
        throw LoadError(place, "there is no menu of the id " + std::to_string(record.menuID));
    return PopMPane::NewResPopMPane(glog, &record);
}

GlogPane *MakeScrollBarPopUpMenu(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    RequireItemCount(item);
    std::unique_ptr<ScrollBarPopupMenuPane> pane(new (std::nothrow)
                                                     ScrollBarPopupMenuPane(glog, MenuOf(item)));
    if (!pane || !pane->GetGlog())
        return nullptr;
    Rect bounds = OptionalRect(item, "BoundsRect");
    pane->SetBox(&bounds);
    if (bounds.right > bounds.left)
        pane->GetLayoutRect()->SetAttribute(GlogLayoutItem::kWidth, bounds.right - bounds.left,
                                            GlogLayoutItem::kPixels, UString());
    SetUp(*pane, sheet);
    return pane.release();
}

// Durations

KeyList DurationKeys() {
    return KeyList()
        .Integer("numerator", 1, kLargest)
        .Required()
        .Integer("denominator", 1, kLargest)
        .Required();
}

DurationValue DurationIn(Container const &item) {
    return DurationValue(Number(item, "numerator"), Number(item, "denominator"));
}

GlogPane *MakeDurationNote(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    std::unique_ptr<DurationNotePane> pane(new (std::nothrow) DurationNotePane(glog));
    if (!pane || !pane->GetGlog())
        return nullptr;
    Rect bounds = OptionalRect(item, "BoundsRect");
    pane->SetBox(&bounds);
    if (Container const duration = item->GetContainerItem(ResourceKey(kDurationKey)))
        pane->SetDurationValue(DurationIn(duration));
    std::vector<DurationValue> durations;
    ForEachItem(item->GetContainerItem(ResourceKey(kDurationsKey)),
                [&](Container const &duration) { durations.push_back(DurationIn(duration)); });
    pane->SetMenuDurations(durations);
    if (Has(item, "Enabled"))
        pane->SetEnable(Number(item, "Enabled") != 0);
    return pane.release();
}

KeyList MenuKeys() {
    return KeyList()
        .Rect("BoundsRect")
        .Integer("MenuID")
        .Container(kItemsKey, KeyList().Container(kItemKey, ItemKeys(kDeepest)).Repeated())
        .Integer("Selected", 0, kLargest)
        .Flag("Enabled")
        .Integer("Pulldown", 0, kLastPulldown)
        .Word("Truncate", {"None", "End", "Middle"})
        .Integer("Face", 0, kLargestFace)
        .Flag("IconOnly")
        .Flag("FitToItem");
}

} // namespace

void AddMenuItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeMenu);
    TreeDump::AddDescriber(DescribeDuration);
    registry.Add(ItemType("PopUpMenu")
                     .Keys(KeyList().Integer("Flags", 0, kLargestFlags).All(MenuKeys()))
                     .MadeBy(MakePopUpMenu)
                     .FromRecord(popMMResRec::kKind, ItemType::kWholeKind, MakePopUpMenuFromRecord)
                     .ReportedBy(ReportMenu)
                     .LayoutType(popMMResRec::kKind));
    registry.Add(ItemType("ScrollBarPopUpMenu")
                     .Keys(MenuKeys())
                     .MadeBy(MakeScrollBarPopUpMenu)
                     .ReportedBy(ReportMenu)
                     .LayoutType(popMMResRec::kKind));
    registry.Add(
        ItemType("DurationNote")
            .Keys(KeyList()
                      .Rect("BoundsRect")
                      .Attributes(kDurationKey, DurationKeys())
                      .Container(kDurationsKey, KeyList().Attributes(kDurationKey, DurationKeys()).Repeated())
                      .Flag("Enabled"))
            .MadeBy(MakeDurationNote)
            .ReportedBy(ReportDuration));
}
