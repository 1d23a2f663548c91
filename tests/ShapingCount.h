// How many texts are shaped: by the count of the layouts that Pango is asked for, and of the runs that it is
// given to shape without one. For one source of a test program, which needs the library of dlsym.
#pragma once
#include <dlfcn.h>

namespace ShapingCount {
inline int texts = 0; // so far; a font that is used for the first time is measured, by layouts of its own

template <class Function> Function Next(char const *name) {
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}
} // namespace ShapingCount

// These stand before Pango's own, which they call.
extern "C" void *pango_layout_new(void *context) {
    static auto const own = ShapingCount::Next<void *(*)(void *)>("pango_layout_new");
    ++ShapingCount::texts;
    return own(context);
}

extern "C" void pango_shape_with_flags(char const *item, int itemLength, char const *paragraph,
                                       int paragraphLength, void const *analysis, void *glyphs, int flags) {
    typedef void (*Shape)(char const *, int, char const *, int, void const *, void *, int);
    static auto const own = ShapingCount::Next<Shape>("pango_shape_with_flags");
    ++ShapingCount::texts;
    own(item, itemLength, paragraph, paragraphLength, analysis, glyphs, flags);
}
