// A group of check boxes: buttons that are on or off independently of each other.
//
// A click toggles a box. With the option key it turns the box on, with the command key off; if the group's
// flags say so, such a click also turns all others the other way.
#pragma once
#include "buttons/ButtonGroupPane.h"

class CheckBoxPane;

// As those of ButtonGroupPane. An index is taken by its low 16 bits.
extern void (*btnSetAllToSame)(CheckBoxPane *, bool);        // SetAllToSame
extern void (*btnSetOneCB)(CheckBoxPane *, int index, bool); // SetOne
extern bool (*btnReadOneCB)(CheckBoxPane *, int index);      // ReadOne
extern bool (*btnToggleOne)(CheckBoxPane *, int index);      // ToggleOne; answers the new value

class CheckBoxPane : public ButtonGroupPane {
public:
    // Flags, which add up.
    enum { kModifiersChangeOthers = 1 }; // a click with option or command changes the other boxes too

    // Make a group and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The flags are the record's, or those under "Flags" of the sheet, their low 16 bits. From a
    // record the group has no boxes until they are added; from a sheet it has those that ButtonGroupPane
    // reads. The layout properties are those of check boxes in the glog's sheet, or in the sheet given. A
    // sheet without a required container calls FailMemFullError, and no pane is left when that throws.
    static CheckBoxPane *NewCheckBoxPane(glogRec *, ckRadItemResRec *);
    static CheckBoxPane *NewCheckBoxPane(glogRec *, GlogStyleSheet *);

    // Changes of value tell both kinds of listeners and invalidate the box; an index that does not exist, and
    // a value that the box has, do nothing.
    void SetOne(short index, bool value);
    void ToggleOne(short index);
    void SetAllToSame(bool value);
    // The box's value; false for an index that does not exist.
    bool ReadOne(short index) const;

protected:
    CheckBoxPane();
    // Attach the pane and take over its layout properties and flags; null when it cannot be attached.
    CheckBoxPane *InitCheckBoxPane(glogRec *, ckRadItemResRec *);
    CheckBoxPane *InitCheckBoxPane(glogRec *, GlogStyleSheet *);

    bool TrackButton(short index, short modifiers) override;
    short GetReleaseIcon(bool value) override;
    // Turns the box on.
    void AutoSetButton(int index) override;
};
