#include "menus/DurationNotePane.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <limits>

namespace {

short const kNoNumber = 0;
int const kHandled = -1;
short const kGlyphFamily = 1821;
short const kGlyphAdvance = 8; // pixels
short const kSingleIndent = 4; // pixels

} // namespace

DurationNotePane::DurationNotePane(glogRec *owner)
    : enabled(true) {
    GlogPaneInit(owner, kNoNumber);
}

DurationNotePane::~DurationNotePane() {}

void DurationNotePane::SetDurationValue(DurationValue const &value) {
    if (value.first == duration.first && value.second == duration.second)
        return;
    duration = value;
    PaneWatch const watch(this);
    if (Provider<DurationNotePane_Listener>::HasDependents()) {
        DurationNotePane *const self = this;
        Message1<DurationNotePane_Listener, DurationNotePane *, DurationNotePane *> message(
            &DurationNotePane_Listener::DurationValueChanged, &self);
        Provider<DurationNotePane_Listener>::BroadcastChange(message, nullptr);
    }
    if (watch.PaneExists())
        Inval();
}

int DurationNotePane::HandleClick(EventRecordAdapter *event) {
    if (!enabled)
        return kHandled;
    Prepare();
    // A copy: whatever runs while the menu is open may delete the pane.
    std::vector<DurationValue> const entries = menuDurations;
    std::size_t const most = static_cast<std::size_t>(std::numeric_limits<short>::max());
    PaneWatch const watch(this);
    DurationValue const chosen = RunDurationMenu(
        event->where, duration, static_cast<short>(std::min(entries.size(), most)), entries.data());
    if (watch.PaneExists())
        SetDurationValue(chosen);
    return kHandled;
}

void DurationNotePane::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    std::vector<unsigned int> glyphs;
    DurationValueToVela12IconIDs(duration, glyphs);
    if (glyphs.size() == 1)
        box.left = static_cast<short>(box.left + kSingleIndent);
    Rect place = GetIconBounds(kGlyphFamily);
    VelaDrawing::OffsetRect(&place, box.left, box.top);
    for (unsigned int glyph : glyphs) {
        Draw1Icon(kGlyphFamily, static_cast<short>(glyph), place);
        VelaDrawing::OffsetRect(&place, kGlyphAdvance, 0);
    }
}
