// Follows the typing in a search field.
#pragma once
#include "frame/Message.h"

class EventRecordAdapter;
class UString;

class SearchFieldPane_Listener : public Dependent<SearchFieldPane_Listener> {
public:
    SearchFieldPane_Listener();
    virtual ~SearchFieldPane_Listener();

    // Sent with the whole text after each key that the text has seen, whether or not it has changed anything.
    virtual void TextChanged(UString const &) {}
    // The search was given up by the cancel button or the escape key; the text is empty by now. Sent also
    // when it was empty before.
    virtual void SearchIsCanceled() {}
    // The up or down arrow was pressed. The text does not see these keys; the event is valid during the call
    // only.
    virtual void HandleSpecialKey(EventRecordAdapter *) {}
};

extern template class Provider<SearchFieldPane_Listener>;
extern template class Dependent<SearchFieldPane_Listener>;
extern template class DependentCastMessenger<SearchFieldPane_Listener>;
extern template class Message0<SearchFieldPane_Listener>;
extern template class Message1<SearchFieldPane_Listener, UString const &, UString>;
extern template class Message1<SearchFieldPane_Listener, EventRecordAdapter *, EventRecordAdapter *>;
