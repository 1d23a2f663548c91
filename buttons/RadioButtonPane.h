// A group of radio buttons: one of them is the current one and on, all others are off.
//
// A click makes a button the current one. The first button is current until another is set.
#pragma once
#include "buttons/ButtonGroupPane.h"

class RadioButtonPane;

// As those of ButtonGroupPane.
extern short (*radGet)(RadioButtonPane *);           // RadioGet
extern void (*radSet)(RadioButtonPane *, int index); // RadioSet with the low 16 bits

class RadioButtonPane : public ButtonGroupPane {
public:
    // Make a group and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The flags are the record's, or those under "Flags" of the sheet, their low 16 bits, and mean
    // nothing to radio buttons. From a record the group has no buttons until they are added; from a sheet it
    // has those that ButtonGroupPane reads. The layout properties are those of radio buttons in the glog's
    // sheet, or in the sheet given. A sheet without a required container calls FailMemFullError, and no pane
    // is left when that throws.
    static RadioButtonPane *NewRadioButtonPane(glogRec *, ckRadItemResRec *);
    static RadioButtonPane *NewRadioButtonPane(glogRec *, GlogStyleSheet *);

    // As the base; the current button is on at once, without a message.
    void AddSpecialButton(short h, short v, short extraWidth) override;

    // Makes the button the current one. Both kinds of listeners hear first of the old one going off, then of
    // the new one going on, and both are invalidated. When a listener of the former makes yet another button
    // the current one, that one alone goes on. The current button, and an index that does not exist, do
    // nothing.
    virtual void RadioSet(short index);
    // The index of the current button; 0 also while there are no buttons.
    virtual short RadioGet();

protected:
    RadioButtonPane();
    // Attach the pane and take over its layout properties and flags; null when it cannot be attached.
    RadioButtonPane *InitRadioButtonPane(glogRec *, ckRadItemResRec *);
    RadioButtonPane *InitRadioButtonPane(glogRec *, GlogStyleSheet *);

    bool TrackButton(short index, short modifiers) override;
    short GetReleaseIcon(bool value) override;
    // Makes the button the current one, by RadioSet.
    void AutoSetButton(int index) override;

private:
    RadioButtonPane *FinishInit(unsigned short newFlags);
    void ShowInitialValue();
};
