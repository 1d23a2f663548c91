#pragma once
class EventRecordAdapter;
struct glogRec;

enum RunIdleChores { kDontRunIdleChores = 0, kRunIdleChores = 1 };

typedef char (*GlogFilterHook)(glogRec *, void *self, EventRecordAdapter *, short *item, int *value);

void DoModalGlog(glogRec *, short *item, int *value, GlogFilterHook, void *self,
                 bool flag, int two, int a, int b, bool no, RunIdleChores);
