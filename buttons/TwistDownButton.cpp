#include "buttons/TwistDownButton.h"
#include "host/Icons.h"
#include "host/PortSavers.h"
#include <memory>
#include <new>

namespace {

short const kFamily = 1007;
short const kClosedIcon = 17, kOpenIcon = 51;
short const kSide = 13; // pixels

} // namespace

TwistDownButton::TwistDownButton()
    : open(false) {}

TwistDownButton *TwistDownButton::NewTwistDownButton(glogRec *owner) {
    std::unique_ptr<TwistDownButton> button(new (std::nothrow) TwistDownButton);
    if (!button || !button->InitGlogButtonPane(owner, kEnabled))
        return nullptr;
    Rect box = {0, 0, kSide, kSide};
    button->SetBox(&box);
    return button.release();
}

void TwistDownButton::Release() {
    if (!StillTracking())
        open = !open;
    GlogButtonPane::Release();
}

void TwistDownButton::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Rect const bounds = GetBounds();
    Draw1Icon(kFamily, open ? kOpenIcon : kClosedIcon, bounds.left, bounds.top);
}
