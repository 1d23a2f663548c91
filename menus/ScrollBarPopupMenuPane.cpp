#include "menus/ScrollBarPopupMenuPane.h"

namespace {

short const kNoNumber = 0, kNoFlags = 0;
int const kHeight = 16; // pixels

} // namespace

ScrollBarPopupMenuPane::ScrollBarPopupMenuPane(glogRec *owner, short menuID)
    : PopMPane(owner, kNoNumber, kNoFlags, menuID, true) {
    if (GetGlog())
        GetLayoutRect()->SetAttribute(GlogLayoutItem::kHeight, kHeight, GlogLayoutItem::kPixels, UString());
    SetMenuBackgroundColor(kPopupBackScrollBar);
}

ScrollBarPopupMenuPane::~ScrollBarPopupMenuPane() {}
