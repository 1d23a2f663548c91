#include "dialogs/DialogReader.h"
#include "desktop/resources/XmlFile.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/ItemTreeReader.h"
#include "dialogs/NearestName.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/LocalizedStrings.h"

namespace {

long long const kLargestSide = 16000; // pixels
long long const kLargestID = 32767;
std::size_t const kMostItems = 32767; // of one glog or container

char const kItems[] = "Items";
char const kItem[] = "Item";
char const kStyleSheet[] = "StyleSheet";

KeyList const &GlogAttributes() {
    static KeyList const list = KeyList()
                                    .String("title")
                                    .Integer("titleList")
                                    .Integer("titleIndex")
                                    .Integer("width", 1, kLargestSide)
                                    .Required()
                                    .Integer("height", 1, kLargestSide)
                                    .Required()
                                    .Word("growable", {"yes", "no"})
                                    .Word("popup", {"yes", "no"})
                                    .Integer("minWidth", 0, kLargestSide)
                                    .Integer("minHeight", 0, kLargestSide)
                                    .Integer("maxWidth", 0, kLargestSide)
                                    .Integer("maxHeight", 0, kLargestSide);
    return list;
}

KeyList const &ItemAttributes() {
    static KeyList const list = KeyList().String("type").Required().Integer("id", 1, kLargestID);
    return list;
}

// What the panes of a glog ask its own sheet for.
KeyList const &StyleSheetKeys() {
    static KeyList const list = KeyList()
                                    .Integer("GCheckGroup_LineSpacing")
                                    .Integer("GStyledString_LineSpacing")
                                    .Integer("GStyledString_TopBorder")
                                    .Integer("BaselineOffset")
                                    .Container("Layout", CommonKeys::LayoutList());
    return list;
}

KeyList const &GlogKeys() {
    static KeyList const list = KeyList().Container(kStyleSheet, KeyList()).Container(kItems, KeyList());
    return list;
}

XmlNode const *Child(XmlNode const &node, char const *name) {
    for (XmlNode const &child : node.children) {
        if (child.name == name)
            return &child;
    }
    return nullptr;
}

std::string Described(std::string const &type, std::string const *id) {
    return "item " + (id ? *id + ' ' : std::string()) + '(' + type + ')';
}

LoadError FromXmlError(XmlError const &error) {
    LoadError::Place place;
    place.file = error.File();
    place.line = error.Line();
    place.column = error.Column();
    return LoadError(place, error.Message());
}

} // namespace

Dialog DialogReader::ReadFile(std::string const &path) {
    try {
        return DialogReader(path).Read(XmlFile::Read(path).Root());
    } catch (XmlError const &error) {
        throw FromXmlError(error);
    }
}

Dialog DialogReader::ReadText(std::string_view xml, std::string const &name) {
    try {
        return DialogReader(name).Read(XmlFile::Parse(xml, name).Root());
    } catch (XmlError const &error) {
        throw FromXmlError(error);
    }
}

Dialog DialogReader::Read(XmlNode const &root) {
    ItemTreeReader const reader(file, "");
    if (root.name != "Glog")
        throw reader.ErrorAt(root, "the root element is <" + root.name + ">, not <Glog>");
    reader.RequireNoText(root);
    for (XmlNode const &child : root.children) {
        if (!GlogKeys().Find(child.name))
            throw reader.ErrorAt(child, "there is no <" + child.name + "> in <Glog>" +
                                            NearestName::Hint(child.name, GlogKeys().Names()));
        if (Child(root, child.name.c_str()) != &child)
            throw reader.ErrorAt(child, "<" + child.name + "> stands here for the second time");
    }
    Dialog dialog;
    dialog.file = file;
    ReadGlogAttributes(root, dialog);
    if (XmlNode const *sheet = Child(root, kStyleSheet))
        dialog.options.StyleSheet(ReadStyleSheet(*sheet));
    XmlNode const *const items = Child(root, kItems);
    if (!items)
        throw reader.ErrorAt(root, "<Items> is missing");
    dialog.items = ReadItems(*items);
    return dialog;
}

