#include "frame/ScrollBarPane_Listener.h"

template class Provider<ScrollBarPane_Listener>;
template class Dependent<ScrollBarPane_Listener>;
template class DependentCastMessenger<ScrollBarPane_Listener>;
template class Message0<ScrollBarPane_Listener>;

ScrollBarPane_Listener::ScrollBarPane_Listener() {}

ScrollBarPane_Listener::~ScrollBarPane_Listener() {}
