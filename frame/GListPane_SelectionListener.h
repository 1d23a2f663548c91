// Hears of clicks and changes of selection in a list.
//
// A list calls its one selection listener directly; nothing is broadcast on its provider of this class.
#pragma once
#include "frame/Provider.h"

class GListPane;

class GListPane_SelectionListener : public Dependent<GListPane_SelectionListener> {
public:
    GListPane_SelectionListener();
    virtual ~GListPane_SelectionListener();

    // A gesture or command that selects has ended; sent also when it changed nothing.
    virtual void SelectionDone(GListPane *) = 0;
    // A click that does not select. Column and line count from 0.
    virtual void ClickOccured(GListPane *, int column, int line, bool doubleClick) = 0;
    // The state of one line (from 0) has changed. `tracking` is true for the lines that a running drag
    // changes.
    virtual void SelectOccured(GListPane *, int /*line*/, bool /*selected*/, bool /*tracking*/) {}
};

extern template class Provider<GListPane_SelectionListener>;
extern template class Dependent<GListPane_SelectionListener>;
extern template class DependentCastMessenger<GListPane_SelectionListener>;
