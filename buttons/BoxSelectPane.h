// Rectangular hot spots over a picture or panel that lies behind, each on or off; those that are on are
// marked.
//
// A click acts when the mouse goes down, without tracking: it switches the box over or, where one box at a
// time is on, goes over to that box. It gives the box's index plus 1. Of boxes that overlap, the later one
// lies on top.
//
// Indices count from 0 and are not checked.
#pragma once
#include "buttons/BoxSelectItem.h"
#include "buttons/boxSelResRec.h"
#include "buttons/btnOneBoxRec.h"
#include "frame/BoxSelectPaneListener.h"
#include "frame/Provider.h"
#include "host/GlogPane.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>
#include <vector>

class BoxSelectPane : public Provider<BoxSelectPaneListener>, public GlogPane {
public:
    // How a box that is on is marked. Values beyond draw nothing.
    enum Style { kThinFrame = 0, kHighlight = 1, kHighlightToo = 2 };

    // Make a pane and attach it to the glog, which owns it from then on. With a null glog, and that goes
    // unreported, the pane stays unattached and without boxes. From a record alone the boxes are empty
    // rectangles. Where one box at a time is on, there must be at least one, and the first is on.
    static BoxSelectPane *NewBoxSelectPane(glogRec *, boxSelResRec *);
    // The item has "Style", "Mode" and the container "RectList" of rectangles with the keys "kTop", "kLeft",
    // "kBottom" and "kRight"; the smallest rectangle around them becomes the pane's box and natural size.
    // Without a list an assertion fails; a child of it that is no container ends in FailMemFullError.
    static BoxSelectPane *NewBoxSelectPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);

    // Whether the box is on.
    bool ReadOne(short index);
    // Switches the box, invalidates the pane and tells the listeners; without effect for the value that it
    // has. The other boxes stay as they are, also where one at a time should be on: RadSet sees to that.
    void SetOne(short index, bool value);

    // The box that is on, where one at a time is; at first 0.
    short RadGet() const { return radioValue; }
    // Goes over to another box: SetOne of the old and of the new one. Without effect for the current one. A
    // listener may delete the pane.
    void RadSet(short index);

    // Whether boxes that are on are marked at all; at first true. InitStatus only stores it, ChangeStatus
    // also invalidates the pane.
    void InitStatus(bool);
    void ChangeStatus(bool);

    // How many boxes there are.
    short GetNumBoxes() const;
    // Writes the box's rectangle, in the coordinates of the pane's events.
    void GetOneBox(short index, Rect *out);
    // Moves the pane's top left corner to the point, and the boxes along with it.
    void SetOrigin(Point);
    // Shows a help tag for the box, a little narrower than it and where it lies now. The tag stays the
    // host's. Takes the place of a tag for the whole pane.
    void AttachHelpTag(short index, LocalizedStrings::HelpTag const *);

    // Where the new container lays out its items, the boxes are counted from their common top left corner
    // from then on.
    void SetContainer(CompoundPane *) override;
    // Moves the boxes along with the pane's top left corner, unless the pane is in a layout.
    void SetBox(Rect *) override;

protected:
    BoxSelectPane(glogRec *, boxSelResRec *);

    // The index of the topmost box under the point plus 1; 0 when there is none.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override; // the region must not be null

private:
    Rect GetNthBoxBounds(short index) const;
    void SetNthBoxBounds(short index, Rect const &);
    bool GetNthBoxValue(short index) const;
    void SetNthBoxValue(short index, bool);
    BoxSelectItem &Nth(short index);
    BoxSelectItem const &Nth(short index) const;

    void SetBoxes(boost::shared_ptr<XMLLib::ContainerItem> const &list);
    short IndexAt(Point);
    void InvertNthBox(short index);

    unsigned char style;    // a Style
    unsigned char multiple; // 0: one box at a time is on
    short radioValue;       // the current box, where one at a time is on
    bool status;            // boxes that are on may be marked
    std::vector<BoxSelectItem> boxes;
};

// The pane's operations for code that holds no more than a pointer, as variables that a program may replace.
extern bool (*btnReadOneBS)(BoxSelectPane *, int index);            // ReadOne
extern void (*btnSetOneBS)(BoxSelectPane *, int index, bool value); // SetOne
extern bool (*btnSetOriginBS)(BoxSelectPane *, int v, int h);       // SetOrigin; true
extern void (*btnGetOneBox)(BoxSelectPane *, btnOneBoxRec *);       // GetOneBox
extern short (*radGetBS)(BoxSelectPane *);                          // RadGet
extern void (*radSetBS)(BoxSelectPane *, int index);                // RadSet
extern void (*gbsInitStatus)(BoxSelectPane *, bool);                // InitStatus
extern void (*gbsChangeStatus)(BoxSelectPane *, bool);              // ChangeStatus
