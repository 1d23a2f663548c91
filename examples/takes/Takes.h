// What the window of takes does: a list of takes, and a field and a menu that change the selected one.
#pragma once
#include "frame/GListPane_SelectionListener.h"
#include "frame/GlogButtonPaneListener.h"
#include "frame/PopUpMenuListener.h"
#include "frame/TextPaneListener.h"
#include "host/PanePtr.h"
#include "host/UString.h"
#include <vector>

class GTextPane;
class PopMPane;
struct ListCell;
struct glogRec;

class Takes : public GlogButtonPaneListener,
              public TextPaneListener,
              public PopUpMenuListener,
              public GListPane_SelectionListener {
public:
    // The numbers of the items in takes.xml.
    enum { kName = 1, kRating = 2, kAdd = 3, kList = 4, kDone = 6 };

    explicit Takes(glogRec *);
    ~Takes() override;

    // What the panes tell.
    void GlogButtonPressed(GlogButtonPane *) override;
    void ValueChanged(GTextPane *) override;
    void ListenToMenuChange(PopUpMenu *, short item) override;
    void SelectionDone(GListPane *) override;
    void ClickOccured(GListPane *, int, int, bool) override {}

private:
    struct Take {
        UString name;
        short rating; // the item of the menu
    };

    void FillIn(int line, int column, ListCell &) const;
    Take *Selected(); // null when there is none

    std::vector<Take> takes;
    GTextPane *name;
    PopMPane *rating;
    PanePtr<GListPane> list; // null once the window has gone
};
