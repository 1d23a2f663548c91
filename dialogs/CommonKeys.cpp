#include "dialogs/CommonKeys.h"
#include "dialogs/ItemType.h"
#include "dialogs/KeyFault.h"
#include "dialogs/TextHelpTagHelper.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogPane.h"
#include "host/GlogStyleSheet.h"

namespace {

long long const kLargestInset = 1000; // pixels
long long const kLargestSide = 16000; // pixels
long long const kMostShares = 1000;
long long const kLastAlignment = 3;

KeyList MakeLayoutList() {
    return KeyList()
        .Integer("InsetTop", 0, kLargestInset)
        .Integer("InsetLeft", 0, kLargestInset)
        .Integer("InsetBottom", 0, kLargestInset)
        .Integer("InsetRight", 0, kLargestInset)
        .Integer("Width", 0, kLargestSide)
        .Integer("Height", 0, kLargestSide)
        .Integer("GrowWidth", 0, kMostShares)
        .Integer("GrowHeight", 0, kMostShares)
        .Integer("Alignment", 0, kLastAlignment)
        .Integer("MinWidth", 0, kLargestSide)
        .Integer("MinHeight", 0, kLargestSide);
}

KeyList MakeList() {
    return KeyList()
        .Container("Layout", CommonKeys::LayoutList())
        .Attributes("HelpTag", KeyList().String("group").Required().String("key").Required())
        .String("HelpTagText")
        .Flag("Visible");
}

void SetHelpTag(GlogPane *pane, boost::shared_ptr<XMLLib::ContainerItem> const &named) {
    std::string const group = Utf8::FromUString(named->GetUStringItemValue(ResourceKey("group")));
    std::string const key = Utf8::FromUString(named->GetUStringItemValue(ResourceKey("key")));
    LocalizedStrings::HelpTag const *const tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag(group.c_str(), key.c_str());
    if (!tag)
        throw KeyFault("HelpTag", "there is no help tag \"" + key + "\" in the group \"" + group + "\"");
    pane->SetHelpTag(tag);
}

} // namespace

KeyList const &CommonKeys::LayoutList() {
    static KeyList const list = MakeLayoutList();
    return list;
}

KeyList const &CommonKeys::List() {
    static KeyList const list = MakeList();
    return list;
}

void CommonKeys::Apply(GlogPane *pane, ItemType const &type, GlogStyleSheet *sheet) {
    pane->GetLayoutRect()->ReadLayoutProperties(type.layoutType, sheet);
    UString const text = sheet->GetUStringItemValue(ResourceKey("HelpTagText"));
    if (!text.empty())
        pane->SetHelpTagHelper(AutoPtr<HelpTagHelper>(new TextHelpTagHelper(text)));
    if (boost::shared_ptr<XMLLib::ContainerItem> const named =
            sheet->GetContainerItem(ResourceKey("HelpTag")))
        SetHelpTag(pane, named);
    if (sheet->HasSInt32ItemValue(ResourceKey("Visible")))
        pane->SetVisibility(sheet->GetSInt32ItemValue(ResourceKey("Visible")) != 0);
}
