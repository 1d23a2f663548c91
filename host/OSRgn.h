#pragma once
#include "host/Geometry.h"

class OSRgn {
public:
    OSRgn();
    explicit OSRgn(Rect const &);
    OSRgn(OSRgn const &);
    ~OSRgn();
    OSRgn &operator=(OSRgn const &);
    bool Contains(Point const &) const;
    void Offset(double dh, double dv);
private:
    struct Rep;
    Rep *rep;
};

class TempRgn {
public:
    TempRgn();
    ~TempRgn();
    operator OSRgn *() const { return region; }
private:
    TempRgn(TempRgn const &);
    TempRgn &operator=(TempRgn const &);
    OSRgn *region;
};

class AutoRgnHandle {
public:
    AutoRgnHandle() : region(0) {}
    ~AutoRgnHandle();
    void Copy(OSRgn *);
    void reset(OSRgn * = 0);
    OSRgn *get() const { return region; }
private:
    AutoRgnHandle(AutoRgnHandle const &);
    AutoRgnHandle &operator=(AutoRgnHandle const &);
    OSRgn *region;
};

namespace CarbonUtils {

Rect GetRgnBounds(OSRgn *);
}
