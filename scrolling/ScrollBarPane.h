// A scroll bar: two arrows, a trough and a thumb.
//
// A press on an arrow scrolls by a unit, one in the trough by a page, toward the mouse, and both go on while
// they are held; the thumb is dragged, and the wheel scrolls by units. The bar takes no keys.
//
// What can be scrolled, how far and in which steps is the client's business. The bar shows the position and
// range that the client gives it, and reports what the user does. It is live while there is something to
// scroll and room for it to work; a dead bar shows its trough without a thumb.
#pragma once
#include "frame/ScrollBarPane_Listener.h"
#include "host/CompoundPane.h"
#include "scrolling/SingleAxis.h"
#include "scrolling/sbarResRec.h"

class GlogStyleSheet;
class ScrollBarClient;

// Sends ScrollBarPane_Listener::ScrollBarPaneDying from its destructor.
class ScrollBarPane : public CompoundPane, public Provider<ScrollBarPane_Listener> {
public:
    enum Orientation { kHorizontal = 0, kVertical = 1 };       // of the way that the thumb moves
    enum ScrollDirection { kTowardStart = 0, kTowardEnd = 1 }; // up or left, down or right

    // Flags; other bits mean nothing.
    enum Flags {
        kHorizontalBar = 1,
        kBottomFollowsGlog = 2,  // stays `edgeV` above the glog's bottom; a horizontal bar is 16 high then
        kRightFollowsGlog = 4,   // stays `edgeH` left of the glog's right side; a vertical bar is 16 wide
        kEndBorderOutside = 32,  // the frame lies one pixel beyond the bounds at the bottom or right
        kStartBorderOutside = 64 // the same at the top or left
    };

    // Make a bar and attach it under the number 0 to the glog, which owns it from then on; null when memory
    // or glog is wanting. From a record, which is only read; from the keys "Flags", "BoundsRect" (all zero
    // when absent), "EdgeH" and "EdgeV" of a sheet, each cut to 16 bits. A sheet without an item fails the
    // assertion of its pointer.
    static ScrollBarPane *NewScrollBarPane(glogRec *, sbarResRec *);
    static ScrollBarPane *NewScrollBarPane(glogRec *, GlogStyleSheet *);

    // An empty bar. A null glog leaves it unattached.
    ScrollBarPane(glogRec *, short flags, short edgeH, short edgeV);
    ~ScrollBarPane() override;

    // Only stores: neither the old nor the new client hears of it, and the bar stays as it is until Set. The
    // client may be null: commands, and presses on a bar that is live all the same, come to nothing then.
    void SetClient(ScrollBarClient *);
    ScrollBarClient *GetClient() const { return client; }

    // Stores what is shown, asks the client for its thumb ratio, makes the bar live or dead and invalidates
    // it, also when nothing has changed. The position counts from 0 to the range; one beyond it shows the
    // thumb at the end. A range below 1 makes the bar dead.
    void Set(int position, int range);
    int GetPosition() const { return position; }                     // as it was set
    int GetRange() const { return range; }                           // as it was set
    bool IsHorizontal() const { return orientation == kHorizontal; } // by the flag
    // Whether the bar is too short to work.
    bool TooSmall();

    // Commands, as if the user had acted: they go to the client, if there is one. Forward is toward the end.
    void ScrollOneUnit(bool forward);
    void ScrollPage(bool forward);
    void ScrollToEnd(bool toEnd);

    // Lets the bar work in windows that are not active, from now on and for good.
    void SetActiveInBackground();

    // Overridden operations of panes.
    void Activate() override;
    void Deactivate() override;
    void Resize(Point delta) override;
    void SetBox(Rect *) override;
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;

protected:
    // A bar that is not set up: InitScrollBarPane comes next.
    ScrollBarPane();
    // Attaches the bar and its parts to the glog under the number and takes flags, edges and bounds from the
    // record. Does nothing without a glog.
    void InitScrollBarPane(glogRec *, sbarResRec *, short id);

    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    class ArrowPane;
    class ThumbPane;
    class ThumbScrollMouseTask;
    class PageScrollMouseTask;
    friend struct ScrollBarPaneMouseWheelHandler;

    // The looks, for derived bars; pixels.
    virtual int GetMinLength() const;      // of a bar that works
    virtual int GetScrollBarWidth() const; // across the bar
    virtual int GetFrameWidth() const;
    virtual int GetArrowPaneLength() const; // of an arrow along the bar
    virtual int GetMinThumbLength() const;
    // The first of an arrow's icons in family 1000.
    virtual short GetArrowIconID(Orientation, ScrollDirection) const;
    // Draw the frame behind the parts; the trough in the bounds, and the thumb if the bar is enabled.
    virtual void DrawBackground(OSRgn *updateRegion);
    virtual void DrawThumbArea(OSRgn *updateRegion, bool enabled, Rect bounds, Rect thumb);
    // Brings the bar to the bounds, and then to the edges of the glog that it follows.
    virtual void SetUpBounds(Rect);

    void AddParts();
    void ArrangeParts(GlogLayoutGroup &);
    SingleAxis Along() const;
    int BordersOutside() const;
    void DoEdgeCalc();
    void EnableParts(bool);
    // By units, negative toward the start; nothing without a client.
    void Scroll(int units);
    void ScrollOnce(bool byUnit, int times);
    // Calls of the client. The first announces one that will move it, as the other two do by themselves. All
    // answer whether bar and client are still there: the client may do away with either.
    bool Announce();
    bool TellStart(bool byUnit, int &amount, int &multiplier);
    bool TellScroll(int amount, int &multiplier);

    // A gesture's begin, its repeats, each of which comes to nothing before its time, and its end.
    void BeginScrolling(bool byPage, ScrollDirection);
    void ContinueScrolling(ScrollDirection);
    void EndScrolling();
    bool Step(int amount);

    Orientation orientation;
    short flags;
    short edgeH, edgeV;
    int position, range;
    ScrollBarClient *client; // not owned
    // Of the gesture that runs, or ran last.
    int scrollAmount;
    int scrollMultiplier;
    int repeatDelay; // ticks of 1/60 second
    long long nextRepeatTick;
    ArrowPane *upArrow, *downArrow; // subpanes, as is the thumb
    ThumbPane *thumb;
    bool enabled; // live
    bool activeInBackground;
};
