// The colour under everything that an update draws.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstdint>
#include <pixman.h>

class Surface;

// Lists, bars and boxes begin by painting all of their place, so that a ground laid there first would be
// written for nothing, a megabyte in a large list. So the ground waits, and is laid where something is about
// to be drawn that does not cover it, and in the end everywhere else.
class Ground {
public:
    Ground();
    ~Ground();
    Ground(Ground const &) = delete;
    Ground &operator=(Ground const &) = delete;

    // Whether any of it is still to be laid.
    bool Waits() const { return surface != nullptr; }
    // Takes the place of one that waits. The surface is not owned; Forget has to be called before it dies.
    void Begin(Surface &, pixman_region32_t const &where, std::uint32_t pixel);
    // The box is about to be painted over, as far as it lies in the clip.
    void Cover(DeviceRect const &box, pixman_region32_t const &clip);
    // The box is about to be drawn on: lays what waits within all of the clip, for what is drawn next in it.
    void Prepare(DeviceRect const &box, pixman_region32_t const &clip);
    void Finish();
    void Forget();

private:
    bool WaitsIn(DeviceRect const &) const;
    void Lay(pixman_region32_t const &);
    void Subtract(pixman_region32_t const &);

    Surface *surface = nullptr;
    pixman_region32_t rest; // what waits
    std::uint32_t pixel = 0;
};
