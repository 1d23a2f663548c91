// Measuring and drawing text.
//
// Text is drawn in the port's foreground colour. Measures are whole pixels, the same for the same text and
// font every time and at every scale of the window. All calls share some arguments:
//
//   font               index into the font table (GetIndVelaFont)
//   style, size        face bits as in fontSaveRec, and logical pixels
//   verticalAlignment  0: at the top of the rectangle, 1: centred
//   wrap               0: one line, 1: broken at the rectangle's width
//   orientation        0: upright; no other value is defined
//   spacing, scale     extra space between characters (0.0: none) and horizontal scale (1.0: none)
//
// The arguments named unknown, third and fourth change nothing; pass 0, 1.0 and 0.0.
#pragma once
#include "host/Geometry.h"
#include "host/OSFont.h"
#include "host/TextSettings.h"
#include "host/UString.h"

namespace OS {

// Keeps what was worked out for a text, so that drawing the same text again costs no shaping. Give each text
// that is drawn more than once a layout of its own. The calls that take a layout say everything anew, so one
// layout may serve different texts in turn, only slower.
class TextLayout {
public:
    TextLayout(); // for no text; allocates nothing much
    ~TextLayout();

    // Width in pixels of the text that the layout was last drawn or updated with; 0 before that. A wrapped
    // text has the width of its longest line.
    double GetWidth() const;

private:
    TextLayout(TextLayout const &);
    TextLayout &operator=(TextLayout const &);

    friend struct TextLayoutAccess;
    struct Rep;
    Rep *rep;
};
} // namespace OS

// Advance width of the text in the port's font, in pixels. 0 for an empty text.
int LooseStringWidth(UString const &, float spacing, float scale);
// Width of the text's ink in the port's font: without the blank margins of its first and last character.
int TightStringWidth(UString const &, float spacing, float scale);

// Draws the text in the port's font with its baseline at the pen, and moves the pen to the text's end.
void DrawString(UString const &);
// Draws the text in the port's font with its baseline starting at the point; the pen stays. A text wider than
// maxWidth is shortened as the code says; -1: no limit. No text is drawn for a width of 0 or below -1.
void DrawStringAtPoint(UString const &, Point, int maxWidth, TextSettings::TruncateCode);

// Draws the text in the port's font inside the rectangle.
void DrawStringInRect(UString const &, Rect const &, TextSettings::Alignment, TextSettings::TruncateCode,
                      int verticalAlignment, int wrap, int orientation, float spacing, float scale,
                      float third, float fourth);

// Draws the text inside the rectangle in a font of the font table. The port's font stays as it is.
void DrawTextLayoutInRect(OS::TextLayout &, UString const &, Rect const &, int font, TextSettings::Alignment,
                          TextSettings::TruncateCode, int verticalAlignment, int wrap, int orientation,
                          int unknown, float spacing, float scale, float third);
// The same in any font.
void DrawTextLayoutInRect(OS::TextLayout &, UString const &, Rect const &, OS::Font::FamilyID const &,
                          short style, short size, TextSettings::Alignment, TextSettings::TruncateCode,
                          int verticalAlignment, int wrap, int orientation, int unknown, float spacing,
                          float scale, float third);

// Brings the layout up to date without drawing, so that GetWidth can be asked. There is no width to wrap or
// shorten the text at: the layout measures it in full, in lines only where the text itself has breaks.
void UpdateTextLayout(OS::TextLayout &, UString const &, int font, TextSettings::Alignment,
                      TextSettings::TruncateCode, int verticalAlignment, int wrap, int orientation,
                      int unknown, float spacing, float scale, float third);
// The same in any font.
void UpdateTextLayout(OS::TextLayout &, UString const &, OS::Font::FamilyID const &, short style, short size,
                      TextSettings::Alignment, TextSettings::TruncateCode, int verticalAlignment, int wrap,
                      int orientation, int unknown, float spacing, float scale, float third);
