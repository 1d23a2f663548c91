#include "dialogs/BarName.h"
#include "desktop/panes/PaneAccess.h"
#include "dialogs/KeyFault.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarPane.h"
#include <string>

BarName::BarName(GlogStyleSheet *sheet, char const *key_)
    : key(key_)
    , number(static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey(key)))) {}

ScrollBarPane *BarName::FindFor(GlogPane &scrolled) const {
    if (number == 0)
        return nullptr;
    GlogPane *const named = Nearest(scrolled);
    if (!named)
        throw KeyFault(key, "there is no item " + std::to_string(number), &scrolled);
    ScrollBarPane *const bar = dynamic_cast<ScrollBarPane *>(named);
    if (!bar)
        throw KeyFault(key, "item " + std::to_string(number) + " is no scroll bar", &scrolled);
    return bar;
}

// Numbers may occur again in what was loaded into the same window before, such as what is about to be
// exchanged for this. So whoever shares the innermost container comes first, and of these the topmost.
GlogPane *BarName::Nearest(GlogPane &scrolled) const {
    GlogPane *inner = &scrolled;
    while (CompoundPane *const around = PaneAccess::Container(*inner)) {
        for (short i = around->NumSubpanes(); i-- > 0;) {
            if (GlogPane *const found = around->Get(i)->FindByID(number))
                return found;
        }
        inner = around;
    }
    GlogPane *const found = GetGlogItem(scrolled.GetGlog(), number);
    return found && found->GetID() == number ? found : nullptr;
}
