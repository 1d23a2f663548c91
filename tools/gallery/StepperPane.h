// Steps a number up and down with a pair of small buttons; a label shows the number.
//
// A click on the upper half adds one, a click on the lower half takes one away. The pane tells those who
// listen to its activity before it takes a click, as every pane does whose use turns on a button.
#pragma once
#include "buttons/NextPrevButton.h"
#include "frame/AutoSetActivityListener.h"

class ButtonGroupPane;
class GlogStyleSheet;

class StepperPane : public Provider<AutoSetActivityListener>, public NextPrevButton {
public:
    // Makes a stepper and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "Origin"; "TextID", the number of the label; "Num", the number to begin with;
    // and "CmdClassID" and "CmdID", the group, and the button of it, that using the stepper turns on.
    static StepperPane *NewStepperPane(glogRec *, GlogStyleSheet *);

    void NextPrevClicked(int which) override;

protected:
    int HandleClick(EventRecordAdapter *) override;

private:
    StepperPane(glogRec *, GlogStyleSheet *);
    void BindToGroup();

    int labelID;
    int number;
    int groupID;     // 0: none
    int groupButton; // which button of the group
    bool bound;      // the group listens
};
