// A pop-up menu of the height and the ground of a scroll bar, to sit in one.
#pragma once
#include "menus/PopMPane.h"

class ScrollBarPopupMenuPane : public PopMPane {
public:
    // Attaches the pane under the number 0, with a copy of the stored menu; the layout or the caller gives it
    // its box. Whether there is such a menu is not told.
    ScrollBarPopupMenuPane(glogRec *, short menuID);
    ~ScrollBarPopupMenuPane() override;
};
