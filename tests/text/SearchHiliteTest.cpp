// Where a search string is marked in a text that is about to be drawn.
#include "desktop/SimulatedDesktop.h"
#include "desktop/resources/Resources.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/drawing/Canvas.h"
#include "tests/resources/Text.h"
#include "text/SearchFieldPane.h"
#include "text/SearchedForm.h"
#include <gtest/gtest.h>

namespace {

int const kWidth = 200, kHeight = 20;

// In a language, on white paper.
class SearchHilite : public testing::Test {
protected:
    explicit SearchHilite(char const *language = "en")
        : desktop(DesktopOptions().Language(language))
        , canvas(kWidth, kHeight) {
        SetFontData(GetIndVelaFont(0));
    }

    struct Marked { // from the first column of pixels that is painted to the one behind the last
        int from, to;
        bool operator==(Marked const &other) const { return from == other.from && to == other.to; }
        friend std::ostream &operator<<(std::ostream &out, Marked const &m) {
            return out << m.from << " to " << m.to;
        }
    };
    static constexpr Marked kNothing{0, 0};

    Marked Mark(UString const &search, UString const &text, Rect const &rect = {0, 0, kHeight, kWidth}) {
        canvas.Wipe(Canvas::kWhite);
        SearchFieldPane::MaybeHiliteSearchString(search, text, rect);
        Marked marked = kNothing;
        for (int x = 0; x < kWidth; ++x)
            if (canvas.At(x, kHeight / 2) != Canvas::kWhite) {
                if (marked == kNothing)
                    marked.from = x;
                marked.to = x + 1;
            }
        return marked;
    }
    // What the units between the places take in the text.
    static Marked Span(UString const &text, std::size_t start, std::size_t end) {
        return {TightStringWidth(text.substr(0, start), 0, 1), LooseStringWidth(text.substr(0, end), 0, 1)};
    }

