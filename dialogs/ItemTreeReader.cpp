#include "dialogs/ItemTreeReader.h"
#include "desktop/resources/ItemKeys.h"
#include "dialogs/NearestName.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/LocalizedStrings.h"
#include <algorithm>
#include <cstdlib>
#include <initializer_list>
#include <limits>
#include <set>

namespace {

std::size_t const kLongestExcerpt = 40; // bytes
char const kTypeAttribute[] = "type";
char const kListAttribute[] = "list";
char const kIndexAttribute[] = "index";

// What was found, short enough for a message and cut between characters.
std::string Quoted(std::string const &text) {
    if (text.empty())
        return "nothing";
    if (text.size() <= kLongestExcerpt)
        return '"' + text + '"';
    std::size_t end = kLongestExcerpt;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
        --end;
    return '"' + text.substr(0, end) + "...\"";
}

std::string Listed(std::vector<std::string> const &words) {
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i)
        text += (i == 0 ? "" : i + 1 == words.size() ? " or " : ", ") + words[i];
    return text;
}

std::string Range(KeySchema const &key) {
    return "from " + std::to_string(key.smallest) + " to " + std::to_string(key.largest);
}

// How the element of the key begins.
std::string WayToWrite(KeySchema const &key) {
    std::string text = '<' + key.name;
    if (key.kind != KeySchema::kContainer) {
        for (KeySchema const &attribute : key.keys.Keys())
            text += ' ' + attribute.name + "=\"\"";
    }
    return text + '>';
}

bool HasAttributes(XmlNode const &node, std::initializer_list<char const *> names) {
    return node.attributes.size() == names.size() &&
           std::all_of(names.begin(), names.end(), [&](char const *name) { return node.Attribute(name); });
}

KeyList const &AnyRect() {
    static KeyList const list = KeyList().Rect("Any");
    return list;
}

KeyList const &AnyPoint() {
    static KeyList const list = KeyList().Point("Any");
    return list;
}

} // namespace

ItemTreeReader::ItemTreeReader(std::string const &file_, std::string const &item_)
    : file(file_)
    , item(item_) {}

ItemTreeReader ItemTreeReader::Inside(std::string const &key) const {
    ItemTreeReader inner(file, item);
    inner.path = path.empty() ? key : path + '/' + key;
    return inner;
}

LoadError::Place ItemTreeReader::PlaceOf(XmlNode const &node) const {
    LoadError::Place place;
    place.file = file;
    place.line = node.line;
    place.column = node.column;
    place.item = item;
    place.key = path;
    return place;
}

LoadError ItemTreeReader::ErrorAt(XmlNode const &node, std::string const &message) const {
    return LoadError(PlaceOf(node), message);
}

void ItemTreeReader::RequireNoText(XmlNode const &node) const {
    if (!node.text.empty())
        throw ErrorAt(node, "<" + node.name + "> may hold no text, found " + Quoted(node.text));
}

// Attributes

ItemTreeReader::Container ItemTreeReader::ReadAttributes(XmlNode const &node, KeyList const &keys) const {
    Container const container = XMLLib::CreateContainer(Utf8::ToUString(node.name));
    for (XmlAttribute const &attribute : node.attributes) {
        KeySchema const *const key = keys.Find(attribute.name);
        if (!key)
            throw ErrorAt(node, "<" + node.name + "> takes no attribute \"" + attribute.name + '"' +
                                    NearestName::Hint(attribute.name, keys.Names()));
        try {
            AddValue(*container, node, *key, attribute.value);
        } catch (LoadError const &error) {
            throw ErrorAt(node, "attribute " + attribute.name + ": " + error.Message());
        }
    }
    for (KeySchema const &key : keys.Keys()) {
        if (key.required && !node.Attribute(key.name))
            throw ErrorAt(node, "<" + node.name + "> lacks the attribute \"" + key.name + '"');
    }
    return container;
}

