// The panes that come to a glog while something is made.
#pragma once
#include "desktop/panes/Glog.h"
#include "host/GlogPane.h"
#include <algorithm>
#include <vector>

// Deletes, at its end, panes that have come to the glog's top level meanwhile, unless they were moved
// elsewhere or Keep was called.
class GrowingPanes {
public:
    explicit GrowingPanes(glogRec *glog_)
        : glog(glog_)
        , before(Panes()) {}
    ~GrowingPanes() {
        // Each pane that goes may take others along.
        while (GlogPane *const pane = kept ? nullptr : Newcomer())
            delete pane;
    }
    GrowingPanes(GrowingPanes const &) = delete;
    GrowingPanes &operator=(GrowingPanes const &) = delete;

    void Keep() { kept = true; } // all panes

private:
    std::vector<GlogPane *> const &Panes() const { return Glog::From(glog).Items(); }
    // Null when there is none.
    GlogPane *Newcomer() const {
        std::vector<GlogPane *> const &panes = Panes();
        auto const found = std::find_if(panes.begin(), panes.end(), [this](GlogPane *pane) {
            return std::find(before.begin(), before.end(), pane) == before.end();
        });
        return found == panes.end() ? nullptr : *found;
    }

    glogRec *glog;
    std::vector<GlogPane *> before;
    bool kept = false;
};
