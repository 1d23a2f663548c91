#pragma once
#include "host/GlogPane.h"

class CompoundPane : public GlogPane {
public:
    CompoundPane();
    virtual ~CompoundPane();

    virtual void Activate();
    virtual void Deactivate();
    virtual void SetActive();
    virtual void ContainmentChanged();
    virtual char Contains(Point);
    virtual void GetBox(Rect *);
    virtual char Intersects(Rect *, char);
    virtual bool DispatchCustomEvent(UIEvent *);
    virtual void AutoResize(short, short);
    virtual void SetVisibility(unsigned char);
    virtual void Erase();
    virtual void PanePositionChanged();
    virtual char DispatchCursor(Point);
    virtual GlogPane *FindByID(int);
    virtual void ContainerChangedVisibility();
    virtual void UpdateLayoutRect();
    virtual bool FindGophers(GopherInfo &);

    virtual void Flush();
    virtual void SelectSubpanes(char);
    virtual void DrawFrame(Rect *);
    virtual short Add(GlogPane *, short position);
    virtual short AddGuts(GlogPane *, short position);
    virtual void Del(short index);

    virtual void DelGuts(short index, bool keep);
protected:
    virtual void DrawBackgroundGuts(OSRgn *);

    virtual int HandleClick(EventRecordAdapter *);
    virtual int HandleSecondaryButtonClick(EventRecordAdapter *);
    virtual bool CanUpdateLayoutRect() const;
    virtual bool DoesLayoutNeedToBeUpdated() const;
    virtual void LayoutIsNowInvalid();
    virtual void DrawGuts(OSRgn *);
    void SetNoErase(char);
private:
    virtual void SetLayoutRectHook();

public:

    CompoundPane *CompoundPaneInit(glogRec *, short id);
    GlogPane *Get(short index) const;
    short Find(GlogPane *);
    short NumSubpanes() const;
    RCPtr<GlogLayoutGroup> GetLayout();
    void SetUseLayout(bool);
    void SetSizeToLayout(bool);
    bool UsesLayout() const { return usesLayout; }
    bool HasFrame() const;
private:
    bool usesLayout;
    struct CompoundRep;
    CompoundRep *compoundRep;
};
