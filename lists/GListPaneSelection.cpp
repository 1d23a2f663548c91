#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include <algorithm>

namespace {

int const kNone = -1;

bool NeedsFlags(GListSelectionMode mode) { return mode == kListSelectSeveral || mode == kListSelectToggle; }

} // namespace

bool GListPane::HasFlags() const { return NeedsFlags(res.selMode); }

bool GListPane::SelModeDiscontig() { return HasFlags(); }

// Asking

bool GListPane::CheckSel(int line) {
    if (!HasRow(line))
        return false;
    if (res.selMode == kListSelectOne)
        return line == selFirst;
    return HasFlags() && selected.IsSelected(line);
}

int GListPane::NumSelected() const {
    if (res.selMode == kListSelectOne)
        return selFirst >= 0 ? 1 : 0;
    return HasFlags() ? selected.NumNonZero() : 0;
}

bool GListPane::GetFirstSelectedItem(int &line) const {
    if (res.selMode == kListSelectOne) {
        line = selFirst;
        return line >= 0;
    }
    int const lowest = HasFlags() ? selected.FirstNonZero() : kNone;
    if (lowest == kNone)
        return false;
    line = lowest;
    return true;
}

void GListPane::GetSelRange(int &first, int &last) const {
    first = selFirst;
    last = selLast;
}

// Telling: the listener may do anything, so afterwards nothing is known of rows, mode or list.

void GListPane::TellSelected(int line, bool isSelected, bool tracking) {
    if (selectionListener)
        selectionListener->SelectOccured(this, line, isSelected, tracking);
}

void GListPane::TellDone() {
    if (selectionListener)
        selectionListener->SelectionDone(this);
}

// Selecting

void GListPane::SelectItem(int line) { SelItemPrim(line, true); }

void GListPane::DeselectItem(int line) { SelItemPrim(line, false); }

void GListPane::SelItemPrim(int line, bool select) {
    PaneWatch const self(this);
    if (HasFlags() && HasRow(line) && selected.IsSelected(line) != select) {
        if (CanDrawSelection()) {
            Prepare();
            SaveColors const colors;
            InvertItem(line);
        } else {
            InvalInactiveSelectionDisplay();
        }
        DoSelect(line, select, false);
    }
    if (self.PaneExists())
        TellDone();
}

void GListPane::DoSelect(int line, int value, bool tracking) {
    if (!HasFlags() || !HasRow(line))
        return;
    selected.Set(line, value);
    TellSelected(line, value > 0, tracking);
}

void GListPane::SelectAll() {
    PaneWatch const self(this);
    Prepare();
    {
        SaveColors const colors;
        if (selectionListener)
            SelectAllAndTell(self);
        else
            SelectAllAtOnce();
    }
    if (self.PaneExists())
        TellDone();
}

void GListPane::SelectAllAndTell(PaneWatch const &self) {
    for (int row = selected.Count() - 1; row >= 0; row = std::min(row, selected.Count()) - 1) {
        SelectByAll(row);
        if (!self.PaneExists())
            return;
    }
}

void GListPane::SelectAllAtOnce() {
    int first = 0, last = 0;
    GetFirstAndLast(&first, &last);
    for (int row = last; row >= std::max(first, 0); --row)
        SelectByAll(row);
    selected.SetZerosToOne();
}

void GListPane::SelectByAll(int row) {
    if (!selected.Has(row) || selected.At(row) != 0)
        return;
    if (Shows(row) && CanDrawSelection())
        InvertItem(row);
    DoSelect(row, 1, false);
}

void GListPane::DeselectAll() {
    if (CanDrawSelection())
        InvertSelection();
    transientHilites.clear();
    if (res.selMode == kListSelectNothing)
        return;
    if (HasFlags()) {
        if (!ClearFlags())
            return;
    } else {
        selFirst = selLast = kNone;
    }
    TellDone();
}

// The listener hears of every row, of those that were not selected too. False when it has deleted the list.
bool GListPane::ClearFlags() {
    if (!selectionListener) {
        selected.SetAllToZero();
        return true;
    }
    PaneWatch const self(this);
    for (int row = selected.Count() - 1; row >= 0; row = std::min(row, selected.Count()) - 1) {
        DoSelect(row, 0, false);
        if (!self.PaneExists())
            return false;
    }
    return true;
}

void GListPane::SetSelRange(int first, int last) {
    InvertSelection();
    selFirst = first;
    selLast = last;
    InvertSelection();
}

void GListPane::SetSelMode(GListSelectionMode mode) {
    PaneWatch const self(this);
    DeselectAll();
    if (!self.PaneExists() || mode == res.selMode)
        return;
    // The flags first: without memory for them, nothing changes.
    bool const getsFlags = !HasFlags() && NeedsFlags(mode);
    if (getsFlags && !MakeFlags(numItems))
        return;
    res.selMode = mode;
    if (HasFlags())
        selected.SetAllToZero();
    else
        selected.Clear();
}

// Marks

void GListPane::InvertItem(int line) {
    Prepare();
    if (Shows(line) && selColumn != kAnyColumn)
        InvertItemRect(line, true);
}

void GListPane::InvertItemRect(int line, bool invalidate) {
    auto const place = std::lower_bound(transientHilites.begin(), transientHilites.end(), line);
    if (place != transientHilites.end() && *place == line)
        transientHilites.erase(place);
    else if (!CheckSel(line))
        transientHilites.insert(place, line);
    if (invalidate)
        InvalLine(line);
}

void GListPane::Unmark(int line) {
    auto const place = std::lower_bound(transientHilites.begin(), transientHilites.end(), line);
    if (place != transientHilites.end() && *place == line)
        transientHilites.erase(place);
}

// Rows that do not show need no look.
void GListPane::InvertSelection() {
    Prepare();
    SaveColors const colors;
    if (res.selMode == kListSelectOne) {
        selLast = selFirst;
        InvalLine(selFirst);
        return;
    }
    if (!HasFlags())
        return;
    int first = 0, last = 0;
    GetFirstAndLast(&first, &last);
    for (int row = last; row >= std::max(first, 0); --row) {
        if (selected.IsSelected(row))
            InvalLine(row);
    }
}
