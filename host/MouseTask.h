#pragma once
#include "host/Geometry.h"

namespace MouseTracking {

enum Result { kTimedOut = 8 };
}

class MouseTask {
public:
    explicit MouseTask(int);
    virtual ~MouseTask();
    virtual void MouseTaskBegin() = 0;
    virtual void MouseTaskContinue(Point const &) = 0;
    virtual void MouseTaskEnd() = 0;
    virtual bool MouseIsDragging(Point &);
    Point GetStartPoint() const;
    MouseTracking::Result GetTrackingResult() const;
    static double DefaultAutoScrollTime();
protected:

    void SetSleepTime(double const &seconds);
private:
    friend class GlogPane;
    Point startPoint;
    double sleepTime;
    MouseTracking::Result trackingResult;
};

class OldMouseTask;
