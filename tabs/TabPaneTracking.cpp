// What clicks do.
#include "host/CallbackAPI.h"
#include "host/EventRecordAdapter.h"
#include "host/MouseTask.h"
#include "host/OSMenuHandle.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tabs/TabMeasures.h"
#include "tabs/TabPane.h"
#include <algorithm>

namespace {

int const kMissed = 0, kHandled = -1;
short const kFirstMenuItem = 1;

} // namespace

// The selection follows the mouse.
class TabPaneMouseTask : public MouseTask {
public:
    explicit TabPaneMouseTask(TabPane *pane_)
        : MouseTask(0)
        , pane(pane_)
        , startingSelection(-1) {}
    void MouseTaskBegin() override;
    void MouseTaskContinue(Point const &) override;
    void MouseTaskEnd() override;

private:
    int ItemFor(Point);

    TabPane *pane; // not owned
    int startingSelection;
};

void TabPaneMouseTask::MouseTaskBegin() {
    startingSelection = pane->selectedItem;
    MouseTaskContinue(GetStartPoint());
}

// Outside of the pane it is the one that was selected at first; in the pane, where there is no tab, the
// current one stays.
int TabPaneMouseTask::ItemFor(Point where) {
    Rect const r = pane->GetDrawRectangle();
    int item = 0;
    Rect box;
    if (pane->FindItem(where, item, box))
        return item;
    return VelaDrawing::PtInRect(where, &r) ? pane->selectedItem : startingSelection;
}

void TabPaneMouseTask::MouseTaskContinue(Point const &where) {
    pane->Prepare();
    int const wanted = ItemFor(where);
    if (wanted != pane->selectedItem) {
        pane->selectedItem = wanted;
        pane->Inval();
        UpdateGlog(pane->GetGlog());
    }
    VelaFoundationCallbackAPI::gInstance->TrackingStep(); // which may delete the pane
}

// The listeners hear of the step from the tab that was selected before the drag. A switch that is refused
// leaves the selection where it is, and tells nobody.
void TabPaneMouseTask::MouseTaskEnd() {
    int const item = pane->selectedItem;
    PaneWatch const watch(pane); // whoever is asked may ask the user, and then anything happens
    if (!pane->ShouldAllowTabSwitch(startingSelection, item) || !watch.PaneExists())
        return;
    pane->selectedItem = startingSelection;
    pane->SetSelectedItem(item);
}

bool TabPane::FindItem(Point where, int &item, Rect &box) {
    DemandItemRects();
    for (Size i = 0; i < itemRects.size(); ++i) {
        Rect live = itemRects[i];
        VelaDrawing::InsetRect(&live, TabMeasures::kDeadEnd, 0);
        if (VelaDrawing::PtInRect(where, &live)) {
            item = static_cast<int>(i);
            box = live;
            return true;
        }
    }
    return false;
}

// A single item in the tab of hidden ones is shown with its name, and clicks as an ordinary tab.
bool TabPane::IsOverflowClick(int item) const {
    bool const isOnlyItem = CountItems() == 1 && hiddenCount == 1;
    return !TabIsVisible(item) && !isOnlyItem;
}

int TabPane::HandleClick(EventRecordAdapter *event) {
    int item = 0;
    Rect box;
    if (!FindItem(event->where, item, box))
        return kMissed;
    if (IsOverflowClick(item)) {
        ChooseFromOverflow(item);
        return kHandled;
    }
    TabPaneMouseTask task(this);
    TrackMouse(task, event->where);
    return kHandled;
}

// The menu's names are always the full ones. Whether the tab may be switched is not asked here.
void TabPane::ChooseFromOverflow(int item) {
    int const firstHidden = std::max(0, NumVisible());
    OSMenuHandle menu = OSMenuHandle::CreateNewHierarchicalMenu();
    for (int i = firstHidden; i < CountItems(); ++i)
        menu.AppendItem(GetItemName(i));
    Rect place = GetItemBox(item);
    Prepare();
    PaneWatch const watch(this);
    int const choice = RunPopupMenu(menu, kFirstMenuItem, &place);
    if (choice == 0 || !watch.PaneExists())
        return;
    // The low half of the choice is the item, from 1; the other names the menu.
    int const chosen = static_cast<short>(firstHidden - 1 + choice);
    bool const stillThere =
        chosen >= 0 && chosen < CountItems(); // whatever ran meanwhile may have deleted some
    if (stillThere && chosen != selectedItem)
        SetSelectedItem(chosen);
}