void ItemTreeReader::AddAttributes(XMLLib::ContainerItem &container, XmlNode const &node,
                                   KeySchema const &key) const {
    if (!node.children.empty())
        throw ErrorAt(node, "expected nothing but the attributes " + Listed(key.keys.Names()) + ", found <" +
                                node.children.front().name + ">");
    RequireNoText(node);
    Container const inner = ReadAttributes(node, key.keys);
    if (key.kind == KeySchema::kRect)
        CheckRect(node, key, *inner);
    container.AddItem(Utf8::ToUString(key.itemKey), inner);
}

void ItemTreeReader::CheckRect(XmlNode const &node, KeySchema const &key,
                               XMLLib::ContainerItem const &rect) const {
    auto const edge = [&](char const *name) { return rect.GetSIntItemValue(ResourceKey(name)); };
    long long const height = edge(XMLLib::kRectBottomKey) - edge(XMLLib::kRectTopKey);
    long long const width = edge(XMLLib::kRectRightKey) - edge(XMLLib::kRectLeftKey);
    if (height < 0 && !key.anyCorners)
        throw ErrorAt(node, "bottom lies above top");
    if (width < 0 && !key.anyCorners)
        throw ErrorAt(node, "right lies left of left");
    if (std::max(std::abs(width), std::abs(height)) > KeyList::kLargest)
        throw ErrorAt(node, "a side is longer than " + std::to_string(KeyList::kLargest) + " pixels");
}

// Elements

ItemTreeReader::Container ItemTreeReader::ReadKeys(XmlNode const &node, KeyList const &keys,
                                                   std::string const &skipped) const {
    Container const container = XMLLib::CreateContainer(Utf8::ToUString(node.name));
    RequireNoText(node);
    std::set<std::string> seen;
    for (XmlNode const &child : node.children) {
        KeySchema const *const key = keys.Find(child.name);
        bool const isFirst = seen.insert(child.name).second;
        if (!isFirst && !(key && key->repeated))
            throw Inside(child.name).ErrorAt(child, "the key stands here for the second time");
        if (!skipped.empty() && child.name == skipped)
            continue;
        if (!key)
            throw ErrorAt(child, "there is no key <" + child.name + '>' +
                                     NearestName::Hint(child.name, keys.Names()));
        Inside(child.name).AddKey(*container, child, *key);
    }
    for (KeySchema const &key : keys.Keys()) {
        if (key.required && !seen.count(key.name))
            throw ErrorAt(node, WayToWrite(key) + " is missing");
    }
    return container;
}

ItemTreeReader::KeyPlaces ItemTreeReader::PlacesOfKeys(XmlNode const &node) const {
    KeyPlaces places;
    for (XmlNode const &child : node.children)
        places.emplace(child.name, Inside(child.name).PlaceOf(child));
    return places;
}

void ItemTreeReader::AddKey(XMLLib::ContainerItem &container, XmlNode const &node,
                            KeySchema const &key) const {
    switch (key.kind) {
    case KeySchema::kRect:
    case KeySchema::kPoint:
    case KeySchema::kAttributes:
        AddAttributes(container, node, key);
        break;
    case KeySchema::kContainer:
        ReadAttributes(node, KeyList());
        container.AddItem(Utf8::ToUString(key.itemKey), ReadKeys(node, key.keys));
        break;
    case KeySchema::kAnything:
        AddAnything(container, node);
        break;
    case KeySchema::kInteger:
    case KeySchema::kString:
    case KeySchema::kWord:
        RequireKind(node, key);
        AddValue(container, node, key, TextOf(node, key));
        break;
    }
}

// The attribute "type" may say what the key wants anyway, or be wrong.
void ItemTreeReader::RequireKind(XmlNode const &node, KeySchema const &key) const {
    std::string const wanted = key.kind == KeySchema::kInteger ? "integer" : "string";
    if (!node.children.empty())
        throw ErrorAt(node, "expected " +
                                std::string(key.kind == KeySchema::kInteger ? "an integer" : "a string") +
                                ", found the element <" + node.children.front().name + ">");
    std::string const *const type = node.Attribute(kTypeAttribute);
    if (type && *type != wanted)
        throw ErrorAt(node, "this is of type \"" + wanted + "\", not " + Quoted(*type));
}