void DialogReader::ReadGlogAttributes(XmlNode const &root, Dialog &dialog) const {
    ItemTreeReader const reader(file, "");
    ItemTreeReader::Container const attributes = reader.ReadAttributes(root, GlogAttributes());
    auto const number = [&](char const *name) {
        return static_cast<int>(attributes->GetSIntItemValue(ResourceKey(name)));
    };
    dialog.options.Title(Title(root))
        .Size(number("width"), number("height"))
        .Growable(attributes->GetUStringItemValue(ResourceKey("growable")) == ResourceKey("yes"))
        .Popup(attributes->GetUStringItemValue(ResourceKey("popup")) == ResourceKey("yes"));
    dialog.minWidth = number("minWidth");
    dialog.minHeight = number("minHeight");
    dialog.maxWidth = number("maxWidth");
    dialog.maxHeight = number("maxHeight");
    if ((dialog.maxWidth && dialog.maxWidth < dialog.minWidth) ||
        (dialog.maxHeight && dialog.maxHeight < dialog.minHeight))
        throw reader.ErrorAt(root, "the largest size is smaller than the smallest");
}

std::string DialogReader::Title(XmlNode const &root) const {
    ItemTreeReader const reader(file, "");
    std::string const *const title = root.Attribute("title");
    std::string const *const list = root.Attribute("titleList");
    std::string const *const index = root.Attribute("titleIndex");
    if (!list && !index)
        return title ? *title : std::string();
    if (!list || !index || title)
        throw reader.ErrorAt(root, "a title is either the attribute title, or titleList with titleIndex");
    UString const text = LocalizedStrings::GetString(static_cast<short>(std::stoi(*list)),
                                                     static_cast<short>(std::stoi(*index)));
    if (text.empty())
        throw reader.ErrorAt(root, "the string list " + *list + " has no string " + *index);
    return Utf8::FromUString(text);
}

std::shared_ptr<GlogStyleSheet> DialogReader::ReadStyleSheet(XmlNode const &node) const {
    ItemTreeReader const reader(file, "");
    reader.ReadAttributes(node, KeyList());
    return std::make_shared<GlogStyleSheet>(reader.ReadKeys(node, StyleSheetKeys()));
}

std::vector<DialogItem> DialogReader::ReadItems(XmlNode const &node) {
    ItemTreeReader const reader(file, "");
    reader.ReadAttributes(node, KeyList());
    reader.RequireNoText(node);
    if (node.children.size() > kMostItems)
        throw reader.ErrorAt(node, "more than " + std::to_string(kMostItems) + " items");
    std::vector<DialogItem> items;
    for (XmlNode const &child : node.children) {
        if (child.name != kItem)
            throw reader.ErrorAt(child, "expected <Item> in <Items>, found <" + child.name + ">");
        items.push_back(ReadItem(child));
    }
    return items;
}

DialogItem DialogReader::ReadItem(XmlNode const &node) {
    std::string const *const typeName = node.Attribute("type");
    ItemTreeReader const reader(file, Described(typeName ? *typeName : "?", node.Attribute("id")));
    reader.ReadAttributes(node, ItemAttributes());
    DialogItem item;
    item.place = reader.PlaceOf(node);
    item.type = ItemRegistry::Instance().Find(*typeName);
    if (!item.type)
        throw reader.ErrorAt(node, "there is no item type \"" + *typeName + '"' +
                                       NearestName::Hint(*typeName, ItemRegistry::Instance().Names()));
    item.id = ReadID(node, reader);
    KeyList keys = item.type->keys;
    keys.All(CommonKeys::List());
    item.keys = reader.ReadKeys(node, keys, item.type->holdsItems ? kItems : "");
    item.keyPlaces = reader.PlacesOfKeys(node);
    if (item.type->holdsItems) {
        if (XmlNode const *inner = Child(node, kItems))
            item.items = ReadItems(*inner);
    }
    return item;
}

int DialogReader::ReadID(XmlNode const &node, ItemTreeReader const &reader) {
    std::string const *const text = node.Attribute("id");
    if (!text)
        return 0;
    int const id = std::stoi(*text); // was checked with the attributes
    auto const [former, isNew] = linesOfIDs.emplace(id, node.line);
    if (!isNew)
        throw reader.ErrorAt(node, "the item in line " + std::to_string(former->second) + " has this id too");
    return id;
}
