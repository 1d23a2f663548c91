#include "desktop/menus/MenuMarks.h"
#include "desktop/drawing/IconStore.h"
#include "host/Icons.h"
#include "host/MenuItemDecorator.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"

namespace {

short const kMarkFamily = 2007, kItemFamily = 2006;
short const kLitIcons = 100; // from an icon to the same on the highlight
short const kIconSide = 16;
short const kFadingGray = 55; // percent
unsigned int const kEverything = ~0u;

bool IsDrawn(short family, short index) {
    IconSet &icons = IconStore::Instance().AnyScale();
    IconSet::Icon const icon = icons.Find(family, index);
    return icon.layer >= 0 && icon.record && icon.record->index == index;
}

short Middle(Rect const &r, int height) { return static_cast<short>((r.top + r.bottom - height) / 2); }

} // namespace

void MenuMarks::Draw(Mark mark, State state, int left, Rect const &r) {
    SaveColors const colors;
    ClearColors();
    short const index = static_cast<short>(mark + state);
    IconSet::Icon const icon = IconStore::Instance().AnyScale().Find(kMarkFamily, index);
    Draw1Icon(kMarkFamily, index, static_cast<short>(left), Middle(r, icon.height));
}

void MenuMarks::DrawItemIcon(short icon, State state, int left, Rect const &r) {
    SaveColors const colors;
    ClearColors();
    if (state == kDisabled)
        GrayForeColor(kFadingGray);
    short const lit = static_cast<short>(icon + kLitIcons);
    short const top = Middle(r, kIconSide);
    Draw1Icon(kItemFamily, state == kLit && IsDrawn(kItemFamily, lit) ? lit : icon, static_cast<short>(left),
              top);
}

void MenuMarks::DrawDecorator(MenuItemDecorator &decorator, Rect const &r, bool lit, bool enabled) {
    WithSaveGraphicsState const state(OSPort::Current(), kEverything);
    ClearColors();
    VelaDrawing::NarrowClipToRect(&r);
    decorator.Draw(r, lit, enabled);
}