std::string ItemTreeReader::TextOf(XmlNode const &node, KeySchema const &key) const {
    KeyList allowed;
    allowed.String(kTypeAttribute);
    if (key.kind == KeySchema::kString)
        allowed.Integer(kListAttribute).Integer(kIndexAttribute);
    ReadAttributes(node, allowed);
    return node.Attribute(kListAttribute) || node.Attribute(kIndexAttribute) ? StringOfList(node) : node.text;
}

std::string ItemTreeReader::StringOfList(XmlNode const &node) const {
    RequireNoText(node);
    Container const place = ReadAttributes(node, KeyList()
                                                     .Integer(kListAttribute)
                                                     .Required()
                                                     .Integer(kIndexAttribute)
                                                     .Required()
                                                     .String(kTypeAttribute));
    short const list = static_cast<short>(place->GetSIntItemValue(ResourceKey(kListAttribute)));
    short const index = static_cast<short>(place->GetSIntItemValue(ResourceKey(kIndexAttribute)));
    std::string const text = Utf8::FromUString(LocalizedStrings::GetString(list, index));
    if (text.empty())
        throw ErrorAt(node,
                      "the string list " + std::to_string(list) + " has no string " + std::to_string(index));
    return text;
}

void ItemTreeReader::AddValue(XMLLib::ContainerItem &container, XmlNode const &node, KeySchema const &key,
                              std::string const &text) const {
    UString const itemKey = Utf8::ToUString(key.itemKey);
    long long number = 0;
    if (key.kind == KeySchema::kInteger) {
        if (!XmlFile::ParseInteger(text, number))
            throw ErrorAt(node, "expected an integer, found " + Quoted(text));
        if (number < key.smallest || number > key.largest)
            throw ErrorAt(node, "expected an integer " + Range(key) + ", found " + std::to_string(number));
        container.AddSIntItem(itemKey, number);
        return;
    }
    if (key.kind == KeySchema::kWord &&
        std::find(key.words.begin(), key.words.end(), text) == key.words.end())
        throw ErrorAt(node, "expected " + Listed(key.words) + ", found " + Quoted(text));
    container.AddUStringItem(itemKey, Utf8::ToUString(text));
}

void ItemTreeReader::AddAnything(XMLLib::ContainerItem &container, XmlNode const &node) const {
    KeySchema key;
    key.name = key.itemKey = node.name;
    if (!node.children.empty()) {
        RequireNoText(node);
        ReadAttributes(node, KeyList());
        Container const inner = XMLLib::CreateContainer(Utf8::ToUString(node.name));
        for (XmlNode const &child : node.children)
            Inside(child.name).AddAnything(*inner, child);
        container.AddItem(Utf8::ToUString(node.name), inner);
        return;
    }
    bool const isRect = HasAttributes(node, {"top", "left", "bottom", "right"});
    if (isRect || HasAttributes(node, {"v", "h"})) {
        key.kind = isRect ? KeySchema::kRect : KeySchema::kPoint;
        key.keys = (isRect ? AnyRect() : AnyPoint()).Keys().front().keys;
        AddAttributes(container, node, key);
        return;
    }
    std::string const *const type = node.Attribute(kTypeAttribute);
    if (type && *type != "integer" && *type != "string")
        throw ErrorAt(node, "expected the type \"integer\" or \"string\", found " + Quoted(*type));
    long long number = 0;
    bool const isInteger = type ? *type == "integer" : XmlFile::ParseInteger(node.text, number);
    key.kind = isInteger ? KeySchema::kInteger : KeySchema::kString;
    key.smallest = std::numeric_limits<long long>::min();
    key.largest = std::numeric_limits<long long>::max();
    AddValue(container, node, key, TextOf(node, key));
}
