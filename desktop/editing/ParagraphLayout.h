// One paragraph, broken into lines.
#pragma once
#include "desktop/editing/ShownText.h"
#include "desktop/editing/StyleRuns.h"
#include "host/TextSettings.h"
#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

typedef struct _cairo cairo_t;
typedef struct _PangoLayout PangoLayout;
typedef struct _PangoLayoutLine PangoLayoutLine;

// Units count from the paragraph's start, pixels from the top left of its box, which is as wide as the text
// may be. Everything is in whole logical pixels.
class ParagraphLayout {
public:
    static constexpr int kUnlimited = -1;

    struct Room {
        int width;  // of the box in which lines are aligned
        bool wraps; // lines break where it is full
        TextSettings::Alignment alignment;
    };
    struct Line {
        std::size_t start, end; // units; a space where the line was broken is in it
        int top, height, baseline;
        int left, width;
        int inkTop, inkBottom; // as far as accents and tails reach
        bool rightToLeft;
    };
    typedef std::pair<int, int> Range; // from, to

    ParagraphLayout(std::u16string_view, StyleRuns::List const &, Room const &);
    ~ParagraphLayout();
    ParagraphLayout(ParagraphLayout const &) = delete;
    ParagraphLayout &operator=(ParagraphLayout const &) = delete;

    // False once laying it out anew may give something else.
    bool IsCurrent() const;
    int Height() const { return lines.back().top + lines.back().height; }
    std::vector<Line> const &Lines() const { return lines; }
    std::size_t LineAtUnit(std::size_t) const; // the later of two lines that meet there
    std::size_t LineAtHeight(int v) const;

    // Where an insertion point stands.
    int LeftOf(std::size_t unit) const;
    // The insertion point nearest to the place.
    std::size_t UnitAt(std::size_t line, int h) const;
    // The same, but the character that the place lies on.
    std::size_t CharacterAt(std::size_t line, int h) const;
    // What the units between the two places cover in the line, in order from the left.
    std::vector<Range> RangesOf(std::size_t line, std::size_t start, std::size_t end) const;

    // The next place for an insertion point in the order of the text; the same one at either end.
    std::size_t Before(std::size_t unit) const;
    std::size_t After(std::size_t unit) const;
    // The same as it is seen; false when that leaves the paragraph.
    bool Step(std::size_t &unit, bool toTheRight) const;
    // Where the word begins that lies before the place, and where the one ends that lies behind it.
    std::size_t WordStartBefore(std::size_t unit) const;
    std::size_t WordEndAfter(std::size_t unit) const;
    // The word at the place; where there is none, the single character.
    void WordAround(std::size_t unit, std::size_t &start, std::size_t &end) const;
    // Where the deletion of the character before the place begins: of one that is built up from several, some
    // scripts lose the last part only.
    std::size_t DeletionStart(std::size_t unit) const;
    // Whether the paragraph is written from right to left.
    bool IsRightToLeft() const { return lines.front().rightToLeft; }

    // Draws the line, in a box that begins at the place; text without a colour of its own takes the
    // context's.
    void DrawLine(cairo_t *, std::size_t line, int h, int v) const;

private:
    explicit ParagraphLayout(std::u16string_view units);
    void Replace(PangoLayout *);
    void Make(StyleRuns::List const &, Room const &);
    bool MakeSmaller(StyleRuns::List &) const;
    void MeasureLines(StyleRuns::List const &, Room const &);
    PangoLayoutLine *PangoLine(std::size_t line) const;
    bool IsStop(std::size_t character) const;
    std::vector<int> PlacesIn(std::size_t line) const;

    ShownText text;
    PangoLayout *layout = nullptr;
    std::vector<Line> lines;
    unsigned int generation;
};
