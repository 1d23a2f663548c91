// Measures one way to tell listeners, and prints a line with a name and a value for each number of listeners:
// the picoseconds of the processor that a message to all of them takes.
#include "bench/peers/notify/Notify.h"
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <initializer_list>
#include <memory>

namespace {

long const kCalls = 2000000; // of listeners in a measurement
int const kMeasurements = 7;

long long Now() {
    timespec now = {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return now.tv_sec * 1000000000LL + now.tv_nsec;
}

void Measure(int listeners) {
    std::unique_ptr<Notify> const notify(NewNotify());
    if (!notify->AddListeners(listeners))
        return;
    long const messages = kCalls / listeners;
    for (int i = 0; i < kMeasurements; ++i) {
        long long const heard = notify->Heard(), start = Now();
        for (long message = 0; message < messages; ++message)
            notify->Send();
        long long const taken = Now() - start;
        if (notify->Heard() - heard != messages * listeners) {
            std::fprintf(stderr, "notify: a listener has not heard every message\n");
            std::exit(EXIT_FAILURE);
        }
        std::printf("notify-%d %lld\n", listeners, taken * 1000 / messages);
    }
}

} // namespace

int main() {
    for (int listeners : {1, 10, 1000})
        Measure(listeners);
}
