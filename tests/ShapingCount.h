// How many texts are shaped: by the count of the layouts that Pango is asked for. For one source of a test
// program, which needs the library of dlsym.
#pragma once
#include <dlfcn.h>

namespace ShapingCount {
inline int layouts = 0; // so far; a font that is used for the first time is measured, by a layout of its own
}

// Stands before Pango's own, which it calls.
extern "C" void *pango_layout_new(void *context) {
    typedef void *(*New)(void *);
    static New const own = reinterpret_cast<New>(dlsym(RTLD_NEXT, "pango_layout_new"));
    ++ShapingCount::layouts;
    return own(context);
}
