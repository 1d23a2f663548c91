#pragma once
#include "host/Geometry.h"
#include "host/OSFont.h"
#include "host/TextSettings.h"
#include "host/UString.h"

namespace OS {

class TextLayout {
public:
    TextLayout();
    ~TextLayout();
    double GetWidth() const;
private:
    TextLayout(TextLayout const &);
    TextLayout &operator=(TextLayout const &);
    struct Rep;
    Rep *rep;
};
}

int LooseStringWidth(UString const &, float, float);
int TightStringWidth(UString const &, float, float);

void DrawString(UString const &);

void DrawStringAtPoint(UString const &, Point, int maxWidth, TextSettings::TruncateCode);

void DrawStringInRect(UString const &, Rect const &, TextSettings::Alignment, TextSettings::TruncateCode,
                      int verticalAlignment, int wrap, int orientation,
                      float spacing, float scale, float third, float fourth);

void DrawTextLayoutInRect(OS::TextLayout &, UString const &, Rect const &, int font,
                          TextSettings::Alignment, TextSettings::TruncateCode,
                          int verticalAlignment, int wrap, int orientation, int unknown,
                          float spacing, float scale, float third);

void DrawTextLayoutInRect(OS::TextLayout &, UString const &, Rect const &, OS::Font::FamilyID const &,
                          short style, short size, TextSettings::Alignment, TextSettings::TruncateCode,
                          int verticalAlignment, int wrap, int orientation, int unknown,
                          float spacing, float scale, float third);

void UpdateTextLayout(OS::TextLayout &, UString const &, int font,
                      TextSettings::Alignment, TextSettings::TruncateCode,
                      int verticalAlignment, int wrap, int orientation, int unknown,
                      float spacing, float scale, float third);

void UpdateTextLayout(OS::TextLayout &, UString const &, OS::Font::FamilyID const &,
                      short style, short size, TextSettings::Alignment, TextSettings::TruncateCode,
                      int verticalAlignment, int wrap, int orientation, int unknown,
                      float spacing, float scale, float third);
