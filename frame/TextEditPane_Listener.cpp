#include "frame/TextEditPane_Listener.h"

template class Provider<TextEditPane_Listener>;
template class Dependent<TextEditPane_Listener>;
template class DependentCastMessenger<TextEditPane_Listener>;
template class Message1<TextEditPane_Listener, TextEditPane &, boost::reference_wrapper<TextEditPane>>;

TextEditPane_Listener::TextEditPane_Listener() {}

TextEditPane_Listener::~TextEditPane_Listener() {}
