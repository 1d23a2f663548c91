// A grid that scrolls along its axis.
//
// The wheel scrolls, and so does a scroll bar, which is not the grid's and shows the position. The grid takes
// no clicks of its own and no keys. What has scrolled a little is moved as pixels, and only what comes into
// view is drawn.
#pragma once
#include "host/PanePtr.h"
#include "scrolling/Grid.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include <vector>

class ScrollGrid : public Grid, public ScrollBarClient, public ScrollBarPane_Listener {
public:
    // An empty column under the number, with a bar or null. A null glog leaves it unattached.
    ScrollGrid(glogRec *, short id, ScrollBarPane *);
    // Its bar has no client from then on.
    ~ScrollGrid() override;

    // Go to the nearest position that there is, in pixels from 0, or move by a distance, toward the end when
    // positive; see ScrollGuts.
    virtual void ScrollTo(int position);
    virtual int Scroll(int distance);
    // Scrolls no further than is needed to bring the members into view, or the start of them where they are
    // more than the view holds.
    virtual void RevealSubpanes(std::vector<GlogPane *> const &);
    // The largest position.
    virtual int GetMaxScroll();
    // Pixels of a step: a sixteenth of the box, which counts as 16 at least, or fifteen sixteenths.
    virtual int ScrollDelta(bool byUnit);
    // Goes to the nearest position that there is. If that is another one, tells the members that they have
    // moved, moves or invalidates what is seen and updates the glog at once. Then shows the position on the
    // bar, if it has changed or SetAlwaysUpdateScrollbar says so. How far the grid has moved.
    virtual int ScrollGuts(int position);
    // The grid's size or its members' has changed: brings the position back into range and shows it.
    virtual void UpdateScrollInfo();
    // Whether a move by the distance is worth moving pixels: by less than half of the box, while the glog's
    // port is the current one.
    virtual char UseScrollRect(int distance);
    // The rectangle whose pixels move: the box.
    virtual void GetScrollBox(Rect *);

    // Whether there is something to scroll to in the direction, by its sign.
    bool CanScroll(int direction);
    // RevealSubpanes of one member.
    void ScrollTillVisible(GlogPane *);
    int GetScrollOffset() { return scrollOffset; } // the position
    // Stores the position and tells the members that they have moved. Draws and checks nothing, and leaves
    // the bar alone.
    void SetScrollOffset(int);

    // Takes a bar as its own, or null, shows the position on it, and leaves the former one without a client.
    void SetScrollbar(ScrollBarPane *);
    ScrollBarPane *GetTheScrollbar() { return scrollbar.Get(); }
    // The bar's box; without a bar these do nothing.
    void GetScrollbarBounds(Rect *);
    void SetScrollbarBounds(Rect *);
    // Whether the bar is told of the position also when it has not changed. At first true.
    void SetAlwaysUpdateScrollbar(bool always) { alwaysUpdateScrollbar = always; }
    // The grid follows another one, whose owner scrolls it: from now on, for good, it leaves its bar alone
    // and does not update the glog.
    void SetSlaved() { slaved = true; }
    bool IsSlaved() const { return slaved; }

    // Kept for those who call them: scrolling goes on as if they did not exist. What is set is stored; what
    // is asked is always false.
    bool GetSupressGridUpdate() { return false; }
    void SetSupressGridUpdate(bool);
    bool GetSupressSBarUpdate() { return false; }
    void SetSupressSBarUpdate(bool);

    // Overridden operations of panes and grids.
    void Resize(Point delta) override;
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;
    void AutoResize(short dh, short dv) override;
    void LocalOffset(Point *) override;
    short Add(GlogPane *, short position) override;
    void Del(short index) override;

    // Overridden operations of the client of a bar.
    int GetMaxScrollValue(ScrollBarPane *) override;
    void ScrollTo(ScrollBarPane *, int position) override;
    double GetThumbRatio(ScrollBarPane *) override;
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
    // Raises the multiplier up to 4: a bar that is held down is faster and faster toward the end.
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override;

protected:
    // The axis that the members follow each other along.
    SingleAxis Along() const { return SingleAxis(IsVerticalGrid()); }
    // Of the grid itself and of all members together; pixels.
    int BoxLength(SingleAxis);
    short ListLength(SingleAxis);
    // The largest position along the axis.
    int MaxScroll(SingleAxis);
    // Moves the pixels of the rectangle toward the start of the axis.
    static void MovePixels(Rect const &, SingleAxis, int distance);
    // What a bar is given as its range: a dead one has less than 1.
    static int BarRange(int greatest) { return greatest == 0 ? -1 : greatest; }

private:
    friend struct ScrollGridMouseWheelHandler;

    void ScrollBarPaneDying() override;
    void LetGoOfScrollbar();
    void InvalidateUncovered(Rect const &oldBox);

    int scrollOffset; // pixels along the axis
    bool supressGridUpdate;
    bool supressSBarUpdate;
    bool alwaysUpdateScrollbar;
    bool slaved;
    PanePtr<ScrollBarPane> scrollbar; // not owned
};

// Set a flag of the grid for a block, and put back what it was, unless the grid has gone.
class WithScrollGridSuppressGridUpdate {
public:
    WithScrollGridSuppressGridUpdate(ScrollGrid *, bool suppress);
    ~WithScrollGridSuppressGridUpdate();
    WithScrollGridSuppressGridUpdate(WithScrollGridSuppressGridUpdate const &) = delete;
    WithScrollGridSuppressGridUpdate &operator=(WithScrollGridSuppressGridUpdate const &) = delete;

private:
    PanePtr<ScrollGrid> grid;
    bool before;
};

// The same for the other flag.
class WithScrollGridSuppressSBarUpdate {
public:
    WithScrollGridSuppressSBarUpdate(ScrollGrid *, bool suppress);
    ~WithScrollGridSuppressSBarUpdate();
    WithScrollGridSuppressSBarUpdate(WithScrollGridSuppressSBarUpdate const &) = delete;
    WithScrollGridSuppressSBarUpdate &operator=(WithScrollGridSuppressSBarUpdate const &) = delete;

private:
    PanePtr<ScrollGrid> grid;
    bool before;
};

// Both flags.
class WithScrollGridSuppressUpdates {
public:
    WithScrollGridSuppressUpdates(ScrollGrid *, bool suppress);

private:
    WithScrollGridSuppressGridUpdate gridUpdate;
    WithScrollGridSuppressSBarUpdate barUpdate;
};
