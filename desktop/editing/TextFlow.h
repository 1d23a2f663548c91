// An edited text as it is laid out.
#pragma once
#include "desktop/editing/ParagraphLayout.h"
#include "desktop/editing/TextDocument.h"
#include "host/TextSettings.h"
#include <cstddef>
#include <map>
#include <memory>

// Lays a paragraph out when it is first asked for, and keeps it while it is near what is shown. The heights
// of the others are guesses, so that a long text is there at once. Pixels count from the text's top left
// corner, units from its start.
class TextFlow {
public:
    explicit TextFlow(TextDocument &);

    // The box that lines are aligned and, in a text of several lines, broken in.
    void SetRoom(int width, TextSettings::Alignment);
    // How high what is not laid out will be, if the text begins with this look.
    HeightGuess GuessFor(EditStyle const &) const;
    // To be called with every change of the document's text.
    void TextChanged(ParagraphChange const &) noexcept;
    // And when the look of all that is there may have changed; the guess is the one for the new look.
    void LooksChanged(HeightGuess const &) noexcept;
    // The same of what lies between the two places.
    void LooksChanged(std::size_t start, std::size_t end);

    // Valid until the next change, and until Forget.
    ParagraphLayout const &LayoutOf(std::size_t paragraph);
    // Drops what is laid out beyond these paragraphs.
    void ForgetAllBut(std::size_t first, std::size_t last);
    std::size_t NumLaidOut() const { return layouts.size(); }

    long long Height() const { return document.Paragraphs().Height(); }
    // The height of a line with the look at the text's start.
    int LineHeight() const;

    struct Place { // of an insertion point
        int h;
        long long top;
        int height;
    };
    Place PlaceOf(std::size_t unit);
    std::size_t UnitAt(int h, long long v);
    std::size_t CharacterAt(int h, long long v);

    // As those of ParagraphLayout, but across paragraphs.
    std::size_t Before(std::size_t unit);
    std::size_t After(std::size_t unit);
    std::size_t Step(std::size_t unit, bool toTheRight);
    std::size_t WordBefore(std::size_t unit);
    std::size_t WordAfter(std::size_t unit);
    void WordAround(std::size_t unit, std::size_t &start, std::size_t &end);
    std::size_t DeletionStart(std::size_t unit);
    std::size_t LineStart(std::size_t unit);
    std::size_t LineEnd(std::size_t unit);
    // From where to where the unit's paragraph goes. Where lines do not break, that may be on either side of
    // the box.
    ParagraphLayout::Range ExtentOf(std::size_t unit);
    // Whether the unit's paragraph is written from right to left.
    bool IsRightToLeft(std::size_t unit);
    // The paragraph of the unit, with what ends it.
    void ParagraphAround(std::size_t unit, std::size_t &start, std::size_t &end) const;

private:
    struct Spot { // a unit within its paragraph
        std::size_t paragraph, start, unit;
    };
    Spot SpotOf(std::size_t unit) const;
    static int LineHeightOf(EditStyle const &);
    Spot SpotAtHeight(long long v, std::size_t &line);

    TextDocument &document;
    int width = 0;
    TextSettings::Alignment alignment = TextSettings::kAlignDefault;
    std::map<std::size_t, std::unique_ptr<ParagraphLayout>> layouts; // by paragraph
};
