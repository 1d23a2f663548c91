#include "dialogs/TextHelpTagHelper.h"
#include "desktop/resources/HelpTag.h"

TextHelpTagHelper::TextHelpTagHelper(UString const &text)
    : tag(new LocalizedStrings::HelpTag(UString(), text)) {}

TextHelpTagHelper::~TextHelpTagHelper() {}

bool TextHelpTagHelper::GetHelpTag(Point, LocalizedStrings::HelpTag const *&found, Rect &,
                                   OS::Help::Placement &, double &) {
    found = tag.get();
    return true;
}
