// Running a glog that has to be answered before anything else.
#pragma once

class EventRecordAdapter;
struct glogRec;

// Whether idle chores go on while a modal glog runs.
enum RunIdleChores { kDontRunIdleChores = 0, kRunIdleChores = 1 };

// Sees each event before the glog does. `self` is what DoModalGlog was given. A result other than 0 ends the
// event: the glog does not see it, and the item that the filter has written, with its value, counts as hit;
// as long as the filter writes none, or -1, the glog goes on.
typedef char (*GlogFilterHook)(glogRec *, void *self, EventRecordAdapter *, short *item, int *value);

// Runs the glog, which is shown, and no other, until one of its items is hit; writes the item's number and
// its value, and leaves the glog open. Writes -1 as the item, and 0 as the value, when there is no glog or
// none is shown, when it goes away, and when the program is to end. The filter may be null; `self` is handed
// to it.
//
// Return and enter press the item `confirm`, escape and closing the window the item `cancel`; 0 stands for
// the items 1 and 2. A pane that has the keyboard may take the keys itself: a text field that is edited ends
// its editing by the first, and the next one is the dialog's. A button that is disabled is not hit. Where no
// pane has the number of the cancelling item, that item counts as hit all the same. The flags, and the 2,
// change nothing.
void DoModalGlog(glogRec *, short *item, int *value, GlogFilterHook, void *self, bool flag, int two,
                 int confirm, int cancel, bool no, RunIdleChores);
