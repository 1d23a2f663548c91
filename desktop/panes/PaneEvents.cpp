#include "desktop/panes/PaneEvents.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include <boost/make_shared.hpp>

namespace {

// The pane and its glog may be gone after the call, so that what the report needs is read before it.
template <class Operation> int Reported(GlogPane &pane, char const *name, bool isHit, Operation operation) {
    glogRec *const glog = pane.GetGlog(); // lives on while events are handled in it
    int const id = pane.GetID();
    std::string const className = MessageTrace::On() ? MessageTrace::ClassName(pane) : std::string();
    int const result = operation();
    if (!className.empty())
        MessageTrace::Write(
            MessageTrace::Begin(className, id).Text("message", std::string(name)).Integer("result", result));
    if (isHit && glog && result != 0)
        Glog::From(glog).NoteHit(id);
    return result;
}

} // namespace

int PaneEvents::Click(GlogPane &pane, EventRecordAdapter &event) {
    return Reported(pane, "HandleClick", true, [&] { return PaneAccess::Click(pane, &event); });
}

int PaneEvents::SecondaryClick(GlogPane &pane, EventRecordAdapter &event) {
    return Reported(pane, "HandleSecondaryButtonClick", true,
                    [&] { return PaneAccess::SecondaryClick(pane, &event); });
}

int PaneEvents::Key(GlogPane &pane, EventRecordAdapter &event) {
    return Reported(pane, "Key", false, [&] { return pane.Key(&event); });
}

int PaneEvents::Tab(GlogPane &pane, char direction) {
    return Reported(pane, "Tab", false, [&] { return pane.Tab(direction); });
}

bool PointedEvent::LiesIn(GlogPane &pane) const {
    Point const origin = PaneAccess::Origin(pane);
    return pane.Contains({static_cast<short>(window.v - origin.v), static_cast<short>(window.h - origin.h)});
}

WheelEvent::WheelEvent(Point window, float delta, int axis)
    : PointedEvent(window)
    , params(boost::make_shared<MouseWheelParams>()) {
    params->delta = delta;
    params->axis = axis;
}

bool IsMouseWheelEvent(UIEvent const &event) { return dynamic_cast<WheelEvent const *>(&event) != nullptr; }
