#include "dialogs/KeyList.h"
#include "desktop/resources/ItemKeys.h"
#include <boost/assert.hpp>

KeySchema &KeyList::Add(std::string const &name) {
    BOOST_ASSERT(!Find(name));
    keys.emplace_back();
    keys.back().name = name;
    keys.back().itemKey = name;
    return keys.back();
}

KeyList &KeyList::Integer(std::string const &name, long long smallest, long long largest) {
    KeySchema &key = Add(name);
    key.kind = KeySchema::kInteger;
    key.smallest = smallest;
    key.largest = largest;
    return *this;
}

KeyList &KeyList::Flag(std::string const &name) { return Integer(name, 0, 1); }

KeyList &KeyList::String(std::string const &name) {
    Add(name).kind = KeySchema::kString;
    return *this;
}

KeyList &KeyList::Word(std::string const &name, std::initializer_list<char const *> words) {
    KeySchema &key = Add(name);
    key.kind = KeySchema::kWord;
    key.words.assign(words.begin(), words.end());
    return *this;
}

KeyList &KeyList::Attributes(std::string const &name, KeyList const &attributes) {
    KeySchema &key = Add(name);
    key.kind = KeySchema::kAttributes;
    key.keys = attributes;
    return *this;
}

KeyList &KeyList::Rect(std::string const &name) {
    Attributes(name, KeyList()
                         .Integer("top")
                         .Required()
                         .As(XMLLib::kRectTopKey)
                         .Integer("left")
                         .Required()
                         .As(XMLLib::kRectLeftKey)
                         .Integer("bottom")
                         .Required()
                         .As(XMLLib::kRectBottomKey)
                         .Integer("right")
                         .Required()
                         .As(XMLLib::kRectRightKey));
    keys.back().kind = KeySchema::kRect;
    return *this;
}

KeyList &KeyList::Point(std::string const &name) {
    Attributes(name, KeyList()
                         .Integer("v")
                         .Required()
                         .As(XMLLib::kPointVKey)
                         .Integer("h")
                         .Required()
                         .As(XMLLib::kPointHKey));
    keys.back().kind = KeySchema::kPoint;
    return *this;
}

KeyList &KeyList::Container(std::string const &name, KeyList const &inner) {
    KeySchema &key = Add(name);
    key.kind = KeySchema::kContainer;
    key.keys = inner;
    return *this;
}

KeyList &KeyList::Anything(std::string const &name) {
    Add(name).kind = KeySchema::kAnything;
    return *this;
}

KeyList &KeyList::All(KeyList const &other) {
    for (KeySchema const &key : other.keys)
        Add(key.name) = key;
    return *this;
}

KeyList &KeyList::Required() {
    keys.back().required = true;
    return *this;
}

KeyList &KeyList::Repeated() {
    keys.back().repeated = true;
    return *this;
}

KeyList &KeyList::AnyCorners() {
    keys.back().anyCorners = true;
    return *this;
}

KeyList &KeyList::As(std::string const &itemKey) {
    keys.back().itemKey = itemKey;
    return *this;
}

KeySchema const *KeyList::Find(std::string const &name) const {
    for (KeySchema const &key : keys) {
        if (key.name == name)
            return &key;
    }
    return nullptr;
}

std::vector<std::string> KeyList::Names() const {
    std::vector<std::string> names;
    for (KeySchema const &key : keys)
        names.push_back(key.name);
    return names;
}
