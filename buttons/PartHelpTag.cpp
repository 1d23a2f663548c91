#include "buttons/PartHelpTag.h"
#include "host/GlogPane.h"
#include "host/HelpTagHelper.h"

namespace {

double const kDelay = 0.5; // seconds

} // namespace

MultiHelpTagHelper *PartHelpTags(GlogPane &pane) {
    HelpTagHelper *const helper = pane.GetHelpTagHelper();
    if (!helper || helper->IsDefaultHelper())
        pane.SetHelpTagHelper(AutoPtr<HelpTagHelper>(new MultiHelpTagHelper));
    return dynamic_cast<MultiHelpTagHelper *>(pane.GetHelpTagHelper());
}

void AttachPartHelpTag(GlogPane &pane, LocalizedStrings::HelpTag const *tag, Rect const &rect) {
    if (MultiHelpTagHelper *const parts = PartHelpTags(pane))
        parts->AddHelpTag(tag, rect, OS::Help::kPlacementForParts, kDelay);
}
