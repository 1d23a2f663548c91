// Clicks, and the drag that takes further rows along.
#include "host/CallbackAPI.h"
#include "host/EventRecordAdapter.h"
#include "host/MouseTask.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "lists/GListPane.h"
#include "scrolling/CurrentTick.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <functional>
#include <limits>

namespace {

int const kNone = -1;
int const kNoClick = std::numeric_limits<int>::min();
enum Modifiers { kCommand = 0x0100, kShift = 0x0200, kOption = 0x0800, kControl = 0x1000 };
enum Answers { kHandled = -1, kNoRowHit = 0, kClick = 1, kDoubleClick = 2, kForOwner = 3 };

int const kSelectBy = 2, kDeselectBy = -2; // added to a row's state, whose bit 0 it leaves alone
int const kStateBefore = 1;                // that bit
short const kHysteresis = 4;               // pixels
long long const kTicksPerScroll = 3;

} // namespace

int GListPane::lastClickLine = kNoClick;
int GListPane::lastClickColumn = kNoClick;

bool GListPane::ClickSelectFilter(EventRecordAdapter *, int, int) const { return false; }

void GListPane::GetClickParameters(int &line, int &column) const {
    line = clickLine;
    column = clickColumn;
}

void GListPane::SetClickParameters(int line, int column) {
    clickLine = line;
    clickColumn = column;
}

int GListPane::HandleClick(EventRecordAdapter *event) {
    SetClickParameters(kNoClick, kNoClick);
    if (event->modifiers & kControl) {
        PaneWatch const self(this);
        int const result = HandleSecondaryButtonClick(event);
        if (result != 0 || !self.PaneExists())
            return result;
    }
    if (res.selMode == kListSelectByCode)
        return kHandled;
    Prepare();
    int line = kNone, column = kNone;
    bool const isCell = CheckHit(event->where, &line, &column);
    if (!isCell && !(selColumn == kAnyColumn && line >= 0))
        return ClickOutside(*event, line);
    bool const isDouble = IsSecondClick(line, column);
    if (Selects(event, line, column, isDouble))
        return SelectByClick(*event, line, column);
    SetClickParameters(line, column);
    if (selectionListener)
        selectionListener->ClickOccured(this, column, line, isDouble);
    return isDouble ? kDoubleClick : kClick;
}

// A click that brings the window to the front is meant for the window.
int GListPane::ClickOutside(EventRecordAdapter const &event, int line) {
    bool const isBelow = line == kBelow && !(event.modifiers & (kCommand | kShift));
    if (!isBelow || res.selMode == kListSelectToggle || !glog || glog->DidActivateWithCurrentMouseDown())
        return kNoRowHit;
    ClickBelowLastItem();
    return kForOwner;
}

void GListPane::ClickBelowLastItem() {
    PaneWatch const self(this);
    DeselectAll();
    if (self.PaneExists())
        SetClickParameters(kNone, kNone);
}

// Of the same cell place, in whichever list.
bool GListPane::IsSecondClick(int line, int column) {
    bool const isSame = line == lastClickLine && column == lastClickColumn;
    lastClickLine = line;
    lastClickColumn = column;
    return VelaFoundationCallbackAPI::gInstance->IsDoubleClick() && isSame;
}

bool GListPane::Selects(EventRecordAdapter *event, int line, int column, bool isDouble) const {
    if (ClickSelectFilter(event, line, column))
        return false;
    if (selColumn == kAnyColumn)
        return true;
    return column == selColumn && !(event->modifiers & res.selKeyMask) && !isDouble;
}

// The gesture that selects, from the press to the release. Whatever is called on the way may change rows,
// columns, mode and drawer, or delete the list: each step looks anew at what there is.
//
// In modes with several rows a row in the dragged range has its state before the gesture plus kSelectBy or
// kDeselectBy as its flag. Bit 0 tells the state before, to which a row returns that the drag leaves again.
class GListPane::SelectionDrag {
public:
    SelectionDrag(GListPane &list_, Point where, int line_, int column_)
        : list(list_)
        , self(&list_)
        , point(where)
        , line(line_)
        , column(column_) {}

    // What the press does in modes with several rows.
    void Begin(unsigned short modifiers) {
        bool const extends =
            list.res.selMode == kListSelectSeveral && (modifiers & kShift) && !(modifiers & kCommand);
        // Kept: the anchor is not selected itself. So where nothing is, the first row selects nothing, while
        // any other one selects itself and all before it.
        if (extends) {
            current = anchor = Anchor();
            return;
        }
        current = anchor = line;
        list.InvertItem(line);
        int const flag = list.selected.At(line);
        delta = flag > 0 ? kDeselectBy : kSelectBy;
        list.DoSelect(line, flag + delta, false);
    }

    // Follows the mouse; false when the list has been deleted. A pass that finds what the one before has
    // dealt with does nothing, so that nobody is woken for it.
    bool Follow() {
        double const wait = MouseTask::DefaultAutoScrollTime();
        std::function<bool()> const rests = [this] { return self.PaneExists() && FindsTheSame(); };
        do {
            list.Prepare();
            Pass();
            if (!self.PaneExists())
                return false;
            list.Prepare(); // the wait answers in the coordinates of this port
        } while (MouseIsDraggingUnlessAtRest(wait, &point, rests) && self.PaneExists());
        return self.PaneExists();
    }

    int Line() const { return line; }
    int Column() const { return column; }

private:
    // The selected row that is nearest behind the clicked one, or before it.
    int Anchor() const {
        int const behind = list.selected.FirstSelectedFrom(line);
        if (behind != SelectionFlags::kNone)
            return behind;
        return std::max(list.selected.LastSelectedTo(line), 0);
    }

