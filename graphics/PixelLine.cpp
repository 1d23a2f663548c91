#include "graphics/PixelLine.h"
#include "host/OSPath.h"
#include "host/OSPort.h"
#include <algorithm>
#include <array>

namespace {

std::size_t const kWhole = 256; // points that are stroked in one piece
std::size_t const kPiece = 12;  // points of a piece of a longer line

} // namespace

void PixelLine::Add(int newH, int v) {
    if (count > 0 && newH == h && v == last.v)
        return; // goes nowhere
    if (count > 0 && newH != h)
        EndColumn();
    h = newH;
    InColumn const point = {count, v};
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
    std::array<InColumn, 6> points = {first, second, top, bottom, beforeLast, last};
    std::sort(points.begin(), points.end(),
              [](InColumn const &a, InColumn const &b) { return a.index < b.index; });
    std::size_t const start = kept.size();
    int former = -1;
    for (InColumn const &point : points) {
        if (point.index == former)
            continue;
        former = point.index;
        kept.push_back({h, point.v, false, start});
    }
    kept.back().endsColumn = true;
    count = 0;
}

void PixelLine::Stroke(OSPort &port) {
    if (count > 0)
        EndColumn();
    std::size_t start = 0;
    for (std::size_t i = 0; i < kept.size() && kept.size() > kWhole; ++i) {
        if (!kept[i].endsColumn || i - start < kPiece)
            continue;
        StrokePiece(port, start, i);
        start = kept[i].columnStart;
    }
    if (!kept.empty())
        StrokePiece(port, start, kept.size() - 1);
}

void PixelLine::StrokePiece(OSPort &port, std::size_t from, std::size_t to) const {
    OSPath path;
    path.CreateSubpath(kept[from].h, kept[from].v);
    for (std::size_t i = from + 1; i <= to; ++i)
        path.AddLine(kept[i].h, kept[i].v);
    port.StrokePath(path);
}
