// A line of text in which each part has a look of its own.
#pragma once
#include "host/AutoPtr.h"

// One part of the line; only the host looks inside.
class StyledStringItem {
public:
    virtual ~StyledStringItem() {}
};

class StyledString {
public:
    StyledString(); // without parts
    ~StyledString();

    // Appends a part and takes it over; an empty pointer has no effect.
    void Add(AutoPtr<StyledStringItem>);
    // Sum of the parts' widths, in pixels.
    int GetWidth() const;
    // The greatest height of a part above the baseline, in pixels.
    short GetAscent() const;
    // Draws the parts one after the other, with their baseline at the pen.
    void Draw();

private:
    StyledString(StyledString const &);
    StyledString &operator=(StyledString const &);

    struct Rep;
    Rep *rep;
};
