// The host's side door into panes.
#pragma once
#include "desktop/panes/PaneRep.h"
#include "host/EventRecordAdapter.h"
#include "host/Geometry.h"
#include "host/OSRgn.h"

class PrintJob;
class UIEvent;

// Calls the protected operations of panes and reads the host's own fields. For the desktop only.
class PaneAccess {
public:
    static GlogPane::Rep &Rep(GlogPane &pane) { return *pane.rep; }
    static CompoundPane::CompoundRep &Rep(CompoundPane &pane) { return *pane.compoundRep; }
    static CompoundPane *AsContainer(GlogPane &pane) {
        return pane.rep->asContainer;
    } // null for no container
    static CompoundPane *Container(GlogPane &pane) { return pane.container; }
    static void SetContainerField(GlogPane &pane, CompoundPane *container) { pane.container = container; }
    static glogRec *GlogOf(GlogPane const &pane) { return pane.glog; }
    static void SetGlogField(GlogPane &pane, glogRec *glog) { pane.glog = glog; }

    // The pane draws elsewhere, or has been shown or hidden, or may have: its container looks anew.
    static void ForgetReach(GlogPane &pane);
    static bool OwnVisibility(GlogPane &pane) { return pane.rep->visible; }
    static bool SizesToLayout(CompoundPane &pane) { return pane.compoundRep->sizesToLayout; }

    static int Click(GlogPane &pane, EventRecordAdapter *event) { return pane.HandleClick(event); }
    static int SecondaryClick(GlogPane &pane, EventRecordAdapter *event) {
        return pane.HandleSecondaryButtonClick(event);
    }
    static char AdjustCursor(GlogPane &pane, Point p) { return pane.AdjustCursorAndDisplayHelp(p); }
    static void ConfirmChanges(GlogPane &pane) { pane.ConfirmChangesOnClickAway(); }
    static void InvalidateLayout(GlogPane &pane) { pane.LayoutIsNowInvalid(); }

    // Draws a visible pane that meets the region (in the coordinates of the pane; null: all of it), with clip
    // and port state of its own.
    static void Draw(GlogPane &, OSRgn *region);
    // Gives the pane the rectangle that its layout item was placed at; both the old and the new one are
    // damaged when they differ.
    static void PlacedByLayout(GlogPane &);
    static void MoveTo(GlogPane &, Rect const &box);

    // The pane has grown: tells its subpanes, if it is a container.
    static void ResizeSubpanes(GlogPane &, Point delta);

    // What drawing of the pane may reach, in window coordinates: its rectangles, cut by all its containers.
    static Rect VisiblePart(GlogPane &);
    // Window coordinates of the pane's coordinate origin.
    static Point Origin(GlogPane &);

    // Makes the layout items that the pane still lacks.
    static void EnsureLayoutItems(GlogPane &);
    // Puts the pane's item at the end of its container's group, unless it lies in a group already.
    static void JoinLayout(GlogPane &);
    // Takes the pane out of its container's list; its layout item stays where it is.
    static void TakeOut(GlogPane &);
    // Marks the pane and all its subpanes as belonging to the glog, or to none.
    static void Adopt(GlogPane &, glogRec *);
    // Prints what the pane has to print, and then its subpanes, as far as they are visible.
    static void Print(GlogPane &, PrintJob &);
    static void Idle(GlogPane &);  // visible panes, subpanes too
    static void Start(GlogPane &); // PanePositionChanged and GlogItemInit, once, subpanes too
};
