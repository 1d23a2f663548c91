#include "desktop/resources/StringLists.h"
#include "desktop/resources/Utf.h"
#include <limits>

namespace {

short ShortAttribute(XmlFile const &file, XmlNode const &node, char const *attribute) {
    typedef std::numeric_limits<short> Limits;
    return static_cast<short>(file.RequireInteger(node, attribute, Limits::min(), Limits::max()));
}

} // namespace

void StringLists::Read(XmlFile const &file) {
    file.RequireRoot("strings");
    for (XmlNode const &node : file.Root().children) {
        if (node.name != "list")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <list> is");
        ReadList(file, node);
    }
}

void StringLists::ReadList(XmlFile const &file, XmlNode const &listNode) {
    short const list = ShortAttribute(file, listNode, "number");
    for (XmlNode const &node : listNode.children) {
        if (node.name != "string")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <string> is");
        strings[Key(list, ShortAttribute(file, node, "index"))] = Utf::FromUtf8(node.text);
    }
}

UString const *StringLists::Find(short list, short index) const {
    auto const found = strings.find(Key(list, index));
    return found == strings.end() ? nullptr : &found->second;
}

std::uint32_t StringLists::Key(short list, short index) {
    return std::uint32_t(static_cast<std::uint16_t>(list)) << 16 | static_cast<std::uint16_t>(index);
}
