// The text inside a search field.
//
// The up and down arrows and the escape key are the field's; every other key edits.
#pragma once
#include "frame/SearchTextPane_Listener.h"
#include "host/PanePtr.h"
#include "text/GTextPane.h"

class SearchFieldPane;

// The order of bases is fixed.
class SearchTextPane : public Provider<SearchTextPane_Listener>, public GTextPane {
public:
    explicit SearchTextPane(SearchFieldPane *owner); // the field that hears of keys; it may go first
    ~SearchTextPane() override;

    using GTextPane::InitGTextPane; // for the field

    // GlogPane. The field hears of every key that the text sees, whether or not it changes anything.
    int Key(EventRecordAdapter *) override;

    // GTextPane: nothing, so that what the field draws shows through.
    void DrawTextWell(Rect &) override;
    // OS::TextEditListener. Also tells the field of what reaches the text past Key: letters beyond ASCII,
    // what an input method composes, and edit commands.
    void TextEditListener_TextChanged() override;

private:
    PanePtr<SearchFieldPane> owner;
    bool inKey; // Key is running, and tells the field when it ends
};