    SimulatedDesktop desktop;
    Canvas canvas;
};

class SearchHiliteInGerman : public SearchHilite {
protected:
    SearchHiliteInGerman()
        : SearchHilite("de") {}
};

TEST_F(SearchHilite, AnEmptySearchMarksNothingAndLeavesTheColour) {
    RGBColor const red = {0xFFFF, 0, 0};
    VelaDrawing::RGBForeColor(red);
    EXPECT_EQ(Mark(U(""), U("text")), kNothing);
    RGBColor after;
    VelaDrawing::GetForeColor(&after);
    EXPECT_EQ(after.red, 0xFFFF);
    EXPECT_EQ(after.blue, 0);
}

TEST_F(SearchHilite, MarksTheBeginningOfAWordInEnglish) {
    EXPECT_EQ(Mark(U("ab"), U("xy ab")), Span(U("xy ab"), 3, 5));
    EXPECT_EQ(Mark(U("ab"), U("abc")), Span(U("abc"), 0, 2));
    EXPECT_EQ(Mark(U("ab"), U("xab")), kNothing);
}

TEST_F(SearchHilite, CaseDoesNotCount) {
    EXPECT_EQ(Mark(U("AB"), U("xy abc")), Span(U("xy abc"), 3, 5));
    EXPECT_EQ(Mark(U("ab"), U("xy ABC")), Span(U("xy ABC"), 3, 5));
}

TEST_F(SearchHilite, InEnglishPunctuationIsABlank) {
    EXPECT_EQ(Mark(U("hat"), U("Hi-hat")), Span(U("Hi-hat"), 3, 6));
    EXPECT_EQ(Mark(U("hi.h"), U("Hi-hat")), Span(U("Hi-hat"), 0, 4));
    EXPECT_EQ(Mark(U("-h"), U("Hi-hat")), kNothing); // two blanks
    EXPECT_EQ(Mark(U("12"), U("Take 12")), Span(U("Take 12"), 5, 7)) << "digits are none";
    EXPECT_EQ(Mark(U("2"), U("Take 12")), kNothing);
}

TEST_F(SearchHilite, InEnglishLettersBeyondAsciiAreBlanks) {
    EXPECT_EQ(Mark(U("clat"), U("\u00C9clat")), Span(U("\u00C9clat"), 1, 5));
    EXPECT_EQ(Mark(U("\u00E9"), U("a b")), kNothing);
}

TEST_F(SearchHiliteInGerman, MarksAnyPlace) {
    EXPECT_EQ(Mark(U("ab"), U("xab")), Span(U("xab"), 1, 3));
    EXPECT_EQ(Mark(U("ab"), U("xy ab")), Span(U("xy ab"), 3, 5));
}

TEST_F(SearchHiliteInGerman, PunctuationIsComparedAsItStands) {
    EXPECT_EQ(Mark(U("-h"), U("Hi-hat")), Span(U("Hi-hat"), 2, 4));
    EXPECT_EQ(Mark(U("i h"), U("Hi-hat")), kNothing);
    EXPECT_EQ(Mark(U("\u00E9"), U("caf\u00C9")), Span(U("caf\u00C9"), 3, 4));
}

TEST_F(SearchHilite, OnlyTheFirstMatchIsMarked) {
    EXPECT_EQ(Mark(U("a"), U("x ab ac")), Span(U("x ab ac"), 2, 3));
}

TEST_F(SearchHilite, ASearchLongerThanTheTextMarksNothing) {
    for (char const *text : {"", "a", "ab", "Wide", "f"}) {
        EXPECT_EQ(Mark(U("abcdefgh"), U(text)), kNothing) << text;
        EXPECT_EQ(Mark(U("Wide Whistle 1000"), U(text)), kNothing) << text;
    }
}

TEST_F(SearchHilite, WithoutAMatchTheColourChangesAllTheSame) {
    Mark(U("ab"), U("x"));
    RGBColor after, wanted;
    VelaDrawing::GetForeColor(&after);
    SetUserHiliteColorAsForeColor();
    VelaDrawing::GetForeColor(&wanted);
    EXPECT_EQ(after.red, wanted.red);
    EXPECT_EQ(after.blue, wanted.blue);
}

TEST_F(SearchHilite, TwoPixelsStayFreeAboveAndBelow) {
    Mark(U("ab"), U("ab"), {1, 30, 19, 100});
    int const column = 31 + TightStringWidth(U(""), 0, 1);
    for (int y : {1, 2, 17, 18})
        EXPECT_EQ(canvas.At(column, y), Canvas::kWhite) << y;
    for (int y : {3, 16})
        EXPECT_NE(canvas.At(column, y), Canvas::kWhite) << y;
}

TEST_F(SearchHilite, CountsFromTheRectanglesLeft) {
    Marked const there = Mark(U("ab"), U("xy ab"), {0, 50, 20, 60});
    Marked const here = Span(U("xy ab"), 3, 5);
    EXPECT_EQ(there, (Marked{here.from + 50, here.to + 50}));
}

TEST_F(SearchHilite, PlacesBeyondSixteenBitsAreCut) {
    UString text;
    for (int i = 0; i < 6000; ++i)
        text += U("WWWW ");
    text += U("end");
    EXPECT_EQ(Mark(U("end"), text), kNothing);
}

// Forms

TEST_F(SearchHilite, FormsKeepTheirUnits) {
    UString const text = U("Hi-hat \u00DF\u0131\U0001F600 9");
    EXPECT_EQ(SearchedForm::OfText(text).length(), text.length() + 1);
    EXPECT_EQ(SearchedForm::OfSearch(text).length(), text.length() + 1);
}

// A dotless i is a blank in what is searched for, and an I in the text.
TEST_F(SearchHilite, CapitalsComeFirstInATextAndLastInASearch) {
    EXPECT_EQ(SearchedForm::OfText(U("\u0131")), U(" I"));
    EXPECT_EQ(SearchedForm::OfSearch(U("\u0131")), U("  "));
}

TEST_F(SearchHiliteInGerman, FormsAreCapitals) {
    EXPECT_EQ(SearchedForm::OfText(U("Hi-h\u00E4t")), U("HI-H\u00C4T"));
    EXPECT_EQ(SearchedForm::OfSearch(U("Hi-h\u00E4t")), U("HI-H\u00C4T"));
}

} // namespace
