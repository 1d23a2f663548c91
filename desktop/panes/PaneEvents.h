// How events reach panes.
#pragma once
#include "host/EventRecordAdapter.h"
#include "host/GlogPane.h"
#include "host/UIEvent.h"

// Hands events to a pane and reports what it answered to those who watch.
namespace PaneEvents {
// A non-zero result is noted at the glog as a hit of the innermost pane that gave it. Either call may delete
// the pane.
int Click(GlogPane &, EventRecordAdapter &);
int SecondaryClick(GlogPane &, EventRecordAdapter &);
int Key(GlogPane &, EventRecordAdapter &);
int Tab(GlogPane &, char direction);
} // namespace PaneEvents

// A custom event that happened at a place; containers offer it to the subpanes that lie there.
class PointedEvent : public UIEvent {
public:
    explicit PointedEvent(Point window_)
        : window(window_) {}
    bool LiesIn(GlogPane &) const;

private:
    Point window;
};

// One axis of a turn of the wheel.
class WheelEvent : public PointedEvent {
public:
    WheelEvent(Point window, float delta, int axis);
    boost::shared_ptr<MouseWheelParams> GetMouseWheelParams() override { return params; }

private:
    boost::shared_ptr<MouseWheelParams> params;
};
