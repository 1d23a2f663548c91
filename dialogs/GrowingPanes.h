// The panes that come to a glog while something is made.
#pragma once
#include "desktop/panes/Glog.h"
#include "host/CompoundPane.h"
#include "host/GlogPane.h"
#include <cstddef>
#include <vector>

// The glog is not drawn meanwhile. Deletes, at its end, panes that have come to the glog's top level
// meanwhile, which come last there, unless they were moved elsewhere or Keep was called. Costs the same
// however many panes there are.
class GrowingPanes {
public:
    explicit GrowingPanes(glogRec *glog_)
        : glog(glog_)
        , before(Panes().size()) {
        Glog::From(glog).BeginMakingPanes();
    }
    ~GrowingPanes() {
        // Each pane that goes may take others along.
        while (!kept && Panes().size() > before)
            delete Panes().back();
        Glog::From(glog).EndMakingPanes();
    }
    GrowingPanes(GrowingPanes const &) = delete;
    GrowingPanes &operator=(GrowingPanes const &) = delete;

    void Keep() { kept = true; } // all panes
    // Moves a pane from the top level, where it may have moved pixels already.
    static void MoveInto(CompoundPane &container, GlogPane *pane) {
        pane->Inval();
        container.Add(pane, kOnTop);
    }

private:
    static int const kOnTop = -1;

    std::vector<GlogPane *> const &Panes() const { return Glog::From(glog).Items(); }

    glogRec *glog;
    std::size_t const before;
    bool kept = false;
};
