// The base of every pane: a rectangle in a glog that draws itself and takes mouse and keyboard.
//
// A pane is made with new and attached by GlogPaneInit; from then on its container or glog owns it.
// GlogItemInit is called once the whole glog stands, and after that the pane lives on the calls of the host.
//
// Coordinates: a pane's box, the points of its events and what it draws are all in the coordinates of its
// container's content, or of the glog for a pane without container. Whole pixels; bottom and right edges are
// outside.
#pragma once
#include "frame/Provider.h"
#include "host/AutoPtr.h"
#include "host/Geometry.h"
#include "host/GlogLayout.h"
#include "host/HelpTagHelper.h"
#include "host/LocalizedStrings.h"
#include "host/Noncopyable.h"
#include "host/RCPtr.h"
#include <vector>

class CompoundPane;
class ConsoleControlSet;
class ControlItem;
struct CustomEventHandler;
class DrawOptimizationHints;
class EventRecordAdapter;
class GlogPane;
class GopherInfo;
class MouseTask;
class OldMouseTask;
class OSRgn;
class PaneAccess;
class PaneWatch;
class SelectStringPane;
class UIEvent;
struct glogRec;
struct PrintMessageRec;

// Dependents of any pane. Panes send them nothing; a pane that has news has a listener class of its own.
class GlogPaneListener : public Dependent<GlogPaneListener> {};

// The order of bases and of virtual operations is fixed.
class GlogPane : public Provider<GlogPaneListener>, public Noncopyable<void> {
public:
    // Not attached: the box is empty, the pane is visible, neither active nor selected, and its number is 0.
    GlogPane();

