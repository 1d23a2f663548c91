// A line of text in which each part has a look of its own.
#pragma once
#include "host/AutoPtr.h"
#include "host/OSFont.h"
#include "host/UString.h"

struct RGBColor;

// One part of the line; only the host looks inside.
class StyledStringItem {
public:
    virtual ~StyledStringItem() {}
};

// A part with a text, a font (family, face and size of the record) and a colour, which are copied. A null
// colour is the one that the port has when the line is drawn. The caller owns the part.
AutoPtr<StyledStringItem> NewStyledText(UString const &, fontSaveRec const &, RGBColor const *);

class StyledString {
public:
    StyledString(); // without parts
    ~StyledString();

    // Appends a part and takes it over; an empty pointer has no effect. Parts that do not come from
    // NewStyledText show nothing.
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
