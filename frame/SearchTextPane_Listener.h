// Dependents of the text inside a search field. Nothing is sent to them; SearchFieldPane_Listener follows the
// typing.
#pragma once
#include "frame/Provider.h"

class SearchTextPane_Listener : public Dependent<SearchTextPane_Listener> {
public:
    SearchTextPane_Listener();
    virtual ~SearchTextPane_Listener();
};

extern template class Provider<SearchTextPane_Listener>;
extern template class Dependent<SearchTextPane_Listener>;
extern template class DependentCastMessenger<SearchTextPane_Listener>;
