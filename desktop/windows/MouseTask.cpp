#include "host/MouseTask.h"
#include "host/Services.h"

namespace {
double const kAutoScrollSeconds = 1.0 / 20.0;
}

MouseTask::MouseTask(int)
    : startPoint{0, 0}
    , sleepTime(-1)
    , trackingResult(MouseTracking::Result(0)) {}

MouseTask::~MouseTask() {}

bool MouseTask::MouseIsDragging(Point &where) {
    if (sleepTime < 0) {
        trackingResult = MouseTracking::Result(0);
        return ::MouseIsDragging(&where, nullptr);
    }
    return MouseIsDraggingWithTimeout(sleepTime, &where, nullptr, &trackingResult);
}

Point MouseTask::GetStartPoint() const { return startPoint; }

MouseTracking::Result MouseTask::GetTrackingResult() const { return trackingResult; }

double MouseTask::DefaultAutoScrollTime() { return kAutoScrollSeconds; }

void MouseTask::SetSleepTime(double const &seconds) { sleepTime = seconds; }
