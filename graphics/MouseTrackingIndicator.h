// A marker that follows the mouse during a drag: where a row would be inserted, say.
#pragma once
#include "host/Geometry.h"

struct glogRec;

// Lies over the panes of a glog. Whoever follows the mouse moves it; the window's redraw calls MaybeDraw,
// since a move damages the old place and the new one. Rectangles are in the coordinates of the current pane,
// which has to be prepared for all but the reading calls.
class MouseTrackingIndicator {
public:
    // Hidden at first. The glog stays its own and is not looked at.
    explicit MouseTrackingIndicator(glogRec *);
    MouseTrackingIndicator(MouseTrackingIndicator const &);
    MouseTrackingIndicator &operator=(MouseTrackingIndicator const &);
    virtual ~MouseTrackingIndicator();

    // Draws the marker into the rectangle.
    virtual void Draw(Rect *) = 0;

    // Draws the marker at the rectangle, and invalidates that.
    void Show(Rect const &);
    // Invalidates where the marker is; the next redraw leaves it out.
    void Hide();
    // Invalidates where the marker is, draws it at the rectangle, and invalidates that too. A hidden one
    // comes up.
    void Move(Rect const &);
    // Draws the marker if it shows.
    void MaybeDraw();

    // What is read here: the glog, the last place, all zero at first, and whether the marker shows.
    glogRec *GetGlog() const { return glog; }
    Rect GetLocation() const { return location; }
    bool IsShowing() const { return showing; }

    // Whether the rectangles would meet if each were larger by 2 pixels on all sides.
    static bool Nearby(Rect, Rect);

private:
    glogRec *glog;
    bool showing;
    Rect location;
};
