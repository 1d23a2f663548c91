// The fonts that text is shaped with.
#pragma once
#include "desktop/type/FontSpec.h"
#include "desktop/type/FontTable.h"
#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

typedef struct _FcConfig FcConfig;
typedef struct _PangoContext PangoContext;
typedef struct _PangoFontDescription PangoFontDescription;
typedef struct _PangoFontMap PangoFontMap;
typedef struct _PangoLayout PangoLayout;
class PlainShaper;

// Whole logical pixels, the same at every scale.
struct FontMetrics {
    int ascent;   // above the baseline
    int descent;  // below it
    int maxWidth; // of the widest character
    int LineHeight() const { return ascent + descent; }
};

// One for the process. It knows the font files of the font table alone, so that text looks the same on every
// machine and is there at once; a face's files are opened when the face is first used. When a text has
// characters that they lack, the system's fonts are added behind them.
class FontLibrary {
public:
    static FontLibrary &Instance();

    // An empty layout, the caller's, with the font: grayscale, glyphs on whole logical pixels.
    PangoLayout *NewLayout(FontSpec const &);
    // For texts in the font that need no layout; stays the library's, and valid until another font is asked
    // for.
    PlainShaper const &Plain(FontSpec const &);
    FontMetrics const &Metrics(FontSpec const &);
    // How Pango is told of the font; stays the library's, and valid until the generation changes. A first
    // call may open files, after which layouts of other fonts are to be made anew.
    PangoFontDescription const *Description(FontSpec const &);

    // Adds the system's fonts; false when they had been added before.
    bool AddSystemFonts();
    // Grows whenever text that was shaped before may look different if shaped again. Call it before using
    // what was kept.
    unsigned int Generation();

private:
    struct Font;

    FontLibrary();
    ~FontLibrary() = delete;
    FontLibrary(FontLibrary const &) = delete;
    FontLibrary &operator=(FontLibrary const &) = delete;

    void Refresh();
    void Open();
    void Close();
    void OpenMap();
    void CloseMap();
    void LoadFace(int faceBits);
    void UseConfig(FcConfig *);
    Font &Find(FontSpec const &);

    std::vector<FontFile> files;
    std::uint64_t loadedFaces = 0; // bit n: the files of face n are loaded
    bool systemFonts = false;
    FcConfig *config = nullptr;
    PangoFontMap *map = nullptr;
    PangoContext *context = nullptr;
    unsigned int resourceGeneration = 0;
    unsigned int generation = 0;
    struct SpecHash {
        std::size_t operator()(FontSpec const &) const;
    };
    std::unordered_map<FontSpec, Font, SpecHash> fonts;
};
