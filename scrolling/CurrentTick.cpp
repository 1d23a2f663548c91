#include "scrolling/CurrentTick.h"
#include "host/Services.h"

long long CurrentTick() {
    double const ticksPerSecond = 60.0;
    return static_cast<long long>(TarnSystemTime::GetCurrentEventTime() * ticksPerSecond + 0.5);
}
