#include "graphics/PixelLine.h"
#include "host/OSPath.h"
#include <algorithm>
#include <array>

PixelLine::PixelLine(OSPath &target)
    : path(target) {}

void PixelLine::Add(int newH, int v) {
    if (count > 0 && newH == h && v == last.v)
        return; // goes nowhere
    if (count > 0 && newH != h)
        EndColumn();
    h = newH;
    Kept const point = {count, v};
    if (count == 0)
        first = second = top = bottom = last = point;
    if (count == 1)
        second = point;
    if (v < top.v)
        top = point;
    if (v > bottom.v)
        bottom = point;
    beforeLast = last;
    last = point;
    ++count;
}

void PixelLine::EndColumn() {
    std::array<Kept, 6> kept = {first, second, top, bottom, beforeLast, last};
    std::sort(kept.begin(), kept.end(), [](Kept const &a, Kept const &b) { return a.index < b.index; });
    int former = -1;
    for (Kept const &point : kept) {
        if (point.index == former)
            continue;
        former = point.index;
        if (begun)
            path.AddLine(h, point.v);
        else
            path.CreateSubpath(h, point.v);
        begun = true;
    }
    count = 0;
}

void PixelLine::Finish() {
    if (count > 0)
        EndColumn();
}
