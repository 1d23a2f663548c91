// A pane that holds other panes.
#pragma once
#include "host/GlogPane.h"

// Owns its subpanes, which lie from the first at the bottom to the last on top. Their boxes count from the
// top left of its content. With SetUseLayout they are placed by its layout group instead of by their boxes.
//
// Resize, CalcBox, SetBox, Select, LocalOffset, Key and Idle stay those of GlogPane: subpanes do not hear of
// them.
class CompoundPane : public GlogPane {
public:
    // Not attached, without subpanes.
    CompoundPane();
    // Deletes the subpanes.
    virtual ~CompoundPane();

    // These go on to the subpanes.
    virtual void Activate();
    virtual void Deactivate();
    virtual void SetActive();
    virtual void ContainmentChanged();
    virtual char Contains(Point);
    virtual void GetBox(Rect *);
    virtual char Intersects(Rect *, char);
    // Offers the event to the subpanes first, from the topmost.
    virtual bool DispatchCustomEvent(UIEvent *);
    virtual void AutoResize(short, short);
    virtual void SetVisibility(unsigned char);
    virtual void Erase();
    virtual void PanePositionChanged();
    virtual char DispatchCursor(Point);
    // Looks through the subpanes as well.
    virtual GlogPane *FindByID(int);
    virtual void ContainerChangedVisibility();
    virtual void UpdateLayoutRect();
    virtual bool FindGophers(GopherInfo &);

    // Updates the glog at once.
    virtual void Flush();
    // Calls Select of each subpane.
    virtual void SelectSubpanes(char);
    // Draws the frame of a pane that has one.
    virtual void DrawFrame(Rect *);
    // Takes the pane over, out of its former container, and puts it at the position, from 0; -1: on top. Its
    // layout item joins the layout group. Calls AddGuts, then SetContainer, ContainmentChanged,
    // PanePositionChanged and SetActive of the subpane, and invalidates it. The index, or a negative number
    // when the pane is null.
    virtual short Add(GlogPane *, short position);
    // The list part of Add. Subclasses that react to an addition override this one.
    virtual short AddGuts(GlogPane *, short position);
    // Invalidates the subpane, takes it out and deletes it. An index that does not exist has no effect.
    virtual void Del(short index);

    // Takes the subpane out; true keeps it alive for the caller, false deletes it.
    virtual void DelGuts(short index, bool keep);

protected:
    // Draws what lies behind the subpanes; by default nothing.
    virtual void DrawBackgroundGuts(OSRgn *);

    // Gives the event, with its point in the content's coordinates, to the topmost visible subpane that
    // contains it, and answers what that answers; 0 when there is none.
    virtual int HandleClick(EventRecordAdapter *);
    virtual int HandleSecondaryButtonClick(EventRecordAdapter *);
    virtual bool CanUpdateLayoutRect() const;
    virtual bool DoesLayoutNeedToBeUpdated() const;
    virtual void LayoutIsNowInvalid();
    // Erases, unless SetNoErase says not to, draws the background, then the subpanes that meet the region.
    virtual void DrawGuts(OSRgn *);
    // For subclasses whose background covers everything.
    void SetNoErase(char);

private:
    virtual void SetLayoutRectHook();

public:
    // As GlogPaneInit, and gives the pane a layout group.
    CompoundPane *CompoundPaneInit(glogRec *, short id);
    // The subpane at the index, from 0; null when there is none.
    GlogPane *Get(short index) const;
    // The index of the subpane; negative when it is none of these.
    short Find(GlogPane *);
    short NumSubpanes() const;
    // The group that holds the layout items of the subpanes; never null once the pane is attached.
    RCPtr<GlogLayoutGroup> GetLayout();
    // Whether the group places the subpanes. Makes the layout invalid.
    void SetUseLayout(bool);
    // Whether the pane's own size follows the natural size of its group.
    void SetSizeToLayout(bool);
    // Whether SetUseLayout(true) was called.
    bool UsesLayout() const { return usesLayout; }
    // Whether the pane draws a frame of one pixel inside its box. By default false.
    bool HasFrame() const;

private:
    friend class PaneAccess;
    bool usesLayout;
    struct CompoundRep;
    CompoundRep *compoundRep;
};
