// Draws what is round the text of a text field.
#pragma once
#include "host/Geometry.h"

// Takes over the colours and the well of the field that it is given to, which owns it from then on. It has no
// virtual destructor and is deleted as what it is here: a derived class must do without one of its own.
class GTextPaneDrawingHelper {
public:
    // Sets the port's colours: the text's in front, the well's behind. The mode is the field's.
    virtual void SetColors(unsigned char mode) = 0;
    // Draws the well round the rectangle of the field.
    virtual void DrawTextWell(Rect &, unsigned char mode) = 0;
};
