// A list of takes with its headings and its bar.
//
// A click on a name selects, by the mode that radio buttons of the same page choose; a row is dragged to
// another place by its number; a press on its last column keeps the take or lets it go. The edges between the
// headings are dragged, and the wheel scrolls. A button of the page prints the list.
#pragma once
#include "frame/ButtonGroupPaneListener.h"
#include "frame/GListPane_SelectionListener.h"
#include "frame/GlogButtonPaneListener.h"
#include "host/CompoundPane.h"
#include "lists/ColumnList.h"
#include "lists/ListLineDrawer.h"
#include "tools/gallery/Takes.h"
#include <boost/shared_ptr.hpp>

class GListPane;
class GlogStyleSheet;
class ListHeaderPane;
class ScrollBarPane;

class TakeListPane : public CompoundPane,
                     public ButtonGroupPaneListener,
                     public GlogButtonPaneListener,
                     public GListPane_SelectionListener,
                     public ListLineDrawer {
public:
    // Makes a list and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect"; "Num" and "Step", whose product is the number of takes; "Style" of
    // the list; "TextID", the number of the label that tells what is selected; and, in the same container at
    // any depth, "CmdID" of the radio buttons, a mode each, and "CmdClassID" of the button that prints. The
    // list's bar has the item number 997 and its style.
    static TakeListPane *NewTakeListPane(glogRec *, GlogStyleSheet *);

    // Overridden operations of panes, listeners and drawers. The parts follow the box.
    void SetBox(Rect *) override;
    void GlogItemInit() override;
    void ButtonValueChanged(ButtonGroupPane *, short index, bool value) override;
    void GlogButtonPressed(GlogButtonPane *) override;
    void SelectionDone(GListPane *) override;
    void ClickOccured(GListPane *, int, int, bool) override {}
    void DrawLine(int line, Rect *rowBox, bool hilite) override;

protected:
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    class List;
    enum Column { kNumber, kName, kLength, kKept, kColumns };

    TakeListPane(GlogStyleSheet *, int count);
    bool AddParts();
    void ArrangeParts(Rect const &box);
    void DrawText(UString const &, Rect const &rowBox, Column) const;
    Rect CellIn(Rect const &rowBox, Column) const;
    void ActOn(int line, int column, Point where);
    void PrintToFile();
    void Tell(UString const &);
    void TellSelected();

    int style, labelID, modesID, printID;
    Takes takes;
    boost::shared_ptr<ColumnList> columns;
    ListHeaderPane *header = nullptr; // subpanes
    List *list = nullptr;
    ScrollBarPane *bar = nullptr;
};
