// Follows the editing of a text field.
#pragma once
#include "frame/Message.h"

class GTextPane;

class TextPaneListener : public Dependent<TextPaneListener> {
public:
    TextPaneListener();
    virtual ~TextPaneListener();

    // The edit is to be taken as final. Sent each time the field is deselected, also when it was not selected
    // before: expect repeats.
    virtual void TextPaneConfirmation(GTextPane *) {}
    // The field is being selected and its insertion point is about to appear.
    virtual void BeginEditing(GTextPane *) {}
    // The field was selected and is being deselected; TextPaneConfirmation follows.
    virtual void EndEditing(GTextPane *) {}
    // The user has cancelled: put the old value back.
    virtual void ResetValue(GTextPane *) {}
    // The text has changed by typing or an edit command.
    virtual void ValueChanged(GTextPane *) {}
};

extern template class Provider<TextPaneListener>;
extern template class Dependent<TextPaneListener>;
extern template class DependentCastMessenger<TextPaneListener>;
extern template class Message1<TextPaneListener, GTextPane *, GTextPane *>;
