// Settles the places of all panes that are in a layout.
#pragma once
#include "desktop/layout/LayoutItemRep.h"
#include "host/Geometry.h"
#include <new>

class CompoundPane;
class GlogPane;
struct glogRec;

// Sizes are settled bottom up, places top down. Lazy: a change only marks the glog; Settle does the work,
// before the next drawing or the next question for a place.
class LayoutEngine {
public:
    static GlogLayoutItem::Rep &Rep(GlogLayoutItem &item) {
        return *std::launder(reinterpret_cast<GlogLayoutItem::Rep *>(item.rep));
    }
    static GlogLayoutItem::Rep const &Rep(GlogLayoutItem const &item) {
        return *std::launder(reinterpret_cast<GlogLayoutItem::Rep const *>(item.rep));
    }
    static void Settle(glogRec *);
    static void Invalidate(GlogLayoutItem &); // what the item lies in must be settled anew
    static void SettleFor(GlogLayoutItem &);  // before its place is told

    static RCPtr<GlogLayoutRectItem> MakeForPane(GlogPane *);
    static RCPtr<GlogLayoutGroup> MakeForContainer(CompoundPane *);
    static void Append(GlogLayoutGroup &, RCPtr<GlogLayoutItem> const &, int index);
    static void TakeOut(GlogLayoutItem &);
    static void PaneGone(GlogLayoutItem &); // also for the parts of the pane

    // Natural size without insets, width and height.
    struct Extent {
        int width, height;
    };
    static Extent Measure(GlogLayoutItem &);
    // Where a part of a pane lies in a layout, from the top left of its pane: in its own place, below and
    // right of its insets. A size that it was told replaces its own.
    static Rect PartInPane(GlogLayoutItem::Rep const &part, GlogLayoutItem::Rep const &pane);
    static void Place(GlogLayoutItem &, Rect const &);

private:
    static Extent MeasureGroup(GlogLayoutItem::Rep &);
    static Extent MeasurePane(GlogLayoutItem::Rep &);
    static void PlaceGroup(GlogLayoutItem::Rep &);
    static void SettleContainer(CompoundPane &);
    static void SettleInside(GlogPane &);
};
