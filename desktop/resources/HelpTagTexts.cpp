#include "desktop/resources/HelpTagTexts.h"
#include "desktop/resources/Utf.h"

void HelpTagTexts::Read(XmlFile const &file) {
    file.RequireRoot("helptags");
    for (XmlNode const &node : file.Root().children) {
        if (node.name != "group")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <group> is");
        ReadGroup(file, node);
    }
}

void HelpTagTexts::ReadGroup(XmlFile const &file, XmlNode const &groupNode) {
    std::string const &group = file.RequireText(groupNode, "name");
    for (XmlNode const &node : groupNode.children) {
        if (node.name != "tag")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <tag> is");
        std::string const *title = node.Attribute("title");
        texts[GroupAndKey(group, file.RequireText(node, "key"))] = {title ? Utf::FromUtf8(*title) : UString(),
                                                                    Utf::FromUtf8(node.text)};
    }
}

HelpTagText const *HelpTagTexts::Find(GroupAndKey const &groupAndKey) const {
    auto const found = texts.find(groupAndKey);
    return found == texts.end() ? nullptr : &found->second;
}
