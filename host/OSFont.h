// Fonts: families, the application's font table, and the measures of the port's font.
#pragma once

class FontFamilies;

namespace OS {
namespace Font {

// Families that exist on every system.
enum FixedFontFamily { kFixedFontFamily0 = 0 }; // 0: the family of dialog text

// Names a font family; copied as a value.
class FamilyID {
public:
    FamilyID(); // the family of dialog text
    FamilyID(FixedFontFamily);
    FamilyID(FamilyID const &);
    ~FamilyID();
    FamilyID &operator=(FamilyID const &);
    FamilyID &operator=(FixedFontFamily);

    // A number for comparing: equal for equal families and different for others. It may change from one run
    // of the program to the next.
    unsigned int GetOrderedFontID() const;

private:
    friend class ::FontFamilies;
    struct Rep;
    Rep *rep;
};
} // namespace Font
} // namespace OS

// One font: family, face (0 plain, 1 bold, 2 italic, 4 underlined, 32
// condensed; the values add up) and size in logical pixels.
struct fontSaveRec {
    OS::Font::FamilyID family;
    short face;
    short size;
};

// A font of the application's font table. The table has at least the indices 0 to 9; any other index gives
// the font of index 0. The result is never null, stays the host's and remains valid.
fontSaveRec const *GetIndVelaFont(int index);
// Makes the font the current port's, family, face and size. The record must not be null and is not kept.
void SetFontData(fontSaveRec const *);

namespace TarnQuickDrawText {

// Measures of a font in whole pixels: height above and depth below the baseline, the widest character, and
// the gap to leave between lines. A line is ascent plus descent high.
struct FontInfo {
    short ascent, descent, widMax, leading;
};
} // namespace TarnQuickDrawText

namespace tarn {

// Measures of the current port's font.
void GetFontInfo(TarnQuickDrawText::FontInfo &);

} // namespace tarn
