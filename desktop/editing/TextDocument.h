// An edited text: its units, their looks, and its paragraphs.
#pragma once
#include "desktop/editing/ParagraphIndex.h"
#include "desktop/editing/StyleRuns.h"
#include "desktop/editing/TextBuffer.h"
#include <cstdint>
#include <string>
#include <string_view>

// What a change did to the paragraphs.
struct ParagraphChange {
    std::size_t first;          // the first that is another one now
    std::size_t removed, added; // how many from there were replaced by how many
};

// How high a paragraph will be that nobody has laid out yet.
struct HeightGuess {
    std::uint32_t lineHeight = 16;  // pixels
    std::uint32_t unitsPerLine = 0; // 0: lines do not break

    std::uint32_t Of(std::uint32_t units) const {
        return lineHeight * (unitsPerLine > 0 ? units / unitsPerLine + 1 : 1);
    }
};

// A piece of text with its looks.
struct TextFragment {
    std::u16string units;
    StyleRuns::List looks; // counted from its start; never empty
};

class TextDocument {
public:
    // A text of one line is one paragraph, whatever is in it.
    explicit TextDocument(bool severalLines);

    std::size_t Size() const { return buffer.Size(); }
    TextBuffer const &Units() const { return buffer; }
    StyleRuns const &Styles() const { return styles; }
    StyleRuns &Styles() { return styles; }
    ParagraphIndex const &Paragraphs() const { return paragraphs; }
    ParagraphIndex &Paragraphs() { return paragraphs; }
    bool HasSeveralLines() const { return severalLines; }

    // A paragraph's units, without what ends it.
    std::u16string BodyOf(std::size_t paragraph) const;
    TextFragment FragmentOf(std::size_t start, std::size_t end) const;
    class Replacement;
    // What it takes to put the fragment in the place of `removed` units, with all the memory: until Replace,
    // which then needs none, nothing is changed, and nothing may be. The fragment has to stay as well.
    Replacement Prepare(std::size_t start, std::size_t removed, TextFragment const &);
    ParagraphChange Replace(Replacement &&) noexcept;
    // Takes all heights as guesses, of this kind from now on.
    void GuessHeights(HeightGuess const &);

private:
    void PrepareParagraphs(Replacement &);
    std::vector<std::uint32_t> LengthsWith(Replacement const &, std::size_t from, std::size_t to,
                                           bool toEnd) const;
    bool EndsOpen(std::size_t paragraph) const;

    bool severalLines;
    TextBuffer buffer;
    StyleRuns styles;
    ParagraphIndex paragraphs;
    HeightGuess guess;
};

class TextDocument::Replacement {
    friend class TextDocument;

    std::size_t start = 0, removed = 0;
    std::u16string_view inserted;
    StyleRuns::List styles;
    ParagraphIndex::Replacement paragraphs;
    ParagraphChange change = {0, 0, 0};
};
