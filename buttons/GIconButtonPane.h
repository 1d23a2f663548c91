// A button made of icons that acts again and again while it is held down.
//
// The icons of the family stand in this order: the states, the disabled looks, and the looks of the pressed
// button; SetDisabledIconsAfterDownStateIcons exchanges the last two. A completed click goes on to the next
// state and gives what ReleaseAction says, 1 by default; -1 means that the mouse slid off or that the button
// is disabled.
#pragma once
#include "host/GlogPane.h"

class TrackButtonMouseTask;

class GIconButtonPane : public GlogPane {
public:
    // Makes a button and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. `icon` is that of state 0. There must be at least one state: nothing here checks it. With
    // fewer than two disabled states the disabled look is the same in every state.
    static GIconButtonPane *NewGIconButtonPane(glogRec *, short id, short family, short icon, short numStates,
                                               short numDownStates, short numDisabledStates);

    // Operations that subclasses build on. `modifiers` are those of the press, as in EventRecordAdapter.

    // Stores the state and invalidates the pane; without effect for the state that it has. While the button
    // is held down its state is one of the down looks, counted from the icon of state 0.
    virtual void SetState(short);
    virtual short GetState();
    // The button goes down, before it looks so. Answers the state after a completed click: here the next one,
    // or the first after the last.
    virtual short ClickAction(int modifiers);
    // A click was completed, and the button has its new state. The answer, here 1, becomes that of the click.
    // The button may be deleted here.
    virtual int ReleaseAction();
    // Called once when the button is pressed, and, if it can be cancelled, about ten times a second while it
    // is held down with the mouse inside, and for each movement of the mouse there. Here nothing.
    virtual void DoButtonPress(int modifiers);
    // Draws on top of the icon that was drawn, which is given by its index. Here nothing.
    virtual void DrawMore(short icon);

    // A disabled button refuses clicks. These invalidate the pane when something changes.
    void Enable();
    void Disable();
    void SetEnable(bool);
    bool IsEnabled() const { return enabled; }

    // The icon of state 0; invalidates the pane when it changes. SetIconSet changes the family and only
    // stores.
    void SetIcon(int);
    void SetIconSet(int family);

    // How the icons are numbered. These only store, and are called before the button is shown.

    // Whether the family has disabled looks between the states and the pressed looks. At first false.
    void SetCanDisable(bool);
    // The disabled looks follow the pressed ones. At first they precede them.
    void SetDisabledIconsAfterDownStateIcons();
    // The disabled button looks as in state 0. At first there are disabled looks.
    void SetNoDisabledIcons();

protected:
    GIconButtonPane();
    // Attaches the pane and stores the arguments; null when it cannot be attached. The size of its box, or
    // for an empty box that of the family's icons, becomes the natural size of its layout item; with neither
    // a box nor a family of 1 or more the item is left alone. The box itself stays as it is.
    GIconButtonPane *GIconButtonPaneInit(glogRec *, short id, short family, short icon, short numStates,
                                         short numDownStates, short numDisabledStates);
    // Whether the button pops up while the mouse is outside, and repeats while it is inside. At first true.
    // Otherwise it acts once, and every press completes a click. Only stores.
    void SetCanCancel(bool);

    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    friend class TrackButtonMouseTask;

    short ShownIcon() const;
    short FirstDownState() const;

    short family;
    short icon; // of state 0
    short numStates;
    short numDownStates;
    short numDisabledStates;
    short state;
    bool canCancel;
    bool canDisable;
    bool enabled;
    bool disabledIconsAfterDownStateIcons;
    bool hasDisabledIcons;
};
