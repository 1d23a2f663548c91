#pragma once
#include "host/UString.h"

namespace OS { namespace Help {

enum Placement { kPlacementForParts = 3 };
} }

namespace LocalizedStrings {

UString GetString(short list, short index);

class HelpTag;

class HelpTagMgr {
public:
    static HelpTagMgr &Instance();

    HelpTag const *DemandHelpTag(char const *group, char const *key);
};

}
