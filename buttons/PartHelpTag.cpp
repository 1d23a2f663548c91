#include "buttons/PartHelpTag.h"
#include "host/GlogPane.h"
#include "host/HelpTagHelper.h"

namespace {

double const kDelay = 0.5; // seconds

} // namespace

void AttachPartHelpTag(GlogPane &pane, LocalizedStrings::HelpTag const *tag, Rect const &rect) {
    HelpTagHelper *helper = pane.GetHelpTagHelper();
    if (!helper || helper->IsDefaultHelper()) {
        pane.SetHelpTagHelper(AutoPtr<HelpTagHelper>(new MultiHelpTagHelper));
        helper = pane.GetHelpTagHelper();
    }
    // A helper of the program's own, for the whole pane or not, is left in charge.
    if (MultiHelpTagHelper *const parts = dynamic_cast<MultiHelpTagHelper *>(helper))
        parts->AddHelpTag(tag, rect, OS::Help::kPlacementForParts, kDelay);
}
