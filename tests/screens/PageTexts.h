// The texts that are drawn when a page of the gallery is drawn as a whole, with where they lie and on what.
#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
#include <ostream>
#include <string>
#include <vector>

struct PageFile;
class DesktopOptions;

// One text, as a pane asked for it. Boxes are in the window's logical pixels.
struct PageText {
    std::string text;
    RGBColor color;
    Rect box;        // all of it, from its first letter to its last
    Rect room;       // what the pane left for it; the box where there is no limit
    Rect clip;       // what lies outside does not show
    bool isInRect;   // rather than at a point
    bool wraps;      // into several lines
    bool isCentred;  // in its room, as on a button
    bool isCovered;  // by something that was drawn later
    double contrast; // with what was there before, at the worst place; from 1 to 21

    bool HasRoom() const;          // sideways; with a little to spare on a button
    bool IsWholeUpAndDown() const; // but for what is free above and below letters
    // Whether letters of both could touch.
    bool Touches(PageText const &) const;
};

std::ostream &operator<<(std::ostream &, PageText const &); // the text and its place

namespace PageTexts {

// What the page draws. Leaves out what does not show at all.
std::vector<PageText> Of(PageFile const &, DesktopOptions const &);

} // namespace PageTexts
