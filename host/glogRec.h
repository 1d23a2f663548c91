#pragma once
#include "host/Geometry.h"
#include "host/OSWindow.h"
class GlogPane;
class GlogStyleSheet;
class ContainerGlog;

struct glogRec : public TarnOSWindow::OSWindow {
    virtual GlogStyleSheet *GetStyleSheet() const = 0;
    virtual void SetCurItem(GlogPane *) = 0;
    virtual GlogPane *GetCurItem() const = 0;
    virtual void SetMinSize(int width, int height) = 0;
    virtual void SetMaxSize(int width, int height) = 0;
    virtual bool IsContained() = 0;
    virtual bool DidActivateWithCurrentMouseDown() const = 0;
};

void UpdateGlog(glogRec *);
short GetGlogWidth(glogRec *);
short GetGlogHeight(glogRec *);

GlogPane *GetGlogItem(glogRec *, short id);
short CountGlogItems(glogRec *);
void SetPortToGlog(glogRec *);
enum ShowOrHideEnum { kShowGlog = 0, kHideGlog = 1 };
void ShowGlog(glogRec *, ShowOrHideEnum);

void PositionGlog(glogRec *, Rect *, bool);
void DisposeGlog(glogRec *);
bool GlogError(glogRec *);

namespace LowLevelGlogOpening {

glogRec *NewGlog(short resource, TarnOSWindow::OSWindow::SendBehindArg, bool, ContainerGlog *);
}
