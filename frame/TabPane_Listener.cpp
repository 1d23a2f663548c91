#include "frame/TabPane_Listener.h"

template class Provider<TabPane_Listener>;
template class Dependent<TabPane_Listener>;
template class DependentCastMessenger<TabPane_Listener>;
template class Message3<TabPane_Listener, TabPane *, TabPane *, int, int, int, int>;

TabPane_Listener::TabPane_Listener() {}

TabPane_Listener::~TabPane_Listener() {}
