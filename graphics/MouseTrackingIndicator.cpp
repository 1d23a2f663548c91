#include "graphics/MouseTrackingIndicator.h"
#include "host/VelaDrawing.h"

namespace {

short const kNearness = 2; // pixels on each side

} // namespace

MouseTrackingIndicator::MouseTrackingIndicator(glogRec *shownIn)
    : glog(shownIn)
    , showing(false)
    , location{0, 0, 0, 0} {}

MouseTrackingIndicator::MouseTrackingIndicator(MouseTrackingIndicator const &) = default;

MouseTrackingIndicator &MouseTrackingIndicator::operator=(MouseTrackingIndicator const &) = default;

MouseTrackingIndicator::~MouseTrackingIndicator() {}

void MouseTrackingIndicator::Show(Rect const &place) {
    location = place;
    Draw(&location);
    VelaDrawing::InvalRect(&location);
    showing = true;
}

void MouseTrackingIndicator::Hide() {
    VelaDrawing::InvalRect(&location);
    showing = false;
}

void MouseTrackingIndicator::Move(Rect const &place) {
    Hide();
    Show(place);
}

void MouseTrackingIndicator::MaybeDraw() {
    if (showing)
        Draw(&location);
}

bool MouseTrackingIndicator::Nearby(Rect a, Rect b) {
    VelaDrawing::InsetRect(&a, -kNearness, -kNearness);
    VelaDrawing::InsetRect(&b, -kNearness, -kNearness);
    Rect common;
    return VelaDrawing::SectRect(&a, &b, &common);
}
