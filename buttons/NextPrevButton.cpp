#include "buttons/NextPrevButton.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/MouseTask.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"

namespace {

short const kFamily = 1007;
int const kRestIcon = 68; // followed by those with the upper and the lower half pressed

enum Half { kNeither = 0, kUpper = 1, kLower = 2 };

} // namespace

class NextPrevButton::MouseTracker : public MouseTask {
public:
    MouseTracker(NextPrevButton *tracked, Rect const &upper, Rect const &lower)
        : MouseTask(0)
        , button(tracked)
        , upperHalf(upper)
        , lowerHalf(lower)
        , which(kNeither) {}

    void MouseTaskBegin() override { MouseTaskContinue(GetStartPoint()); }
    void MouseTaskContinue(Point const &where) override {
        int const now = HalfAt(where);
        if (now == which)
            return;
        which = now;
        ShowIcon(kRestIcon + which);
    }
    void MouseTaskEnd() override { ShowIcon(kRestIcon); }

    int Which() const { return which; }

private:
    int HalfAt(Point where) const {
        if (VelaDrawing::PtInRect(where, &upperHalf))
            return kUpper;
        return VelaDrawing::PtInRect(where, &lowerHalf) ? kLower : kNeither;
    }
    void ShowIcon(int icon) {
        button->icon = icon;
        button->Inval();
    }

    NextPrevButton *button;
    Rect upperHalf;
    Rect lowerHalf;
    int which;
};

NextPrevButton::NextPrevButton(glogRec *owner)
    : icon(kRestIcon) {
    GlogPaneInit(owner, 0);
}

void NextPrevButton::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    Draw1Icon(kFamily, static_cast<short>(icon), box.left, box.top);
}

int NextPrevButton::HandleClick(EventRecordAdapter *event) {
    Rect upper;
    GetBox(&upper);
    Rect lower = upper;
    short const middle = static_cast<short>((upper.bottom - upper.top) / 2 + upper.top);
    upper.bottom = middle;
    lower.top = static_cast<short>(middle + 1); // the row in the middle belongs to neither half
    MouseTracker tracker(this, upper, lower);
    PaneWatch const self(this);
    TrackMouse(tracker, event->where);
    if (self.PaneExists())
        NextPrevClicked(tracker.Which());
    return -1;
}
