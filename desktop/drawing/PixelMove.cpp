#include "desktop/drawing/PixelMove.h"
#include "desktop/drawing/Surface.h"
#include <cstring>
#include <pixman.h>

namespace {

// Rows are copied against the direction of the move, so that none is overwritten before it has been read.
void MoveBox(Surface &surface, pixman_box32_t const &box, int dx, int dy) {
    std::size_t const bytes = static_cast<std::size_t>(box.x2 - box.x1) * sizeof(std::uint32_t);
    int const rows = box.y2 - box.y1;
    for (int i = 0; i < rows; ++i) {
        int y = dy > 0 ? box.y2 - 1 - i : box.y1 + i;
        std::memmove(surface.Row(y) + box.x1, surface.Row(y - dy) + box.x1 - dx, bytes);
    }
}

} // namespace

void MovePixels(Surface &surface, pixman_region32 const &destination, int dx, int dy) {
    int count = 0;
    pixman_box32_t const *boxes =
        pixman_region32_rectangles(const_cast<pixman_region32_t *>(&destination), &count);
    // A region's boxes lie in bands of equal top and bottom, from top to bottom, and in a band from left to
    // right. The bands are taken against the vertical direction of the move and the boxes of a band against
    // the horizontal one, for the same reason as the rows of a box.
    int first = dy > 0 ? count : 0;
    while (dy > 0 ? first > 0 : first < count) {
        int begin = first, end = first;
        if (dy > 0) {
            for (begin = end - 1; begin > 0 && boxes[begin - 1].y1 == boxes[end - 1].y1;)
                --begin;
            first = begin;
        } else {
            for (end = begin + 1; end < count && boxes[end].y1 == boxes[begin].y1;)
                ++end;
            first = end;
        }
        for (int i = 0; i < end - begin; ++i)
            MoveBox(surface, boxes[dx > 0 ? end - 1 - i : begin + i], dx, dy);
    }
}
