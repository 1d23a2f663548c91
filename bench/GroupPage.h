// A window full of check boxes.
#pragma once
#include "desktop/SimulatedDesktop.h"
#include "host/Geometry.h"
#include <string>
#include <vector>

class CheckBoxPane;
struct glogRec;

// Check boxes with labels in columns: all of them in one pane, or each in a pane of its own.
class GroupPage {
public:
    enum Kind { kOneGroup, kManyPanes };

    // Shown and drawn.
    GroupPage(Kind, int boxes);

    // A glog with the check boxes, not shown. Labels repeat, so that a large page has no more of them to
    // measure than a small one. The panes may be null.
    static glogRec *Build(SimulatedDesktop &, Kind, int boxes, std::vector<CheckBoxPane *> *panes);

    glogRec *Glog() const { return glog; }
    // The pane of a check box, and the box's number there.
    CheckBoxPane &PaneOf(int box) const;
    short IndexOf(int box) const;
    // A script that clicks the check box.
    static std::string ClickOn(int box);
    // The pixels that a change of the check box damages.
    Rect DamageOf(int box) const;

    SimulatedDesktop desktop;

private:
    Kind kind;
    std::vector<CheckBoxPane *> panes;
    glogRec *glog;
};
