// The localised string lists.
#pragma once
#include "desktop/resources/XmlFile.h"
#include "host/UString.h"
#include <cstdint>
#include <unordered_map>

// From strings/*.xml: <strings><list number="4323"><string index="1">OK</string>...</list>...</strings>.
class StringLists {
public:
    void Read(XmlFile const &);                         // throws XmlError
    UString const *Find(short list, short index) const; // null when absent

private:
    static std::uint32_t Key(short list, short index);
    void ReadList(XmlFile const &, XmlNode const &);
    std::unordered_map<std::uint32_t, UString> strings;
};
