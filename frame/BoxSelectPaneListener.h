// Hears of each box that is switched on or off in a box selection.
#pragma once
#include "frame/Provider.h"

class BoxSelectPane;

class BoxSelectPaneListener : public Dependent<BoxSelectPaneListener> {
public:
    BoxSelectPaneListener();
    virtual ~BoxSelectPaneListener();

    // The box at the index (from 0) has taken the value, by a click or by the program. Sent when the value
    // has been stored and the redraw asked for. In radio mode the box that goes off is told before the one
    // that goes on.
    virtual void BoxValueChanged(BoxSelectPane *source, short index, bool value) = 0;
};

// Tells the listeners the new value of one box.
class BoxSelectPaneChangeMsg : public DependentCastMessenger<BoxSelectPaneListener> {
public:
    BoxSelectPaneChangeMsg(BoxSelectPane *sender, short box, bool newValue)
        : source(sender)
        , index(box)
        , value(newValue) {}
    void BroadcastChange(BoxSelectPaneListener *listener) override;

private:
    BoxSelectPane *source;
    short index;
    bool value;
};

extern template class Provider<BoxSelectPaneListener>;
extern template class Dependent<BoxSelectPaneListener>;
extern template class DependentCastMessenger<BoxSelectPaneListener>;
