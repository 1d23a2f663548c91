#pragma once
#include "host/Geometry.h"
#include "host/RCPtr.h"
#include "host/UString.h"
class GlogPane;
class GlogStyleSheet;

class GlogLayoutItem : public RCObject {
public:

    enum Attribute { kInsetTop = 1, kInsetLeft = 2, kWidth = 3, kHeight = 4, kDirection = 13 };

    enum CoordinateType { kPixels = 1 };

    virtual void SetAttribute(Attribute, int value, CoordinateType, UString const &);

    virtual void SetAttributeFromString(Attribute, UString const &);
    Rect GetBorderRect();
    char const *GetName() const;
protected:
    GlogLayoutItem();
    virtual ~GlogLayoutItem();
private:
    struct Rep;
    Rep *rep;
};

class GlogLayoutRectItem : public GlogLayoutItem {
public:
    Rect GetItemRect();

    void ReadLayoutProperties(int paneType, GlogStyleSheet *);
};

class GlogLayoutGroup : public GlogLayoutItem {
public:
    explicit GlogLayoutGroup(bool vertical);

    void MoveItem(RCPtr<GlogLayoutItem> const &, int index);

    void ReplaceItem(RCPtr<GlogLayoutItem> const &, RCPtr<GlogLayoutItem> const &);
    RCPtr<GlogLayoutItem> FindItemByID(int id);
    RCPtr<GlogLayoutItem> FindItemByName(char const *name);
    GlogStyleSheet *GetStyleSheet() const;
    void SetStyleSheet(GlogStyleSheet *);
};

namespace GlogLayout {

RCPtr<GlogLayoutRectItem> MakeRectItem(Rect, int id, int index, char const *name);

RCPtr<GlogLayoutRectItem> MakeRectItem(Rect inner, Rect outer, int id, int index, char const *name);
}

class WithPerformLayoutRectUpdate {
public:
    explicit WithPerformLayoutRectUpdate(GlogPane *);
    ~WithPerformLayoutRectUpdate();
private:
    WithPerformLayoutRectUpdate(WithPerformLayoutRectUpdate const &);
    WithPerformLayoutRectUpdate &operator=(WithPerformLayoutRectUpdate const &);
    GlogPane *pane;
};
