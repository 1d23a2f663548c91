// The processor time of the process, so that other programs do not count.
#pragma once
#include <ctime>

namespace ProcessorClock {

inline double Seconds() {
    double const kSecondsPerNanosecond = 1e-9;
    timespec now = {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * kSecondsPerNanosecond;
}

} // namespace ProcessorClock
