#include "frame/SearchFieldPane_Listener.h"

template class Provider<SearchFieldPane_Listener>;
template class Dependent<SearchFieldPane_Listener>;
template class DependentCastMessenger<SearchFieldPane_Listener>;
template class Message0<SearchFieldPane_Listener>;
template class Message1<SearchFieldPane_Listener, UString const &, UString>;
template class Message1<SearchFieldPane_Listener, EventRecordAdapter *, EventRecordAdapter *>;

SearchFieldPane_Listener::SearchFieldPane_Listener() {}

SearchFieldPane_Listener::~SearchFieldPane_Listener() {}
