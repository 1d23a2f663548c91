// A list of many sounds that a search field narrows, with its bar.
//
// Matches are marked in the names. The arrow keys of the field choose a row, as a click does.
#pragma once
#include "frame/GListPane_SelectionListener.h"
#include "frame/SearchFieldPane_Listener.h"
#include "host/CompoundPane.h"
#include "lists/ListLineDrawer.h"
#include "tools/gallery/SoundNames.h"

class GListPane;
class GlogStyleSheet;
class ScrollBarPane;

class SoundListPane : public CompoundPane,
                      public SearchFieldPane_Listener,
                      public GListPane_SelectionListener,
                      public ListLineDrawer {
public:
    // Makes a list and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect" and, in the same container at any depth, "CmdID", the number of the
    // search field, "TextID" of the label that tells how many sounds are found, and "CmdClassID" of the one
    // that names what is chosen. The list itself has the item number 995, its bar 996.
    static SoundListPane *NewSoundListPane(glogRec *, GlogStyleSheet *);

    // Overridden operations of panes, listeners and drawers. The parts follow the box.
    void SetBox(Rect *) override;
    void GlogItemInit() override;
    void TextChanged(UString const &) override;
    void SearchIsCanceled() override;
    void HandleSpecialKey(EventRecordAdapter *) override;
    void SelectionDone(GListPane *) override;
    void ClickOccured(GListPane *, int, int, bool) override {}
    void DrawLine(int line, Rect *rowBox, bool hilite) override;

protected:
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    explicit SoundListPane(GlogStyleSheet *);
    bool AddParts();
    void Narrow(UString const &);
    void Choose(int row);
    void TellFound();
    void TellChosen();

    int fieldID, foundID, chosenID;
    SoundNames sounds;
    UString search;            // what the field says
    GListPane *list = nullptr; // subpanes
    ScrollBarPane *bar = nullptr;
};
