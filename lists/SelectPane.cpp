#include "lists/SelectPane.h"
#include "host/NamedColors.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <cstdlib>

SelectPane::SelectPane()
    : editMode(kConsoleEditNone)
    , editBox() {}

SelectPane *SelectPane::SelectPaneInit(glogRec *owner, short id) {
    if (!GlogPaneInit(owner, id))
        return nullptr;
    SetSelectedFlag(false);
    editMode = kConsoleEditNone;
    return this;
}

ConsoleEditMode SelectPane::SetEditMode(ConsoleEditMode mode) {
    ConsoleEditMode const before = editMode;
    editMode = mode;
    return before;
}

// Geometry

void SelectPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    _SetEditBoxFromRect_(*box);
}

// Just outside of the bottom right corner, and with its top left corner beyond the other one: so it holds no
// point until a derived class makes something else of it.
void SelectPane::_SetEditBoxFromRect_(Rect &rect) {
    editBox.top = Pixel16(rect.bottom + 2);
    editBox.left = Pixel16(rect.right + 2);
    editBox.bottom = Pixel16(rect.bottom + 1);
    editBox.right = Pixel16(rect.right + 1);
}

bool SelectPane::EditBoxContains(Point point) { return VelaDrawing::PtInRect(point, &editBox); }

char SelectPane::_ResizeBox_(Rect *box, Point from, Point to) {
    int const height = box->bottom - box->top, width = box->right - box->left;
    box->bottom = Pixel16(box->top + std::abs(height + (to.v - from.v)));
    box->right = Pixel16(box->left + std::abs(width + (to.h - from.h)));
    SetBox(box);
    return box->bottom - box->top != height || box->right - box->left != width;
}

// State

void SelectPane::Activate() {
    if (IsActive())
        return;
    GlogPane::Activate();
    if (IsSelected())
        Inval();
}

void SelectPane::Deactivate() {
    if (IsActive())
        GlogPane::Deactivate();
}

void SelectPane::Select(bool on) {
    if (on == IsSelected())
        return;
    PaneWatch const self(this);
    GlogPane::Select(on); // the pane that was selected before tells its listeners
    if (self.PaneExists())
        Inval();
}

unsigned char SelectPane::Selectable() { return true; }

int SelectPane::HandleClick(EventRecordAdapter *) {
    Select(!IsSelected());
    return -1;
}

// Drawing

void SelectPane::DrawGuts(OSRgn *region) {
    Rect box;
    GetBox(&box);
    if (region && !VelaDrawing::RectInRgn(&box, region))
        return;
    SaveColors const colors;
    VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    VelaDrawing::RGBBackColor(kWindowBackgroundColor);
    _Draw_(region, IsSelected() && IsActive());
}

void SelectPane::_Draw_(OSRgn *, char hilite) {
    Rect box;
    GetBox(&box);
    VelaDrawing::PenNormal();
    VelaDrawing::FrameRect(&box);
    VelaDrawing::InsetRect(&box, 1, 1);
    if (hilite)
        VelaDrawing::PaintRect(&box);
    else
        VelaDrawing::EraseRect(&box);
}
