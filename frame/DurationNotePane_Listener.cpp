#include "frame/DurationNotePane_Listener.h"

template class Provider<DurationNotePane_Listener>;
template class Dependent<DurationNotePane_Listener>;
template class DependentCastMessenger<DurationNotePane_Listener>;
template class Message1<DurationNotePane_Listener, DurationNotePane *, DurationNotePane *>;

DurationNotePane_Listener::DurationNotePane_Listener() {}

DurationNotePane_Listener::~DurationNotePane_Listener() {}