    // Outside of the column that selects nothing is to be done.
    bool IsDealtWith() const {
        return (list.selColumn != kAnyColumn && column != list.selColumn) || line == lastLine;
    }
    bool FindsTheSame() const {
        int hitLine = line, hitColumn = column;
        list.CheckHit(point, &hitLine, &hitColumn);
        return hitLine == line && hitColumn == column && IsDealtWith();
    }

    void Pass() {
        list.CheckHit(point, &line, &column);
        if (IsDealtWith())
            return;
        if (list.res.selMode == kListSelectOne && list.selFirst != line) {
            if (MoveSelection())
                return;
        } else if (list.HasFlags() && line != current) {
            Extend();
        }
        if (!self.PaneExists())
            return;
        UpdateGlog(list.glog);
        if (self.PaneExists())
            Scroll();
    }

    // To a row, or to none while the mouse is off the rows. True when nothing more is to be done in this
    // pass.
    bool MoveSelection() {
        list.InvertItem(list.selFirst);
        list.selFirst = line;
        if (line < 0)
            return false;
        list.InvertItem(line);
        VelaFoundationCallbackAPI::gInstance->ListTrackingStep();
        if (self.PaneExists())
            UpdateGlog(list.glog);
        lastLine = line;
        return true;
    }

    void Extend() {
        int const target = Target();
        int const low = std::min(target, anchor), high = std::max(target, anchor);
        int const step = target < current ? -1 : 1;
        for (int row = current;; row += step) {
            Touch(row, low <= row && row <= high);
            if (!self.PaneExists())
                return;
            if (row == target)
                break;
        }
        current = line = target;
    }

    // The row that the drag has come to. A row counts only when the mouse is some pixels inside.
    int Target() const {
        if (line == kBelow)
            return static_cast<int>(
                std::min(0LL + list.topLine + list.numDisplayed - 1, list.numItems - 1LL));
        if (line == kAbove)
            return std::max(list.topLine - 1, 0);
        Rect row;
        if (!list.GetRowBox(line, row))
            return line;
        if (line < current && point.v > row.bottom - kHysteresis)
            return line + 1;
        if (line > current && point.v < row.top + kHysteresis)
            return line - 1;
        return line;
    }

    void Touch(int row, bool isInside) {
        if (!list.selected.Has(row))
            return;
        int const flag = list.selected.At(row);
        int const present = (isInside ? delta : 0) + (flag & kStateBefore);
        if ((present > 0) == (flag > 0))
            return;
        list.InvertItem(row);
        list.DoSelect(row, present, true);
    }

    // By a row, when the mouse is off the list's ends and the time has come. A pass that comes too early
    // leaves the next one at the same row without anything to do.
    void Scroll() {
        Rect box;
        list.GetBox(&box);
        int const direction = point.v < box.top ? -1 : point.v > box.bottom ? 1 : 0;
        long long const now = CurrentTick();
        if (direction == 0 || now < nextScrollTick) {
            lastLine = line;
            return;
        }
        nextScrollTick = now + kTicksPerScroll;
        list.SetScrollPosition(Saturated(0LL + list.topLine + direction));
    }

    GListPane &list;
    PaneWatch const self;
    Point point;
    int line, column;            // under the mouse; in modes with several rows the row that it stands for
    int lastLine = kNone;        // that has been dealt with
    int anchor = 0, current = 0; // the ends of the dragged range
    int delta = kSelectBy;       // kSelectBy or kDeselectBy
    long long nextScrollTick = 0;
};

int GListPane::SelectByClick(EventRecordAdapter const &event, int line, int column) {
    SelectionDrag drag(*this, event.where, line, column);
    PaneWatch const self(this);
    {
        SaveColors const colors;
        // Also when something that is called on the way throws.
        struct Gesture {
            ~Gesture() {
                if (self.PaneExists())
                    flags.Normalise();
            }
            PaneWatch const &self;
            SelectionFlags &flags;
        } const gesture = {self, selected};
        if (ClearBefore(event.modifiers) && HasFlags())
            drag.Begin(event.modifiers);
        if (!self.PaneExists() || !drag.Follow())
            return kHandled;
    }
    TellDone();
    if (!self.PaneExists() || !res.selReturn)
        return kHandled;
    SetClickParameters(drag.Line(), drag.Column());
    return kForOwner;
}

// What is selected before the click counts; false when the list has been deleted.
bool GListPane::ClearBefore(unsigned short modifiers) {
    PaneWatch const self(this);
    bool const clears = res.selMode == kListSelectOne ||
                        (res.selMode == kListSelectSeveral && !(modifiers & (kCommand | kShift))) ||
                        (res.selMode == kListSelectToggle && (modifiers & kOption));
    if (clears)
        DeselectAll();
    else if (res.selMode == kListSelectToggle && (modifiers & kCommand))
        SelectAll();
    return self.PaneExists();
}

// A cell as a button

bool GListPane::TrackCol(int line, int column) {
    Rect row;
    if (!HasColumn(column) || !GetRowBox(line, row))
        return false;
    Prepare();
    SaveColors const colors;
    PaneWatch const self(this);
    Rect const cell = CellIn(row, column);
    bool isInside = true;
    Point point = {row.top, row.left};
    InvertItemRect(line, true);
    UpdateGlog(glog);
    if (!self.PaneExists())
        return false;
    Prepare();
    while (MouseIsDragging(&point, nullptr) && self.PaneExists()) {
        if (VelaDrawing::PtInRect(point, &cell) != isInside) {
            isInside = !isInside;
            InvertItemRect(line, true);
        }
        VelaFoundationCallbackAPI::gInstance->ListTrackingStep();
        if (!self.PaneExists())
            return false;
        UpdateGlog(glog);
        if (!self.PaneExists())
            return false;
        Prepare();
    }
    return isInside && self.PaneExists();
}
