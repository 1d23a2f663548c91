#pragma once

namespace OS { namespace Font {

enum FixedFontFamily { kFixedFontFamily0 = 0 };

class FamilyID {
public:
    FamilyID();
    FamilyID(FixedFontFamily);
    FamilyID(FamilyID const &);
    ~FamilyID();
    FamilyID &operator=(FamilyID const &);
    FamilyID &operator=(FixedFontFamily);
    unsigned int GetOrderedFontID() const;
private:
    struct Rep;
    Rep *rep;
};
} }

struct fontSaveRec {
    OS::Font::FamilyID family;
    short face;
    short size;
};

fontSaveRec const *GetIndVelaFont(int index);
void SetFontData(fontSaveRec const *);

namespace TarnQuickDrawText {

struct FontInfo { short ascent, descent, widMax, leading; };
}

namespace tarn { void GetFontInfo(TarnQuickDrawText::FontInfo &); }
