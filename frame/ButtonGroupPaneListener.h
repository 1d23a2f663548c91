// Hears of each change of a button's value in a group of check boxes or radio buttons.
//
// ButtonGroupPane_Listener hears of changes of enabling too, and later.
#pragma once
#include "frame/Provider.h"

class ButtonGroupPane;

class ButtonGroupPaneListener : public Dependent<ButtonGroupPaneListener> {
public:
    ButtonGroupPaneListener();
    virtual ~ButtonGroupPaneListener();

    // The button at the index (from 0) has taken the value, by a click or by the program. Sent when the value
    // has been stored and before the redraw is asked for; enabling and disabling send nothing. When a radio
    // button takes over from another, the one that goes off is told first.
    virtual void ButtonValueChanged(ButtonGroupPane *source, short index, bool value) = 0;
};

// Tells the listeners the new value of one button.
class ButtonValueChangeMsg : public DependentCastMessenger<ButtonGroupPaneListener> {
public:
    ButtonValueChangeMsg(ButtonGroupPane *sender, short button, bool newValue)
        : source(sender)
        , index(button)
        , value(newValue) {}
    void BroadcastChange(ButtonGroupPaneListener *listener) override;

private:
    ButtonGroupPane *source;
    short index;
    bool value;
};

extern template class Provider<ButtonGroupPaneListener>;
extern template class Dependent<ButtonGroupPaneListener>;
extern template class DependentCastMessenger<ButtonGroupPaneListener>;
