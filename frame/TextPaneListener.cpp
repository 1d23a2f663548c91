#include "frame/TextPaneListener.h"

template class Provider<TextPaneListener>;
template class Dependent<TextPaneListener>;
template class DependentCastMessenger<TextPaneListener>;
template class Message1<TextPaneListener, GTextPane *, GTextPane *>;

TextPaneListener::TextPaneListener() {}

TextPaneListener::~TextPaneListener() {}
