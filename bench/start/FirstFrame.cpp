// Reports when the first frame is on the screen, as one line on standard output: the monotonic clock and the
// processor time of the process, both in nanoseconds.
//
// It stands between the program and SDL: the linker finds this function before the library's. So two programs
// that know nothing of it are timed at the very same point.
#include <SDL.h>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <dlfcn.h>

namespace {

typedef int (*UpdateFunction)(SDL_Window *, SDL_Rect const *, int);

long long Nanoseconds(clockid_t clock) {
    constexpr long long kPerSecond = 1000000000;
    timespec now = {};
    clock_gettime(clock, &now);
    return static_cast<long long>(now.tv_sec) * kPerSecond + now.tv_nsec;
}

UpdateFunction FindUpdate() {
    void *const found = dlsym(RTLD_NEXT, "SDL_UpdateWindowSurfaceRects");
    if (!found) {
        std::fputs("SDL_UpdateWindowSurfaceRects is not in any library\n", stderr);
        std::exit(EXIT_FAILURE);
    }
    return reinterpret_cast<UpdateFunction>(found);
}

void ReportOnce() {
    static bool reported = false;
    if (reported)
        return;
    reported = true;
    long long const now = Nanoseconds(CLOCK_MONOTONIC);
    std::printf("%lld %lld\n", now, Nanoseconds(CLOCK_PROCESS_CPUTIME_ID));
    std::fflush(stdout);
}

} // namespace

// SDL waits for the server before it returns from this call.
extern "C" int SDL_UpdateWindowSurfaceRects(SDL_Window *window, SDL_Rect const *rects, int count) {
    static UpdateFunction const update = FindUpdate();
    int const result = update(window, rects, count);
    ReportOnce();
    return result;
}
