// A musical duration as notes.
//
// A click opens a menu of durations at the mouse; the pane takes the one that is chosen. Clicks give -1: who
// wants to know listens.
#pragma once
#include "frame/DurationNotePane_Listener.h"
#include "host/DurationValue.h"
#include "host/GlogPane.h"
#include <vector>

// The order of bases is fixed.
class DurationNotePane : public Provider<DurationNotePane_Listener>, public GlogPane {
public:
    // Attaches the pane under the number 0 and gives it no box. It shows nothing before it has a duration.
    explicit DurationNotePane(glogRec *);
    ~DurationNotePane() override;

    DurationValue GetDurationValue() const { return duration; } // what is shown; at first no duration
    // Stores the duration, tells the listeners, then repaints; nothing for the one that is shown.
    void SetDurationValue(DurationValue const &);
    void SetEnable(bool on) { enabled = on; } // whether clicks count; only stores
    // What the menu offers; without any, the menu's own choice.
    void SetMenuDurations(std::vector<DurationValue> const &values) { menuDurations = values; }

protected:
    // Overridden operations of panes.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    bool enabled;
    DurationValue duration;
    std::vector<DurationValue> menuDurations;
};
