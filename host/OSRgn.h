// Regions: sets of pixels, made of rectangles.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// A set of pixels in the 16-bit plane, copied as a value. Operations that combine regions are in
// host/VelaDrawing.h.
class OSRgn {
public:
    OSRgn(); // empty
    // The rectangle's pixels; none when it is empty or upside down.
    explicit OSRgn(Rect const &);
    OSRgn(OSRgn const &);
    ~OSRgn();
    OSRgn &operator=(OSRgn const &);

    // Whether the pixel whose top left corner is the point belongs to the region.
    bool Contains(Point const &) const;
    // Moves the region by whole pixels, right and down when positive; fractions are rounded.
    void Offset(double dh, double dv);

private:
    friend struct RegionAccess; // the host's way to the representation

    // In place: every call that draws makes some regions.
    static constexpr std::size_t kRepSize = 4 * sizeof(int) + sizeof(void *);
    alignas(void *) unsigned char rep[kRepSize];
};

// A region that lives on the stack; made empty, freed at the end of the scope.
class TempRgn {
public:
    TempRgn();
    ~TempRgn();
    // For the calls that take a region. Never null; stays this object's.
    operator OSRgn *() const { return region; }

private:
    TempRgn(TempRgn const &);
    TempRgn &operator=(TempRgn const &);

    OSRgn *region;
};

// Owns a region or none.
class AutoRgnHandle {
public:
    AutoRgnHandle()
        : region(0) {} // none
    ~AutoRgnHandle();

    // Holds a copy of the region from now on; null: none. The argument stays the caller's.
    void Copy(OSRgn *);
    // Frees the region that is held and takes this one over, which must have come from VelaDrawing::NewRgn;
    // null: none.
    void reset(OSRgn * = 0);
    // The region, or null. It stays this object's.
    OSRgn *get() const { return region; }

private:
    AutoRgnHandle(AutoRgnHandle const &);
    AutoRgnHandle &operator=(AutoRgnHandle const &);

    OSRgn *region;
};

namespace CarbonUtils {

// The smallest rectangle around the region: all zero for an empty one. Null stands for "everything" and gives
// the whole 16-bit plane, -32768 to 32767 on both axes.
Rect GetRgnBounds(OSRgn *);

} // namespace CarbonUtils
