#include "buttons/RadioButtonPane.h"
#include "buttons/ckRadItemResRec.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include <memory>
#include <new>

namespace {

// How style sheets tell the layout properties of radio buttons from those of other panes.
int const kLayoutPaneType = 53;

signed char const kOnIcon = 0, kOffIcon = 2, kDisabledIcon = 8;

short CurrentButton(RadioButtonPane *group) { return group->RadioGet(); }

void SetCurrentButton(RadioButtonPane *group, int index) { group->RadioSet(static_cast<short>(index)); }

} // namespace

short (*radGet)(RadioButtonPane *) = CurrentButton;
void (*radSet)(RadioButtonPane *, int) = SetCurrentButton;

RadioButtonPane::RadioButtonPane() {
    onIcon = kOnIcon;
    offIcon = kOffIcon;
    disabledIcon = kDisabledIcon;
}

RadioButtonPane *RadioButtonPane::NewRadioButtonPane(glogRec *owner, ckRadItemResRec *resource) {
    std::unique_ptr<RadioButtonPane> pane(new (std::nothrow) RadioButtonPane);
    if (!pane || !pane->InitRadioButtonPane(owner, resource))
        return nullptr;
    return pane.release();
}

RadioButtonPane *RadioButtonPane::NewRadioButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<RadioButtonPane> pane(new (std::nothrow) RadioButtonPane);
    if (!pane || !pane->InitRadioButtonPane(owner, sheet))
        return nullptr;
    pane->GlogItemFromRes(sheet);
    if (pane->CountButtons() > 0)
        pane->ShowInitialValue();
    return pane.release();
}

RadioButtonPane *RadioButtonPane::InitRadioButtonPane(glogRec *owner, ckRadItemResRec *resource) {
    if (!InitButtonGroupPane(owner, resource))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, owner->GetStyleSheet());
    return FinishInit(resource->flags);
}

RadioButtonPane *RadioButtonPane::InitRadioButtonPane(glogRec *owner, GlogStyleSheet *sheet) {
    if (!InitButtonGroupPane(owner, sheet))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, sheet);
    return FinishInit(static_cast<unsigned short>(sheet->GetSInt32ItemValue(ResourceKey("Flags"))));
}

RadioButtonPane *RadioButtonPane::FinishInit(unsigned short newFlags) {
    flags = newFlags;
    TurnOnQuietly(radioValue); // for subclasses that have added their buttons by now
    return this;
}

// Invisible meanwhile, so that nothing is invalidated.
void RadioButtonPane::ShowInitialValue() {
    unsigned char const visible = GetVisibility();
    SetVisibility(false);
    SetButton(radioValue, true, false);
    SetVisibility(visible);
}

void RadioButtonPane::AddSpecialButton(short h, short v, short extraWidth) {
    ButtonGroupPane::AddSpecialButton(h, v, extraWidth);
    TurnOnQuietly(radioValue);
}

void RadioButtonPane::RadioSet(short index) {
    short const old = radioValue;
    if (index == old || index < 0 || index >= CountButtons())
        return;
    radioValue = index;
    PaneWatch const self(this);
    SetButton(old, false, false);
    // A listener may have made another button the current one: there is never more than one on.
    if (self.PaneExists() && radioValue == index)
        SetButton(index, true, false);
}

short RadioButtonPane::RadioGet() { return radioValue; }

void RadioButtonPane::AutoSetButton(int index) { RadioSet(static_cast<short>(index)); }

bool RadioButtonPane::TrackButton(short index, short modifiers) {
    if (!ButtonGroupPane::TrackButton(index, modifiers))
        return false;
    // Nothing of this pane is touched afterwards: a listener may have deleted it.
    RadioSet(index);
    return true;
}

// A button that was released is on in any case.
short RadioButtonPane::GetReleaseIcon(bool) { return onIcon; }
