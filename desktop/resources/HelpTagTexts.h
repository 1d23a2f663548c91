// The texts of all help tags in the present language.
#pragma once
#include "desktop/resources/XmlFile.h"
#include "host/UString.h"
#include <map>
#include <string>
#include <utility>

struct HelpTagText {
    UString title, text;
};

// From helptags/*.xml: <helptags><group name="..."><tag key="..."
// title="...">text</tag>...</group>...</helptags>; no tag needs a title.
class HelpTagTexts {
public:
    typedef std::pair<std::string, std::string> GroupAndKey;

    void Read(XmlFile const &);                         // throws XmlError
    HelpTagText const *Find(GroupAndKey const &) const; // null when absent

private:
    void ReadGroup(XmlFile const &, XmlNode const &);
    std::map<GroupAndKey, HelpTagText> texts;
};
