// Shows one icon of a family, chosen by a state and by whether the pane is enabled.
//
// State 0 is the icon with the pane's number, and further states are the icons that follow. The icon after
// that of the last state is the disabled look. A click gives 1 when it meets the icon's own shape; the
// transparent rest of the box lets it fall through.
#pragma once
#include "buttons/GIconResRec.h"
#include "host/GlogPane.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

class GIconPane : public GlogPane {
public:
    // Draws over the icon. `box` is the pane's; `pressed` is always false for a pane that is no button.
    typedef void (*DecalProc)(glogRec *, Rect box, bool enabled, bool pressed, GIconPane *);

    // Make a pane and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The record, and the item with its "BoundsRect" (zero when absent), "FamilyID", "Num",
    // "NumStates" and "CanDisable", are only read; keys that are absent count as 0. A null item fails the
    // assertion of its pointer.
    static GIconPane *NewGIconPane(glogRec *, GIconResRec *);
    static GIconPane *NewGIconPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);

    // The icons' family.
    short GetFamilyID() const { return family; }
    short GetIconNum() const { return icon; } // of state 0
    // How many states there are.
    short GetNumStates() const { return numStates; }
    bool CanDisable() const { return canDisable != 0; } // as the record had it; what is shown ignores it
    // The state shown, from 0.
    short GetCurState() const { return curState; }
    // Whether the pane is drawn as enabled.
    bool GetEnabled() const { return enabled != 0; }
    DecalProc GetDecalProc() const { return decalProc; } // or null

    // These only store: whoever calls them invalidates the pane. Nothing is checked; a state beyond the last
    // shows the icon at that distance from the first.
    void SetFamilyID(short);
    void SetIconNum(short);
    void SetNumStates(short);
    void SetCurState(short);
    void SetEnabled(short); // any value but 0 enables
    void SetDecalProc(DecalProc);

protected:
    GIconPane();
    // Attaches the pane under the number 0, enabled and in state 0, and takes box and icons from the record.
    // The box's size becomes the natural size of the layout item.
    GIconPane *InitGIconPane(glogRec *, GIconResRec &);
    // What a creator reads of an item into a record.
    static void ReadItem(boost::shared_ptr<XMLLib::ContainerItem> const &, GIconResRec &);

    // 1 when the point is in the shape of the shown icon and the pane is enabled, else 0.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    short ShownIcon() const;

    short family;
    short icon; // of state 0
    short numStates;
    short canDisable;
    short curState;
    unsigned char enabled; // 0 or 1
    DecalProc decalProc;   // or null
};

// The pane's operations for code that holds no more than a pointer, as variables that a program may replace.
// They are the operations of the class but for two: gcStateIconSetCurState clamps the state to those that
// there are, and gcStateIconSetEnable invalidates the pane.
extern int (*gcIconGetIconNum)(GIconPane *);
extern void (*gcIconSetIconNum)(GIconPane *, int);
extern void (*gcIconSetDecalProc)(GIconPane *, GIconPane::DecalProc);
extern int (*gcStateIconGetCurState)(GIconPane *);
extern void (*gcStateIconSetCurState)(GIconPane *, int);
extern int (*gcStateIconGetNumStates)(GIconPane *);
extern void (*gcStateIconSetNumStates)(GIconPane *, int);
extern bool (*gcStateIconGetEnable)(GIconPane *);
extern void (*gcStateIconSetEnable)(GIconPane *, bool);
