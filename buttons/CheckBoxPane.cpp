#include "buttons/CheckBoxPane.h"
#include "buttons/ckRadItemResRec.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include <memory>
#include <new>

namespace {

// How style sheets tell the layout properties of check boxes from those of other panes.
int const kLayoutPaneType = 54;

signed char const kOnIcon = 4, kOffIcon = 6, kDisabledIcon = 10;

short const kCommandKey = 0x0100;
short const kOptionKey = 0x0800;

short const kNoException = -1;

void SetAllBoxes(CheckBoxPane *group, bool value) { group->SetAllToSame(value); }

void SetOneBox(CheckBoxPane *group, int index, bool value) {
    group->SetOne(static_cast<short>(index), value);
}

bool ReadOneBox(CheckBoxPane *group, int index) { return group->ReadOne(static_cast<short>(index)); }

bool ToggleOneBox(CheckBoxPane *group, int index) {
    PaneWatch const watch(group);
    group->ToggleOne(static_cast<short>(index));
    return watch.PaneExists() && group->ReadOne(static_cast<short>(index));
}

} // namespace

void (*btnSetAllToSame)(CheckBoxPane *, bool) = SetAllBoxes;
void (*btnSetOneCB)(CheckBoxPane *, int, bool) = SetOneBox;
bool (*btnReadOneCB)(CheckBoxPane *, int) = ReadOneBox;
bool (*btnToggleOne)(CheckBoxPane *, int) = ToggleOneBox;

CheckBoxPane::CheckBoxPane() {
    onIcon = kOnIcon;
    offIcon = kOffIcon;
    disabledIcon = kDisabledIcon;
}

CheckBoxPane *CheckBoxPane::NewCheckBoxPane(glogRec *owner, ckRadItemResRec *resource) {
    std::unique_ptr<CheckBoxPane> pane(new (std::nothrow) CheckBoxPane);
    if (!pane || !pane->InitCheckBoxPane(owner, resource))
        return nullptr;
    return pane.release();
}

CheckBoxPane *CheckBoxPane::NewCheckBoxPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<CheckBoxPane> pane(new (std::nothrow) CheckBoxPane);
    if (!pane || !pane->InitCheckBoxPane(owner, sheet))
        return nullptr;
    pane->GlogItemFromRes(sheet);
    return pane.release();
}

CheckBoxPane *CheckBoxPane::InitCheckBoxPane(glogRec *owner, ckRadItemResRec *resource) {
    if (!InitButtonGroupPane(owner, resource))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, owner->GetStyleSheet());
    flags = resource->flags;
    return this;
}

CheckBoxPane *CheckBoxPane::InitCheckBoxPane(glogRec *owner, GlogStyleSheet *sheet) {
    if (!InitButtonGroupPane(owner, sheet))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, sheet);
    flags = static_cast<unsigned short>(sheet->GetSInt32ItemValue(ResourceKey("Flags")));
    return this;
}

void CheckBoxPane::SetOne(short index, bool value) { SetButton(index, value, false); }

bool CheckBoxPane::ReadOne(short index) const { return IsOn(index); }

void CheckBoxPane::ToggleOne(short index) { SetButton(index, !ReadOne(index), false); }

void CheckBoxPane::SetAllToSame(bool value) { SetAllButtons(value, false, kNoException); }

void CheckBoxPane::AutoSetButton(int index) { SetButton(static_cast<short>(index), true, false); }

bool CheckBoxPane::TrackButton(short index, short modifiers) {
    if (!ButtonGroupPane::TrackButton(index, modifiers))
        return false;
    bool const turnsOn = (modifiers & kOptionKey) != 0; // goes before the command key
    bool const isPlain = !turnsOn && (modifiers & kCommandKey) == 0;
    bool const value = isPlain ? !ReadOne(index) : turnsOn;
    bool const changesOthers = !isPlain && (flags & kModifiersChangeOthers) != 0;
    PaneWatch const self(this);
    SetButton(index, value, false);
    if (changesOthers && self.PaneExists())
        SetAllButtons(!value, false, index);
    return true;
}

// What the box will show once it has the other value.
short CheckBoxPane::GetReleaseIcon(bool value) { return value ? offIcon : onIcon; }
