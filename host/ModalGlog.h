// Running a glog that has to be answered before anything else.
#pragma once

class EventRecordAdapter;
struct glogRec;

// Whether idle chores go on while a modal glog runs.
enum RunIdleChores { kDontRunIdleChores = 0, kRunIdleChores = 1 };

// Sees each event before the glog does. `self` is what DoModalGlog was given. A result other than 0 ends the
// event: the filter has written the item that was hit and its value, and the glog does not see it.
typedef char (*GlogFilterHook)(glogRec *, void *self, EventRecordAdapter *, short *item, int *value);

// Runs the glog, and no other, until one of its items is hit; writes the item's number and its value, and
// leaves the glog open. The filter may be null; `self` is handed to it. The numbers and flags between filter
// and chores are kept for callers and change nothing.
void DoModalGlog(glogRec *, short *item, int *value, GlogFilterHook, void *self, bool flag, int two, int a,
                 int b, bool no, RunIdleChores);
