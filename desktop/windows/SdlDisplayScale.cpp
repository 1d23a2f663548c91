#include "desktop/windows/SdlDisplayScale.h"
#include <SDL.h>
#include <algorithm>
#include <cmath>
#include <cstdlib>

static double const kPlainDensity = 96.0;
static double const kStep = 0.25, kLeast = 1.0, kGreatest = 4.0;
static double const kSurelyDense = 1.5;

double SdlDisplayScale::FromTextResolution(double dotsPerInch) {
    if (!(dotsPerInch > 0)) // also true for what is not a number
        return kLeast;
    double factor = std::min(dotsPerInch / kPlainDensity, kGreatest);
    return std::max(std::floor(factor / kStep + 0.5) * kStep, kLeast);
}

double SdlDisplayScale::FromDisplayDensity(double dotsPerInch) {
    return dotsPerInch / kPlainDensity >= kSurelyDense ? FromTextResolution(dotsPerInch) : kLeast;
}

namespace {

// The X library, which SDL has loaded; SDL itself does not tell the user's settings.
class XResources {
public:
    XResources()
        : library(SDL_LoadObject("libX11.so.6")) {}
    ~XResources() {
        if (library != nullptr)
            SDL_UnloadObject(library);
    }
    XResources(XResources const &) = delete;
    XResources &operator=(XResources const &) = delete;

    // 0 when it is not set.
    double TextResolution() const {
        typedef struct _XDisplay *(*Open)(char const *);
        typedef char *(*GetDefault)(struct _XDisplay *, char const *, char const *);
        typedef int (*Close)(struct _XDisplay *);
        Open open = Function<Open>("XOpenDisplay");
        GetDefault getDefault = Function<GetDefault>("XGetDefault");
        Close close = Function<Close>("XCloseDisplay");
        if (open == nullptr || getDefault == nullptr || close == nullptr)
            return 0;
        struct _XDisplay *display = open(nullptr);
        if (display == nullptr)
            return 0;
        char const *value = getDefault(display, "Xft", "dpi");
        double resolution = value != nullptr ? std::strtod(value, nullptr) : 0;
        close(display);
        return resolution;
    }

private:
    template <class Type> Type Function(char const *name) const {
        return library != nullptr ? reinterpret_cast<Type>(SDL_LoadFunction(library, name)) : nullptr;
    }
    void *library;
};

} // namespace

double SdlDisplayScale::OfDisplay(int display) const {
    if (!textResolution)
        textResolution = XResources().TextResolution();
    if (*textResolution > 0)
        return FromTextResolution(*textResolution);
    float density = 0;
    return SDL_GetDisplayDPI(display, &density, nullptr, nullptr) == 0 ? FromDisplayDensity(density) : kLeast;
}
