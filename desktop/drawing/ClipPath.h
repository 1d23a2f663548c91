// A path that narrows a clip, at the resolution of the device.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <memory>
#include <pixman.h>

class OSPath;
typedef struct _cairo cairo_t; // NOLINT(bugprone-reserved-identifier): Cairo's own name
struct cairo_path;

// Does not change once it is made, so that saved clips can share it. A clip that has been narrowed by several
// paths is the meeting of a chain of them.
class ClipPath {
public:
    // The path is in local coordinates, of which (originH, originV) is added to get to the window's. What
    // lies outside of the given number of device pixels is left out.
    ClipPath(OSPath const &, int originH, int originV, DeviceScale, int deviceWidth, int deviceHeight,
             std::shared_ptr<ClipPath const> outer);
    ~ClipPath();
    ClipPath(ClipPath const &) = delete;
    ClipPath &operator=(ClipPath const &) = delete;

    // The device pixels that belong to this path and all outer ones, for drawing in whole pixels: those whose
    // centre is inside.
    pixman_region32_t const *Pixels() const { return &pixels; }
    // Narrows the clip of the context by this path and all outer ones, with smooth edges. The context's
    // matrix has to be the identity.
    void Narrow(cairo_t *) const;

private:
    struct DestroyPath {
        void operator()(cairo_path *) const;
    };
    std::unique_ptr<cairo_path, DestroyPath> path; // device coordinates
    pixman_region32_t pixels;
    std::shared_ptr<ClipPath const> outer;
};
