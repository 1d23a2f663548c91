// A strip of icons with successive numbers, as an ornament.
//
// It takes neither the mouse nor the keyboard.
#pragma once
#include "buttons/SuccessiveIconsResRec.h"
#include "host/GlogPane.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

class SuccessiveIconsPane : public GlogPane {
public:
    // Attach the pane under the number 0, to the glog that owns it from then on; with a null glog it stays
    // unattached and without box. The width is that from one icon to the next, in pixels, and must be at
    // least 1: nothing here checks it, and drawing would not end. The record is only read.
    SuccessiveIconsPane(glogRec *, SuccessiveIconsResRec *);
    SuccessiveIconsPane(glogRec *, Rect box, int family, int baseIcon, int width);
    // The same from the item's "BoundsRect" (zero when absent), "FamilyID", "BaseIcon" and "Width"; null when
    // memory or glog is wanting. A null item fails the assertion of its pointer.
    static SuccessiveIconsPane *NewSuccessiveIconsPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);

    // Writes what is drawn: the family, the leftmost icon, and the pixels from one icon to the next.
    virtual void GetIconData(int &family, int &baseIcon, int &width);

protected:
    // Always 0.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    int family;
    int baseIcon; // the leftmost
    int width;    // from one icon to the next, in pixels
};
