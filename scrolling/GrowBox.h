// The square in a window's corner by which the window is resized.
//
// The window does the resizing; the box draws itself and sets the limits of the window's size.
#pragma once
#include "host/GlogPane.h"
#include "host/XMLLib.h"
#include "scrolling/growResRec.h"
#include <boost/shared_ptr.hpp>

class GrowBox : public GlogPane {
public:
    ~GrowBox() override;

    // Make a box of 15 x 15 pixels in the corner of the glog and attach it under the number; the glog owns
    // it. Null when memory or glog is wanting. The record may be null: then the limits stay as they are. From
    // the keys of growResRec, each cut to its field; a null item fails the assertion of its pointer.
    static GrowBox *InitGrowBox(glogRec *, short id, growResRec *);
    static GrowBox *InitGrowBox(glogRec *, short id, boost::shared_ptr<XMLLib::ContainerItem>);

    // The icon in family 1000, at first 24, which also says which lines are drawn where the platform has no
    // grow boxes. Only stores.
    void SetIcon(short newIcon) { icon = newIcon; }

    // Overridden operations of panes.
    void ContainmentChanged() override;
    void Resize(Point delta) override;

protected:
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    GrowBox();
    void TakeFrom(growResRec const &);
    void GoToCorner();
    void DrawFlat(Rect const &) const;
    void DrawBorders(Rect const &) const;
    void Invariant() const {}

    short icon;
};
