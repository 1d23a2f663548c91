#include "tools/gallery/StepperPane.h"
#include "buttons/ButtonGroupPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogLayout.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include "tools/gallery/LabelText.h"
#include <algorithm>
#include <memory>
#include <new>

namespace {

short const kWidth = 15, kHeight = 21; // pixels, of the icon
int const kLeast = 1, kMost = 999;
int const kHandled = -1;
int const kUpperHalf = 1, kLowerHalf = 2; // as NextPrevClicked has them

} // namespace

StepperPane *StepperPane::NewStepperPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<StepperPane> stepper(new (std::nothrow) StepperPane(owner, sheet));
    if (!stepper || !stepper->GetGlog())
        return nullptr;
    Point const origin = OptionalPoint(sheet->GetItemRes(), "Origin");
    Rect box = {origin.v, origin.h, static_cast<short>(origin.v + kHeight),
                static_cast<short>(origin.h + kWidth)};
    stepper->SetBox(&box);
    return stepper.release();
}

StepperPane::StepperPane(glogRec *owner, GlogStyleSheet *sheet)
    : NextPrevButton(owner)
    , labelID(sheet->GetSInt32ItemValue(ResourceKey("TextID")))
    , number(sheet->GetSInt32ItemValue(ResourceKey("Num")))
    , groupID(sheet->GetSInt32ItemValue(ResourceKey("CmdClassID")))
    , groupButton(sheet->GetSInt32ItemValue(ResourceKey("CmdID")))
    , bound(false) {}

// Not before the first click: while a page is made, the page before it may still have items of the same
// numbers.
void StepperPane::BindToGroup() {
    if (bound || !groupID)
        return;
    bound = true;
    GlogPane *const pane = GetGlogItem(GetGlog(), static_cast<short>(groupID));
    if (ButtonGroupPane *group = dynamic_cast<ButtonGroupPane *>(pane))
        group->SetAutoBinding(this, groupButton);
}

// Who hears that the stepper is used may do away with it.
int StepperPane::HandleClick(EventRecordAdapter *event) {
    BindToGroup();
    PaneWatch const watch(this);
    if (Provider<AutoSetActivityListener>::HasDependents())
        Provider<AutoSetActivityListener>::BroadcastChange(AutoSetActivityMsg(this), nullptr);
    return watch.PaneExists() ? NextPrevButton::HandleClick(event) : kHandled;
}

void StepperPane::NextPrevClicked(int which) {
    int const step = which == kUpperHalf ? 1 : which == kLowerHalf ? -1 : 0;
    number = std::clamp(number + step, kLeast, kMost);
    LabelText::Show(GetGlog(), labelID, LabelText::OfNumber(number));
}
