// Hears of changes of a note duration.
#pragma once
#include "frame/Message.h"

class DurationNotePane;

class DurationNotePane_Listener : public Dependent<DurationNotePane_Listener> {
public:
    DurationNotePane_Listener();
    virtual ~DurationNotePane_Listener();

    // The pane has taken another duration, by menu or by the program. Sent before the redraw is asked for.
    virtual void DurationValueChanged(DurationNotePane *) {}
};

extern template class Provider<DurationNotePane_Listener>;
extern template class Dependent<DurationNotePane_Listener>;
extern template class DependentCastMessenger<DurationNotePane_Listener>;
extern template class Message1<DurationNotePane_Listener, DurationNotePane *, DurationNotePane *>;