    // Takes the pane out of its container and glog and deletes its help tag helper.
    virtual ~GlogPane();
    // May fill in hints for the host; by default does nothing.
    virtual void GetDrawOptimizationHints(DrawOptimizationHints &);
    // The window came to the front or left it: sets or clears the active flag.
    virtual void Activate();
    virtual void Deactivate();
    // Takes the active flag from the window once more.
    virtual void SetActive();
    // The window or container has grown by the delta. By default a top-level pane takes it along in the
    // directions in which its layout item has a share of growth; panes that fill their container follow in
    // their own ways.
    virtual void Resize(Point delta);
    // The pane came to another container or glog.
    virtual void ContainmentChanged();
    // Gives the pane the keyboard or takes it away: sets or clears the selected flag. With true, and if
    // BecomeGopherOnSelect answers true, the pane becomes the current item of its glog, and the one before
    // gets Select(false) if it was selected. With false the current item stays what it is.
    virtual void Select(bool select);
    // Whether the point is in the pane, for clicks; and for help tags.
    virtual char Contains(Point);
    virtual char ContainsForHelp(Point);
    // Called by the container when the pane is added to it.
    virtual void SetContainer(CompoundPane *);
    // Writes the bounds. The normal way to ask for them; panes that have only parts calculate it.
    virtual void GetBox(Rect *out);
    // Writes the bounds of the part that holds the data; by default all.
    virtual void GetMainDataBox(Rect *out);
    // Where the pane is drawn: the rectangle of its layout when it is in one, else GetBox.
    virtual Rect GetDrawRectangle();
    // Whether SetBox is any use. By default true unless the pane is in a layout.
    virtual bool CanSetBox() const;
    // Moves and resizes the pane, without drawing or invalidating. Calls PanePositionChanged when the box has
    // changed.
    virtual void SetBox(Rect *);
    // Moves the pane, right and down when positive.
    virtual void Offset(Point delta);
    // Whether the pane shares a pixel with the rectangle. The mode means nothing to the default.
    virtual char Intersects(Rect *, char mode);
    // Sets the port's colours for the pane's active flag; by default black on white.
    virtual void ActivateColors();
    // Runs the task until the mouse button is released. The point is where it went down, in pane coordinates.
    // Other windows and timers go on meanwhile. A pane that is deleted meanwhile ends its task without
    // MouseTaskEnd.
    virtual void TrackMouse(MouseTask &, Point const &start);
    // Older forms, for tasks that nothing makes any more.
    virtual void TrackMouse(OldMouseTask *, Point *);
    virtual void MultiTaskTrackMouse(std::vector<OldMouseTask *> &, Point *);
    // A new handler for an event beyond mouse button and key, such as the wheel; null (by default) when the
    // pane has no use for it. The host owns the handler; see host/CustomEventHandler.h.
    virtual CustomEventHandler *CanHandleCustomEvent(UIEvent *);
    // Asks for a handler and runs it; true when the event has been used up.
    virtual bool DispatchCustomEvent(UIEvent *);
    // Called once, when the whole glog stands.
    virtual void GlogItemInit();
    // A key for the current item. 0: not used; -1: used; 2: used, and the pane counts as hit. By default 0.
    virtual int Key(EventRecordAdapter *);
    // Whether the pane may become the current item. By default false.
    virtual unsigned char Selectable();
    // The tab key has come to this pane; the direction is 1 forward, -1 backward. 0: the pane took the
    // selection; 1: it gave the selection up, and the next pane is asked; 3: it cannot take it. By default 3.
    virtual int Tab(char direction);
    // Whether the tab key may select the pane. By default false.
    virtual char CanTabIn();
    // The host signals that what the pane asked for is not possible. By default nothing.
    virtual void Error();
    // The container has grown by these; follows by the rules of its edges. By default nothing.
    virtual void AutoResize(short dh, short dv);
    // A last chance to take a press of the mouse that no pane wanted. By default false.
    virtual unsigned char TryMouseControl(Point);
    // Called each time the application is about to wait, for visible panes at the top level of the active
    // glog. By default nothing.
    virtual void Idle();
    // Whether the current item may lose the keyboard. By default true.
    virtual char CanDeselect();
    // Sets the pane's own visibility flag. Draws and invalidates nothing.
    virtual void SetVisibility(unsigned char);
    // Whether the pane may draw: its own flag and those of all its containers are set. The window may still
    // be hidden.
    virtual unsigned char GetVisibility();
    // Sets the flag and invalidates what appears or disappears.
    virtual void Show();
    virtual void Hide();
    // Takes the bounds anew from the content. By default nothing; called after changes that alter the size.
    virtual void CalcBox();
    // Marks the whole pane to be drawn at the next update.
    virtual void Inval();
    // Fills the pane's rectangle with the background at once.
    virtual void Erase();
    // The bounds' height and width in pixels.
    virtual int ItemHeight();
    virtual int ItemWidth();
    // Turns a point of the pane's coordinates into one of its content: subtracts the top left of the box.
    // Scrolling containers add how far they are scrolled.
    virtual void LocalOffset(Point *);
    // Turns a point of the pane's coordinates into one of the glog.
    virtual void GlogOffset(Point *);
    // The pane as one of these classes; null when it is none.
    virtual ConsoleControlSet *CastToConsoleControlSet();
    virtual SelectStringPane *CastToSelectStringPane();
    virtual ControlItem *CastToControlItem();
    // The pane's place in the window has changed: by its box, by being added to a container, by a container
    // that has moved or scrolled, or by the layout. Called once also before GlogItemInit.
    virtual void PanePositionChanged();
    // Sets the cursor for the point; true when the pane has decided on one. By default asks
    // AdjustCursorAndDisplayHelp for points inside.
    virtual char DispatchCursor(Point);
    // Gives the whole pane one help tag, by a default helper; null removes it. The tag stays the host's.
    virtual void SetHelpTag(LocalizedStrings::HelpTag const *);
    // Asks the pane's helper; see HelpTagHelper::GetHelpTag. False without a helper.
    virtual bool GetHelpTagForPoint(Point, LocalizedStrings::HelpTag const *&, Rect &,
                                    enum OS::Help::Placement &, double &);
    // The pane's number in its glog.
    virtual int GetID();
    virtual void SetID(int);
    // This pane or the subpane that has the number; null when there is none.
    virtual GlogPane *FindByID(int);
    // A container of the pane was shown or hidden. By default nothing.
    virtual void ContainerChangedVisibility();
    // Whether help tags of the pane come from a helper instead of the tag table. By default true when there
    // is a helper.
    virtual bool UsesNonVLHelpTagSystem() const;
    // Takes the bounds from the place of the layout item.
    virtual void UpdateLayoutRect();
    // Takes over bounds, visibility and number of the other pane.
    virtual void CopyPaneAttributes(GlogPane *);
    // Looks for the pane that typing goes to. By default false.
    virtual bool FindGophers(GopherInfo &);
    // Prints one step; false (by default) when the pane does not print.
    virtual bool Print(PrintMessageRec *);

protected:
    // Sets the cursor for a point in the pane, by default the arrow; true when it has.
    virtual char AdjustCursorAndDisplayHelp(Point);
    // A press of the primary mouse button in the pane. 0: not taken; -1: handled, nothing to report;
    // positive: the pane was hit, 1 for a single button, otherwise the index of the part plus 1. By default
    // 0.
    virtual int HandleClick(EventRecordAdapter *);
    // The same for the secondary button.
    virtual int HandleSecondaryButtonClick(EventRecordAdapter *);
    // Whether Select(true) makes the pane the current item of its glog. By default false.
    virtual bool BecomeGopherOnSelect();
    // The user has clicked elsewhere: take an unfinished edit as final. By default nothing.
    virtual void ConfirmChangesOnClickAway();
    // Called before each step of a mouse task. By default Prepare.
    virtual void PrepareDuringTrackMouse();
    // Whether a change of the box makes the layout invalid, by default not; whether the layout has to be
    // settled.
    virtual bool CanUpdateLayoutRect() const;
    virtual bool DoesLayoutNeedToBeUpdated() const;
    // The layout has to be settled before the next drawing.
    virtual void LayoutIsNowInvalid();
    // Draws what lies in the region, in the pane's coordinates; null: everything. The host has prepared port,
    // origin and clip and puts the clip back afterwards.
    virtual void DrawGuts(OSRgn *updateRegion) = 0;

private:
    // Hooks of the host.
    virtual void RectOperation(int);
    virtual void SetLayoutRectHook();

public:
    // Attaches the pane to the glog under the number, at the top level, gives it a layout item, and takes its
    // box from the glog's resource if that has one for the number. Answers the pane, or null, and changes
    // nothing, when the glog is null.
    GlogPane *GlogPaneInit(glogRec *glog, short id);
    // Makes the pane's port, origin and clip current, for drawing outside of DrawGuts. During an update the
    // clip stays within what is being updated. Without effect for a pane in no glog.
    void Prepare();
    // The next Prepare has to do its whole work, whatever seems unchanged: drawing has left the port in
    // another state.
    static void ForceNextPrepare();
    // The stored bounds.
    Rect GetBounds() const;
    // The flags that Activate and Select set.
    bool IsActive() const;
    bool IsSelected() const;
    // Sets the selected flag and does nothing else.
    void SetSelectedFlag(bool);
    // Whether the layout decides on the bounds.
    bool IsInLayout() const;
    // The glog that the pane is attached to, or null.
    glogRec *GetGlog();
    // Attaches the pane to another glog; null detaches it.
    void SetGlog(glogRec *);
    // The pane's layout item; never null once the pane is attached.
    RCPtr<GlogLayoutRectItem> GetLayoutRect();
    // How many parts have a layout item: the index of the next one.
    int NumLayoutSubItems() const;
    // The pane's helper, or null. Stays the pane's.
    HelpTagHelper *GetHelpTagHelper() const;
    // Takes the helper over and deletes the one before; an empty pointer only deletes.
    void SetHelpTagHelper(AutoPtr<HelpTagHelper>);

protected:
    // Called in the constructor by panes whose parts have layout items of their own.
    void UseLayoutSubItemMode();
    // Appends the item of a part.
    void AddLayoutSubItem(RCPtr<GlogLayoutRectItem>);
    // The pane has moved its parts together with its box: their items move by the same, right and down when
    // positive, so that a later layout finds them where they lie in the box.
    void OffsetLayoutSubItems(Point delta);

    // Null while the pane is in no glog; in no container.
    glogRec *glog;
    CompoundPane *container;

private:
    friend class CompoundPane;
    friend struct glogRec;
    friend class PaneAccess;
    friend class PaneWatch;
    struct Rep;
    Rep *rep;
};
