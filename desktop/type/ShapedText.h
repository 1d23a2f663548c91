// A text turned into glyphs and lines.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/type/FontSpec.h"
#include "host/Geometry.h"
#include "host/TextSettings.h"
#include <boost/container/small_vector.hpp>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

typedef struct _cairo cairo_t;
typedef struct _cairo_scaled_font cairo_scaled_font_t;
typedef struct _PangoFont PangoFont;
typedef struct _PangoGlyphItem PangoGlyphItem;
typedef struct _PangoGlyphString PangoGlyphString;
typedef struct _PangoLayout PangoLayout;
typedef struct _PangoLayoutLine PangoLayoutLine;
typedef struct _PangoRectangle PangoRectangle;

class PixelScope;

// All that shaping depends on beside the text.
struct TextShape {
    static constexpr int kUnlimited = -1;

    FontSpec font;
    float spacing = 0;  // extra logical pixels between characters
    bool wraps = false; // lines break where the text says and, with a width, where it is reached
    TextSettings::TruncateCode truncation = TextSettings::kTruncateNone;
    int width = kUnlimited;  // where lines break, or the text is shortened; logical pixels
    int height = kUnlimited; // where a text that both wraps and is shortened ends

    // Cuts the spacing to what makes sense; what is not a number is 0.
    static float CleanSpacing(float);

    bool operator==(TextShape const &other) const {
        return font == other.font && spacing == other.spacing && wraps == other.wraps &&
               truncation == other.truncation && width == other.width && height == other.height;
    }
};

// Glyphs, lines and measures of one text; never changes. Measures are whole logical pixels.
class ShapedText {
public:
    ShapedText(std::u16string_view, TextShape const &);
    ~ShapedText();
    ShapedText(ShapedText const &) = delete;
    ShapedText &operator=(ShapedText const &) = delete;

    // False once shaping anew may give something else.
    bool IsCurrent() const;

    int Width() const { return width; } // of the widest line
    int InkWidth() const { return inkRight > inkLeft ? inkRight - inkLeft : 0; }
    int LineCount() const { return static_cast<int>(lines.size()); }
    int Ascent() const { return ascent; }
    int LineHeight() const { return lineHeight; }
    int Height() const { return LineCount() * lineHeight; }
    // Whether the first line is written from right to left.
    bool IsRightToLeft() const { return rightToLeft; }

    // How far ink reaches beyond the box of all lines, which begins at the first line's ascent and is as wide
    // as Width.
    int Overhang() const { return overhang; }

    // Draws with the first baseline at the point, each line placed within `boxWidth` from it.
    void Draw(cairo_t *, int h, int baseline, int boxWidth, TextSettings::Alignment) const;
    // Draws the same as masks, as far as they lie in `cut`; only where HasMasks says so.
    void DrawMasks(PixelScope &, DeviceScale, int h, int baseline, int boxWidth, TextSettings::Alignment,
                   DeviceRect const &cut) const;
    // Whether all glyphs are masks at that scale.
    bool HasMasks(DeviceScale) const;
    // Where a line of that width begins within the box, counted from its left edge; negative when it is
    // centred or right and too wide.
    static int LineStart(int lineWidth, int boxWidth, TextSettings::Alignment, bool rightToLeft);

private:
    ShapedText();
    // Places are in units of Pango, from the start of the line and its baseline.
    struct Glyph {
        std::uint32_t index;
        int h, v;
    };
    struct Run {
        cairo_scaled_font_t *font; // holds a reference
        std::uint32_t glyphs;      // how many
    };
    struct Line {
        std::uint32_t runs; // how many
        int width;
        bool rightToLeft;
    };
    void TakeMetrics(FontSpec const &);
    bool ShapePlain(std::u16string_view, TextShape const &);
    void Shape(std::u16string_view, TextShape const &);
    void Replace(PangoLayout *);
    void MeasureLines();
    void KeepGlyphs();
    bool AddRunsOf(PangoLayoutLine const &);
    bool AddRun(PangoGlyphItem const &, int &h);
    bool AddGlyphs(PangoFont *, PangoGlyphString const &, int &h, int rise);
    void MeasureLine(PangoRectangle ink, PangoRectangle logical, bool fromTheRight);
    void DropGlyphs();
    void DrawRuns(cairo_t *, Run const *&, Glyph const *&, Line const &, int h, int baseline) const;

    // Only of texts that the glyphs alone do not tell: a layout takes several times their memory.
    PangoLayout *layout = nullptr;
    std::vector<Glyph> glyphs;
    boost::container::small_vector<Run, 1> runs;
    boost::container::small_vector<Line, 1> lines;
    int width = 0;
    int inkLeft = 0, inkRight = 0; // from the line starts
    int ascent = 0, lineHeight = 0;
    int overhang = 0;
    bool rightToLeft = false;
    unsigned int generation = 0;
};
