// Hears that a button in a group of check boxes or radio buttons has changed its value or its enabling.
//
// ButtonGroupPaneListener hears of changes of value only, earlier, and with the value.
#pragma once
#include "frame/Message.h"

class ButtonGroupPane;

class ButtonGroupPane_Listener : public Dependent<ButtonGroupPane_Listener> {
public:
    ButtonGroupPane_Listener();
    virtual ~ButtonGroupPane_Listener();

    // The button at the index (from 0) has changed; the group's getters tell what it is now. Sent after the
    // redraw has been asked for.
    virtual void ButtonGroupPaneChanged(ButtonGroupPane *source, short index) = 0;
};

extern template class Provider<ButtonGroupPane_Listener>;
extern template class Dependent<ButtonGroupPane_Listener>;
extern template class DependentCastMessenger<ButtonGroupPane_Listener>;
extern template class Message2<ButtonGroupPane_Listener, ButtonGroupPane *, ButtonGroupPane *, short, short>;
