// A grid that scrolls along its axis and across it.
//
// The wheel scrolls in the direction that it is turned. A second bar may show and move the position across.
#pragma once
#include "host/PanePtr.h"
#include "scrolling/ScrollGrid.h"

// The second bar is served through a small object, because an object can be the client of bars only once.
class ScrollGridPlus : public ScrollGrid {
public:
    // The bars may be null.
    ScrollGridPlus(glogRec *, short id, ScrollBarPane *main, ScrollBarPane *lateral);
    // Its bars have no client from then on.
    ~ScrollGridPlus() override;

    // As ScrollTo and Scroll, across the axis.
    virtual void LateralScrollTo(int position);
    virtual void LateralScroll(int distance);
    // Pixels of a step: 1, or four fifths of the box across the axis.
    virtual int LateralScrollDelta(char byUnit);
    virtual int GetMaxLateralScroll(); // the largest position
    // Goes to the nearest position that there is. If that is another one, tells the members that they have
    // moved, moves what is seen and updates the glog at once. Then shows the position on the bar, also when
    // nothing has changed.
    virtual void LateralScrollGuts(int position);

    // Takes a bar as its own across the axis, or null, and leaves the former one without a client. The bar
    // hears of a position at the next change.
    void SetLateralScrollbar(ScrollBarPane *);
    int GetLateralScrollOffset() { return lateralScrollOffset; } // the position
    // Stores the position and tells the members that they have moved. Draws and checks nothing, and leaves
    // the bar alone.
    void SetLateralScrollOffset(int);
    // Whether the view across the axis keeps its distance from the end when the members' size changes. At
    // first false.
    void SetStickToEnd(bool stick) { stickToEnd = stick; }

    // Overridden operations.
    void UpdateScrollInfo() override;
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;
    void LocalOffset(Point *) override;

private:
    class Proxy : public ScrollBarClient {
    public:
        explicit Proxy(ScrollGridPlus *grid)
            : owner(grid) {}

        int GetMaxScrollValue(ScrollBarPane *) override;
        void ScrollTo(ScrollBarPane *, int position) override;
        double GetThumbRatio(ScrollBarPane *) override;
        void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
        // The multiplier stays as it is, unlike along the axis.
        void Scroll(ScrollBarPane *, int &amount, int &multiplier) override;

    private:
        ScrollGridPlus *owner;
    };

    SingleAxis Across() const { return Along().Across(); }
    void KeepDistanceFromEnd(int greatest);

    int lateralScrollOffset; // pixels across the axis
    int maxLateralScroll;    // the largest when it was last asked for
    PanePtr<ScrollBarPane> lateralScrollbar;
    Proxy proxy;
    bool stickToEnd;
};
