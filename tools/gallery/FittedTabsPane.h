// A row of tabs that is fitted into a width, which a scroll bar sets as a slider does; a label tells the
// width.
#pragma once
#include "host/PaneWatch.h"
#include "scrolling/ScrollBarClient.h"
#include "tabs/TabPane.h"

class FittedTabsPane : public TabPane, private ScrollBarClient {
public:
    // Makes a row and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The keys are "BoundsRect", the widest place of the row; "Num", the number of the scroll bar;
    // and "TextID", the number of the label.
    static FittedTabsPane *NewFittedTabsPane(glogRec *, GlogStyleSheet *);
    ~FittedTabsPane() override;

    void GlogItemInit() override;

private:
    FittedTabsPane(glogRec *, Rect const &, short barID, short labelID);
    void Fit(int width);

    // What the scroll bar asks and tells; positions count from the least width.
    int GetMaxScrollValue(ScrollBarPane *) override;
    void ScrollTo(ScrollBarPane *, int position) override;
    double GetThumbRatio(ScrollBarPane *) override;
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override;

    Rect const widest;
    short const barID, labelID;
    ScrollBarPane *bar;
    PaneWatch barWatch;
    int width;
};
