// Hears of completed presses of a push button.
#pragma once
#include "frame/Provider.h"

class GlogButtonPane;

class GlogButtonPaneListener : public Dependent<GlogButtonPaneListener> {
public:
    GlogButtonPaneListener();
    virtual ~GlogButtonPaneListener();

    // The button was pressed and released, by mouse (inside the button) or key. Sent once a press, after the
    // button has been redrawn as released; a press that ends outside sends nothing.
    virtual void GlogButtonPressed(GlogButtonPane *source) = 0;
};

// Tells the listeners of one completed press.
class GlogButtonPanePressedMsg : public DependentCastMessenger<GlogButtonPaneListener> {
public:
    explicit GlogButtonPanePressedMsg(GlogButtonPane *sender)
        : source(sender) {}
    void BroadcastChange(GlogButtonPaneListener *listener) override;

private:
    GlogButtonPane *source;
};

extern template class Provider<GlogButtonPaneListener>;
extern template class Dependent<GlogButtonPaneListener>;
extern template class DependentCastMessenger<GlogButtonPaneListener>;
