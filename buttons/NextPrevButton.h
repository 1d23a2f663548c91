// Two small buttons one above the other in one pane.
//
// While the mouse is held down, the half that it is over is shown as pressed; at the release the subclass is
// told which half that was.
#pragma once
#include "host/GlogPane.h"

class NextPrevButton : public GlogPane {
public:
    // Attaches the button under the number 0, to the glog that owns it from then on. The owner sets the box.
    explicit NextPrevButton(glogRec *);

    // The mouse was released over the half: 1 the upper, 2 the lower, 0 none of them. The button may be
    // deleted here.
    virtual void NextPrevClicked(int which) = 0;

protected:
    // Tracks the mouse, whatever the answer to NextPrevClicked; always -1.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    class MouseTracker;

    int icon; // as it is shown
};
