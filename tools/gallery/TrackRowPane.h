// A row of the gallery's list of tracks: a check box with the track's name, how many clips it has, and these.
//
// The check box works by itself. A click anywhere on the row, on the check box too, is told to the listener.
#pragma once
#include "host/CompoundPane.h"
#include "host/UString.h"
#include <functional>

class LabelPane;

class TrackRowPane : public CompoundPane {
public:
    static short const kHeight = 24; // pixels
    static short WidthOf(int bars);  // pixels of a row of that many bars

    typedef std::function<void(TrackRowPane &)> Listener;
    // Makes a row and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The number, from 1, settles name and clips; the check box has the item number given.
    static TrackRowPane *NewTrackRowPane(glogRec *, int number, int bars, short checkBoxID, Listener);

    UString const &Name() const { return name; }
    // How many bars the row shows. Changes its width, and repaints nothing.
    void SetBars(int);
    // Whether the row stands out. Invalidates it when that changes.
    void SetChosen(bool);

protected:
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    TrackRowPane(int number, Listener);
    bool AddParts(short checkBoxID);
    bool HasClip(int bar) const;
    void DrawClips(OSRgn *updateRegion, Rect const &) const;
    void DrawEdges(Rect const &) const;

    UString name;
    Listener listener;
    LabelPane *count = nullptr; // of the clips
    int number;
    int bars = 0;
    bool chosen = false;
};
