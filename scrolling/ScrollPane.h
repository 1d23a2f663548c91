// A pane with a virtual area that is larger than its box.
//
// Its subpanes lie in the coordinates of the virtual area. A horizontal and a vertical scroll bar, which are
// not the pane's, may show and move the part that is seen; with a bar the wheel moves it along that axis too.
// The pane takes no clicks of its own and no keys.
#pragma once
#include "host/CompoundPane.h"
#include "host/PanePtr.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"

class ScrollPane : public CompoundPane, public ScrollBarClient {
public:
    // An empty box, without bars, under the number 0. A null glog leaves the pane unattached.
    explicit ScrollPane(glogRec *);
    // Its bars have no client from then on.
    ~ScrollPane() override;

    // The largest positions, in pixels from 0.
    virtual int GetMaxHScrollValue();
    virtual int GetMaxVScrollValue();
    // Pixels of one arrow step: 10.
    virtual int GetScrollDelta() const;
    // Go to the nearest position that there is, show it on the bar of the axis, if there is one, invalidate
    // the pane and tell it and its subpanes of their new place; also when nothing has changed.
    virtual void SetHScrollPos(int);
    virtual void SetVScrollPos(int);

    // Takes a bar as its own for the axis, or null, and leaves the former one without a client. The bar hears
    // of a position at the next SetHScrollPos or SetVScrollPos.
    void SetHScrollBar(ScrollBarPane *);
    void SetVScrollBar(ScrollBarPane *);
    // The virtual area's size in pixels, never below that of the box. When it changes the middle of what is
    // seen stays in the middle; a view at the very start or end stays there.
    void SetVirtualHeight(int);
    void SetVirtualWidth(int);
    // Move by the pixels, toward the end when positive; nothing on an axis without a bar.
    void HScroll(int delta);
    void VScroll(int delta);

    // Overridden operations of panes.
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;
    void LocalOffset(Point *) override;
    // Keeps the virtual area at least as large as the box, and both positions within what is possible.
    void SetBox(Rect *) override;

    // Overridden operations of the client of a bar. A bar that is neither of the pane's reaches the vertical
    // position by ScrollTo and Scroll, and gets 0 from what asks.
    int GetMaxScrollValue(ScrollBarPane *) override;
    void ScrollTo(ScrollBarPane *, int position) override;
    double GetThumbRatio(ScrollBarPane *) override;
    // By unit GetScrollDelta, otherwise nine tenths of the box along the bar.
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override;

private:
    friend struct ScrollPaneMouseWheelHandler;

    bool IsHScrollBar(ScrollBarPane const *) const;
    bool IsVScrollBar(ScrollBarPane const *) const;
    bool TurnWheel(int axis, int delta);

    int virtualHeight, virtualWidth;
    PanePtr<ScrollBarPane> hScrollBar, vScrollBar;
    int hScrollPos, vScrollPos;
};
