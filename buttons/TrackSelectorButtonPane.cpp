#include "buttons/TrackSelectorButtonPane.h"
#include "host/LocalizedStrings.h"

namespace {

short const kFamily = 1000;
short const kFirstIcon = 61;
short const kStates = 2, kDownStates = 1, kDisabledStates = 1;
int const kWidth = 15, kHeight = 16;      // pixels
char const kHelpTag[] = "kTrackSelector"; // group and key

} // namespace

TrackSelectorButtonPane::TrackSelectorButtonPane(glogRec *owner) {
    if (!GIconButtonPaneInit(owner, 0, kFamily, kFirstIcon, kStates, kDownStates, kDisabledStates))
        return;
    SetCanDisable(false);
    // The family's icons are of many sizes.
    RCPtr<GlogLayoutRectItem> const item = GetLayoutRect();
    item->SetAttribute(GlogLayoutItem::kHeight, kHeight, GlogLayoutItem::kPixels, UString());
    item->SetAttribute(GlogLayoutItem::kWidth, kWidth, GlogLayoutItem::kPixels, UString());
    SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag(kHelpTag, kHelpTag));
}

int TrackSelectorButtonPane::ReleaseAction() {
    if (Provider<TrackSelectorButtonPane_Listener>::HasDependents()) {
        Message0<TrackSelectorButtonPane_Listener> const released(
            &TrackSelectorButtonPane_Listener::TrackSelectorButtonReleased);
        Provider<TrackSelectorButtonPane_Listener>::BroadcastChange(released, nullptr);
    }
    return -1;
}
