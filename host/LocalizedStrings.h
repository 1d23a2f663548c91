// Strings and help tags in the user's language.
#pragma once
#include "host/UString.h"

namespace OS {
namespace Help {

// On which side of its rectangle a help tag appears. 3: below it, or above where there is no room below.
enum Placement { kPlacementForParts = 3 };

} // namespace Help
} // namespace OS

namespace LocalizedStrings {

// A string of a list, by resource number and index, in the user's language, else in English. Empty when there
// is none.
UString GetString(short list, short index);

// A text that appears as a tooltip; only the host looks inside.
class HelpTag;

class HelpTagMgr { // finds help tags in the user's language
public:
    static HelpTagMgr &Instance(); // one for the process

    // The tag under group and key, which are ASCII. Never the caller's; valid for the life of the process.
    // Null when there is none.
    HelpTag const *DemandHelpTag(char const *group, char const *key);
};

} // namespace LocalizedStrings
