#pragma once
#include <memory>
#include <vector>
#include "frame/Provider.h"
#include "host/Geometry.h"
#include "host/GlogLayout.h"
#include "host/HelpTagHelper.h"
#include "host/LocalizedStrings.h"
#include "host/Noncopyable.h"
#include "host/RCPtr.h"

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
class SelectStringPane;
class UIEvent;
struct glogRec;
struct PrintMessageRec;

class GlogPaneListener : public Dependent<GlogPaneListener> {};

class GlogPane : public Provider<GlogPaneListener>, public Noncopyable<void> {
public:
    GlogPane();

    virtual ~GlogPane();
    virtual void GetDrawOptimizationHints(DrawOptimizationHints &);
    virtual void Activate();
    virtual void Deactivate();
    virtual void SetActive();
    virtual void Resize(Point delta);
    virtual void ContainmentChanged();
    virtual void Select(bool select);
    virtual char Contains(Point);
    virtual char ContainsForHelp(Point);
    virtual void SetContainer(CompoundPane *);
    virtual void GetBox(Rect *out);
    virtual void GetMainDataBox(Rect *out);
    virtual Rect GetDrawRectangle();
    virtual bool CanSetBox() const;
    virtual void SetBox(Rect *);
    virtual void Offset(Point delta);
    virtual char Intersects(Rect *, char mode);
    virtual void ActivateColors();
    virtual void TrackMouse(MouseTask &, Point const &start);
    virtual void TrackMouse(OldMouseTask *, Point *);
    virtual void MultiTaskTrackMouse(std::vector<OldMouseTask *> &, Point *);
    virtual CustomEventHandler *CanHandleCustomEvent(UIEvent *);
    virtual bool DispatchCustomEvent(UIEvent *);
    virtual void GlogItemInit();
    virtual int Key(EventRecordAdapter *);
    virtual unsigned char Selectable();
    virtual int Tab(char direction);
    virtual char CanTabIn();
    virtual void Error();
    virtual void AutoResize(short dh, short dv);
    virtual unsigned char TryMouseControl(Point);
    virtual void Idle();
    virtual char CanDeselect();
    virtual void SetVisibility(unsigned char);
    virtual unsigned char GetVisibility();
    virtual void Show();
    virtual void Hide();
    virtual void CalcBox();
    virtual void Inval();
    virtual void Erase();
    virtual int ItemHeight();
    virtual int ItemWidth();
    virtual void LocalOffset(Point *);
    virtual void GlogOffset(Point *);
    virtual ConsoleControlSet *CastToConsoleControlSet();
    virtual SelectStringPane *CastToSelectStringPane();
    virtual ControlItem *CastToControlItem();
    virtual void PanePositionChanged();
    virtual char DispatchCursor(Point);
    virtual void SetHelpTag(LocalizedStrings::HelpTag const *);
    virtual bool GetHelpTagForPoint(Point, LocalizedStrings::HelpTag const *&, Rect &, enum OS::Help::Placement &, double &);
    virtual int GetID();
    virtual void SetID(int);
    virtual GlogPane *FindByID(int);
    virtual void ContainerChangedVisibility();
    virtual bool UsesNonVLHelpTagSystem() const;
    virtual void UpdateLayoutRect();
    virtual void CopyPaneAttributes(GlogPane *);
    virtual bool FindGophers(GopherInfo &);
    virtual bool Print(PrintMessageRec *);

protected:
    virtual char AdjustCursorAndDisplayHelp(Point);
    virtual int HandleClick(EventRecordAdapter *);
    virtual int HandleSecondaryButtonClick(EventRecordAdapter *);
    virtual bool BecomeGopherOnSelect();
    virtual void ConfirmChangesOnClickAway();
    virtual void PrepareDuringTrackMouse();
    virtual bool CanUpdateLayoutRect() const;
    virtual bool DoesLayoutNeedToBeUpdated() const;
    virtual void LayoutIsNowInvalid();
    virtual void DrawGuts(OSRgn *updateRegion) = 0;

private:
    virtual void RectOperation(int);
    virtual void SetLayoutRectHook();

public:

    GlogPane *GlogPaneInit(glogRec *glog, short id);
    void Prepare();
    static void ForceNextPrepare();
    Rect GetBounds() const;
    bool IsActive() const;
    bool IsSelected() const;
    void SetSelectedFlag(bool);
    bool IsInLayout() const;
    glogRec *GetGlog();
    void SetGlog(glogRec *);
    RCPtr<GlogLayoutRectItem> GetLayoutRect();
    int NumLayoutSubItems() const;
    HelpTagHelper *GetHelpTagHelper() const;
    void SetHelpTagHelper(std::auto_ptr<HelpTagHelper>);

protected:
    void UseLayoutSubItemMode();
    void AddLayoutSubItem(RCPtr<GlogLayoutRectItem>);

    glogRec *glog;
    CompoundPane *container;

private:
    friend class CompoundPane;
    friend struct glogRec;
    struct Rep;
    Rep *rep;
};
