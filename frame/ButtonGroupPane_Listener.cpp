#include "frame/ButtonGroupPane_Listener.h"

template class Provider<ButtonGroupPane_Listener>;
template class Dependent<ButtonGroupPane_Listener>;
template class DependentCastMessenger<ButtonGroupPane_Listener>;
template class Message2<ButtonGroupPane_Listener, ButtonGroupPane *, ButtonGroupPane *, short, short>;

ButtonGroupPane_Listener::ButtonGroupPane_Listener() {}

ButtonGroupPane_Listener::~ButtonGroupPane_Listener() {}
