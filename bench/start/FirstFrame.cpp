// Reports when the first frame is on the screen, as one line on standard output: the monotonic clock and the
// processor time of the process, both in nanoseconds.
//
// It stands between the program and SDL or the X server: the linker finds these functions before the
// library's. So two programs that know nothing of them are timed at the very same point, the first picture
// that the server has.
#include <SDL.h>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <dlfcn.h>
// Last, since it defines common words.
#include <X11/Xlib.h>
#include <X11/extensions/XShm.h>

namespace {

long long Nanoseconds(clockid_t clock) {
    constexpr long long kPerSecond = 1000000000;
    timespec now = {};
    clock_gettime(clock, &now);
    return static_cast<long long>(now.tv_sec) * kPerSecond + now.tv_nsec;
}

// The function of that name in the next library.
template <class Function> Function *Next(char const *name) {
    void *const found = dlsym(RTLD_NEXT, name);
    if (!found) {
        std::fprintf(stderr, "%s is not in any library\n", name);
        std::exit(EXIT_FAILURE);
    }
    return reinterpret_cast<Function *>(found);
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

// SDL waits for the server before it returns from either call.
extern "C" int SDL_UpdateWindowSurfaceRects(SDL_Window *window, SDL_Rect const *rects, int count) {
    static auto *const update = Next<decltype(SDL_UpdateWindowSurfaceRects)>("SDL_UpdateWindowSurfaceRects");
    int const result = update(window, rects, count);
    ReportOnce();
    return result;
}

extern "C" int SDL_UpdateWindowSurface(SDL_Window *window) {
    static auto *const update = Next<decltype(SDL_UpdateWindowSurface)>("SDL_UpdateWindowSurface");
    int const result = update(window);
    ReportOnce();
    return result;
}

// What draws past SDL does not wait for the server; the other program did.
static void ReportWhenShown(Display *display) {
    XSync(display, False);
    ReportOnce();
}

extern "C" Bool XShmPutImage(Display *display, Drawable drawable, GC context, XImage *image, int fromX,
                             int fromY, int toX, int toY, unsigned int width, unsigned int height,
                             Bool sendEvent) {
    static auto *const put = Next<decltype(XShmPutImage)>("XShmPutImage");
    Bool const result =
        put(display, drawable, context, image, fromX, fromY, toX, toY, width, height, sendEvent);
    ReportWhenShown(display);
    return result;
}

extern "C" int XPutImage(Display *display, Drawable drawable, GC context, XImage *image, int fromX, int fromY,
                         int toX, int toY, unsigned int width, unsigned int height) {
    static auto *const put = Next<decltype(XPutImage)>("XPutImage");
    int const result = put(display, drawable, context, image, fromX, fromY, toX, toY, width, height);
    ReportWhenShown(display);
    return result;
}
