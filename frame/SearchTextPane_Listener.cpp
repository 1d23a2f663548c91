#include "frame/SearchTextPane_Listener.h"

template class Provider<SearchTextPane_Listener>;
template class Dependent<SearchTextPane_Listener>;
template class DependentCastMessenger<SearchTextPane_Listener>;

SearchTextPane_Listener::SearchTextPane_Listener() {}

SearchTextPane_Listener::~SearchTextPane_Listener() {}
