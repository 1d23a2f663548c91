// An icon pane that is pressed like a button, steps through its states and sends commands.
//
// A click in the icon's shape is tracked; each completed one goes on to the next state and sends the button's
// command, with the option key the other one. The icons of the family stand in this order: the states, the
// disabled look if the pane can be disabled, and the states of the pressed button.
#pragma once
#include "buttons/ButtonTracking.h"
#include "buttons/GIconButtonResRec.h"
#include "buttons/GIconPane.h"
#include "host/CommandSpecifier.h"

class PaneWatch;

class GIconButton : public GIconPane {
public:
    // Takes part in clicks.
    class ClickHandler {
    public:
        virtual ~ClickHandler() {}
        // A click has met the icon; 0 lets the button track it, any other value ends the click and is its
        // result.
        virtual int ClickStarted(GIconButton *, EventRecordAdapter *) = 0;
        // The click was completed, and the button has its new state. The command of a button that can be
        // cancelled follows.
        virtual void ClickFinished(GIconButton *) = 0;
    };

    // As for an icon pane. The item's further keys are "NumDownStates", "CanCancel", "NotifyWindow",
    // "CmdClassID", "CmdID", "OptCmdClassID" and "OptCmdID"; of the first two flags any value but 0 counts.
    // There must be at least one state and one down state: nothing here checks it.
    static GIconButton *NewGIconButton(glogRec *, GIconButtonResRec *);
    static GIconButton *NewGIconButton(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);

    // Whether a completed click goes on to the next state, after the last one to the first. At first true.
    void SetAutoIncrement(bool);
    // Stays the caller's and must outlive the button's clicks; null, as at first: none.
    void SetClickHandler(ClickHandler *);
    // Changes the icon that is to be drawn: gets and gives its distance from the icon of state 0. Null, as at
    // first: none.
    void SetIconStateHook(int (*)(int));
    // A number of the owner's; at first 0.
    void SetRefCon(int);
    int GetRefCon() const { return refCon; }

    // Shows the button as pressed or not, at once. Without effect when it is so already or disabled.
    void PushOrPopButton(bool pressed);

protected:
    GIconButton();
    // As for an icon pane, and takes commands and flags from the record.
    GIconButton *InitGIconButton(glogRec *, GIconButtonResRec &);

    // 0 outside of the icon's shape or while disabled. After tracking 1 if the record has "NotifyWindow",
    // else -1; -1 too when the mouse slid off a button that can be cancelled. One that cannot sends its
    // command at the press, and counts as clicked wherever the mouse is released.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    // What the tracking loop hands on to TransitionProc.
    struct Tracking {
        GIconButton *button;
        PaneWatch const *watch; // of the button
        short next;             // the state after a completed click
    };
    static void TransitionProc(void *tracking, TransitionTo);

    short NextState() const;
    short ShownIcon() const;

    short numDownStates;
    bool canCancel;    // the command is sent after the click instead of at the press
    bool notifyWindow; // a completed click gives 1 instead of -1
    CommandSpecifier command;
    CommandSpecifier optionCommand; // instead, with the option key
    bool pressed;                   // as it is shown
    bool autoIncrement;
    ClickHandler *clickHandler; // not owned; or null
    int (*iconStateHook)(int);  // or null
    int refCon;
};
