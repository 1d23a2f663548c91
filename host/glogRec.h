// A glog: a window with panes in it.
#pragma once
#include "host/Geometry.h"
#include "host/OSWindow.h"
class GlogPane;
class GlogStyleSheet;
class ContainerGlog; // a glog that holds others; null means none

// Owns its panes and its window. Made by the host, disposed of by DisposeGlog.
struct glogRec : public TarnOSWindow::OSWindow {
    // The glog's own sheet, which stays its own; null when it was made without one, and panes take its values
    // as 0.
    virtual GlogStyleSheet *GetStyleSheet() const = 0;
    // Moves the keyboard to the pane, or to none for null: Select(false) goes to the pane that had it, if
    // that is still selected, then the pane becomes the current item, then Select(true) goes to it unless it
    // is selected already.
    virtual void SetCurItem(GlogPane *) = 0;
    // The pane that keys go to, or null.
    virtual GlogPane *GetCurItem() const = 0;
    // Limits of the content size in pixels for resizing by the user; 0 means no limit.
    virtual void SetMinSize(int width, int height) = 0;
    virtual void SetMaxSize(int width, int height) = 0;
    // Whether the glog is part of another one and has no window of its own.
    virtual bool IsContained() = 0;
    // Whether the press that is being handled is the one that brought the window to the front.
    virtual bool DidActivateWithCurrentMouseDown() const = 0;
};

// Redraws at once what is invalid, and shows it. Without effect for null and while the glog is hidden.
void UpdateGlog(glogRec *);
// The content's size in pixels. Here and below the glog must not be null.
short GetGlogWidth(glogRec *);
short GetGlogHeight(glogRec *);

// The pane of the number, also inside containers; where no pane has it, the top-level pane at that place,
// from 1 in order of attachment. Null when there is neither. The pane stays the glog's.
GlogPane *GetGlogItem(glogRec *, short id);
// How many top-level items there are.
short CountGlogItems(glogRec *);
// Makes the glog's port current, with its origin at the top left of the content.
void SetPortToGlog(glogRec *);
enum ShowOrHideEnum { kShowGlog = 0, kHideGlog = 1 }; // for ShowGlog
// Shows the glog in front of the others, or hides it.
void ShowGlog(glogRec *, ShowOrHideEnum);

// Moves and resizes the window so that its content takes the rectangle, in screen coordinates. The flag asks
// for a redraw at once.
void PositionGlog(glogRec *, Rect *, bool);
// Closes the window and deletes the panes; the pointer is invalid afterwards. May be called from inside one
// of its panes: what is still running ends first.
void DisposeGlog(glogRec *);
// Whether the glog cannot be used: it is null, or has been disposed of, however long ago.
bool GlogError(glogRec *);

namespace LowLevelGlogOpening {

// Opens the glog of a window resource, invisible at first: the dialog windows/NUMBER.xml in one of the
// resources' directories, for programs that have the library of dialogs. Null when there is no such resource
// or it cannot be opened. The flag is false and the container null.
glogRec *NewGlog(short resource, TarnOSWindow::OSWindow::SendBehindArg, bool, ContainerGlog *);
} // namespace LowLevelGlogOpening
