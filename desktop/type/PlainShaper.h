// Shaping of the texts that user interfaces are full of.
#pragma once
#include <memory>
#include <string_view>

typedef struct _PangoAnalysis PangoAnalysis;
typedef struct _PangoFont PangoFont;
typedef struct _PangoGlyphString PangoGlyphString;
typedef struct _PangoLayout PangoLayout;

// A layout looks up for every text anew which fonts, scripts and directions it has and where it could be
// broken, which takes several times as long as to shape it. A line of printable ASCII in one font has the
// same of all that as any other: it is looked up once.
class PlainShaper {
public:
    // `layout` gives the font; it is not kept, and without meaning afterwards.
    explicit PlainShaper(PangoLayout *layout);
    ~PlainShaper();
    PlainShaper(PlainShaper const &) = delete;
    PlainShaper &operator=(PlainShaper const &) = delete;

    // The glyphs of the text, as a layout would give them on its only line, with their font; null when a
    // layout has to be asked: for an empty text, for other characters, and where the font lacks some of
    // these.
    PangoFont *Shape(std::u16string_view text, PangoGlyphString *) const;

private:
    struct Kind; // of text: with letters or without
    static bool Look(PangoLayout *, bool letters, PangoAnalysis &);

    std::unique_ptr<Kind[]> kinds; // of both
};
