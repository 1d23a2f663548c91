// Sheets of paper.
#pragma once
#include "host/Geometry.h"
#include <string>

// Points, of which an inch has 72.
struct Paper {
    int width, height;
    int margin; // on all sides; nothing is printed there

    // Throws std::invalid_argument for a name that is none.
    static Paper Named(std::string const &);
    // What can be printed on, from (0, 0).
    Rect Printable() const {
        return {0, 0, static_cast<short>(height - 2 * margin), static_cast<short>(width - 2 * margin)};
    }
};
