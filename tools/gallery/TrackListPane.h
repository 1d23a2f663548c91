// The gallery's list of tracks: a thousand rows of live panes in a grid that scrolls along and across, and a
// column of their numbers that follows it.
//
// A click chooses a row, buttons of the same page change the list, and the wheel scrolls it. The bars have
// the item numbers 998, along, and 999, across; the check box in a row has 1000 and the track's.
#pragma once
#include "frame/ButtonGroupPaneListener.h"
#include "frame/GlogButtonPaneListener.h"
#include "host/CompoundPane.h"

class GlogStyleSheet;
class ScrollBarPane;
class TrackRowPane;

class TrackListPane : public CompoundPane, public GlogButtonPaneListener, public ButtonGroupPaneListener {
public:
    // Makes a list and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect"; "Num", how many rows there are at first; "TextID", the number of
    // the label that tells which row is chosen; and "CmdID", the number of the first of the buttons, in the
    // order of Command, and of a check box behind them that makes the view keep to the last bars. They lie
    // in the same container as the list, at any depth; a list in no container has none of them.
    static TrackListPane *NewTrackListPane(glogRec *, GlogStyleSheet *);

    enum Command { kAdd, kDelete, kMoveUp, kMoveDown, kReveal, kMoreBars, kFewerBars, kStickToEnd };

    // Overridden operations of panes and listeners. The view follows the box.
    void SetBox(Rect *) override;
    void GlogItemInit() override;
    void GlogButtonPressed(GlogButtonPane *) override;
    void ButtonValueChanged(ButtonGroupPane *, short index, bool value) override;

protected:
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    class Table;
    class Rows;
    class Numbers;

    explicit TrackListPane(GlogStyleSheet *);
    bool AddParts();
    void ArrangeParts(Rect const &box);
    bool AddRow(short index);
    void Carry(Command);
    void AddAfterChosen();
    void DeleteChosen();
    void MoveChosen(int by);
    void Reveal();
    void AddBars(int more);
    void Choose(TrackRowPane *);
    short ChosenIndex() const;
    void TellChosen();

    int labelID;
    int firstButton;
    int bars;
    int lastNumber = 0;     // of the tracks that were ever added
    Table *table = nullptr; // subpane, which holds the four below
    ScrollBarPane *along = nullptr, *across = nullptr;
    Numbers *numbers = nullptr; // as many as there are rows
    Rows *rows = nullptr;
    TrackRowPane *chosen = nullptr; // null: none
};
