#include "text/SearchTextPane.h"
#include "host/EventRecordAdapter.h"
#include "host/PaneWatch.h"
#include "text/SearchFieldPane.h"

namespace {

int const kHandled = -1; // what Key answers

} // namespace

SearchTextPane::SearchTextPane(SearchFieldPane *field)
    : inKey(false) {
    owner = field;
}

SearchTextPane::~SearchTextPane() {}

int SearchTextPane::Key(EventRecordAdapter *event) {
    if (!owner)
        return GTextPane::Key(event);
    if (UpArrowKey(event) || DownArrowKey(event)) {
        owner->HandleSpecialKey(event);
        return kHandled;
    }
    if (EscapeKey(event)) {
        owner->Inval();
        owner->CancelSearch();
        return kHandled;
    }
    PaneWatch const self(this);
    bool const outer = inKey;
    inKey = true;
    int const result = GTextPane::Key(event);
    if (!self.PaneExists())
        return result;
    inKey = outer;
    if (owner)
        owner->SearchTextChanged(GetText());
    return result;
}

void SearchTextPane::DrawTextWell(Rect &) {}

void SearchTextPane::TextEditListener_TextChanged() {
    PaneWatch const self(this);
    GTextPane::TextEditListener_TextChanged();
    if (self.PaneExists() && !inKey && owner)
        owner->SearchTextChanged(GetText());
}
