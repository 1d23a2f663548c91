#include "buttons/ButtonTracking.h"
#include "host/CallbackAPI.h"
#include "host/Icons.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include <optional>

namespace {

double const kShortestPress = 0.1;       // seconds
double const kTickInterval = 1.0 / 15.0; // seconds

void ShowPress(TransitionProc proc, void *data) {
    proc(data, kTransitionToPressed);
    proc(data, kTransitionTick);
    SavePortAndClip const saver;
    Yield(kShortestPress);
}

// One pass of the loop: tells the procedure where the mouse has come to be. True while it is inside.
bool FollowMouse(bool inside, Point where, Rect const *rect, TransitionProc proc, void *data) {
    if (VelaDrawing::PtInRect(where, rect)) {
        if (!inside)
            proc(data, kTransitionToPressed);
        proc(data, kTransitionTick);
        return true;
    }
    if (inside)
        proc(data, kTransitionToIdle);
    return false;
}

} // namespace

bool GenericButtonTrackingLoop(bool reportInside, Rect const *rect, TransitionProc proc, void *data) {
    bool inside = true;
    ShowPress(proc, data);

    // A wait that ends by timeout may leave the point alone: until the mouse moves it counts as inside, by
    // the corner that is.
    Point where = {rect->top, rect->left};
    // The hook and the wait may change port and clip, so each round of wait, procedure and hook has a saver
    // of its own.
    std::optional<SavePortAndClip> saver;
    saver.emplace();
    while (MouseIsDraggingWithTimeout(kTickInterval, &where, nullptr, nullptr)) {
        inside = FollowMouse(inside, where, rect, proc, data);
        VelaFoundationCallbackAPI::gInstance->TrackingStep();
        saver.emplace();
    }
    saver.reset();

    if (inside)
        proc(data, kTransitionToReleased);
    return inside || !reportInside;
}

void IconButtonTransitionProc(void *data, enum TransitionTo to) {
    IconTrackingRec const &rec = *static_cast<IconTrackingRec const *>(data);
    switch (to) {
    case kTransitionToIdle:
        Draw1Icon(rec.family, rec.idleIcon, rec.h, rec.v);
        break;
    case kTransitionToPressed:
        Draw1Icon(rec.family, rec.pressedIcon, rec.h, rec.v);
        break;
    case kTransitionToReleased:
        Draw1Icon(rec.family, rec.releaseIcon, rec.h, rec.v);
        break;
    default:
        break;
    }
}

bool TrackIconButton(bool reportInside, Rect const *rect, short family, short idleIcon, short pressedIcon,
                     short releaseIcon, TransitionProc proc) {
    SaveColors const colors;
    ClearColors();
    IconTrackingRec rec = {rect->top, rect->left, family, idleIcon, pressedIcon, releaseIcon};
    return GenericButtonTrackingLoop(reportInside, rect, proc, &rec);
}

bool TrackSpecialIconButton(bool reportInside, Rect const *rect, IconTrackingRec *rec, TransitionProc proc) {
    SaveColors const colors;
    ClearColors();
    bool const result = GenericButtonTrackingLoop(reportInside, rect, proc, rec);
    VelaDrawing::InvalRect(rect);
    return result;
}
