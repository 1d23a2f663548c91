#include "host/PaneWatch.h"
#include "desktop/panes/PaneRep.h"
#include "host/GlogPane.h"

PaneWatch::PaneWatch(GlogPane *watched)
    : pane(nullptr)
    , next(nullptr) {
    Watch(watched);
}

PaneWatch::~PaneWatch() { Watch(nullptr); }

void PaneWatch::Watch(GlogPane *watched) {
    if (pane) {
        PaneWatch **link = &pane->rep->watches;
        while (*link != this)
            link = &(*link)->next;
        *link = next;
    }
    pane = watched;
    if (pane) {
        next = pane->rep->watches;
        pane->rep->watches = this;
    }
}
