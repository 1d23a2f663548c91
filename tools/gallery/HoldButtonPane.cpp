#include "tools/gallery/HoldButtonPane.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"
#include "host/GlogStyleSheet.h"
#include "tools/gallery/LabelText.h"
#include <memory>
#include <new>

namespace {

short const kStates = 2, kDownStates = 2, kDisabledStates = 1;
short const kOff = 0;

} // namespace

HoldButtonPane *HoldButtonPane::NewHoldButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    int const label = sheet->GetSInt32ItemValue(ResourceKey("TextID"));
    int const family = ISetIDMapper::Instance().GetID(sheet->GetUStringItemValue(ResourceKey("FamilyID")));
    short const icon = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("Num")));
    std::unique_ptr<HoldButtonPane> button(new (std::nothrow) HoldButtonPane(label));
    if (!button || !button->GIconButtonPaneInit(owner, 0, static_cast<short>(family), icon, kStates,
                                                kDownStates, kDisabledStates))
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    button->SetBox(&box);
    button->SetCanDisable(true);
    button->SetEnable(sheet->GetSInt32ItemValue(ResourceKey("Mode")) == 0);
    return button.release();
}

void HoldButtonPane::DoButtonPress(int) { LabelText::Show(GetGlog(), labelID, LabelText::OfNumber(++count)); }

short HoldButtonPane::ClickAction(int) { return kOff; }
