// Whatever the gallery's pages say can be read, in each language: it is whole, nothing lies over it, and it
// stands out from its ground.
#include "desktop/Desktop.h"
#include "host/NamedColors.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/PageTexts.h"
#include <gtest/gtest.h>
#include <regex>
#include <set>
#include <tuple>

namespace {

double const kReadable = 4.5;     // contrast of text that has to be read
double const kRecognisable = 3.0; // and of what is switched off

struct Look {
    std::string language, theme;
    int scale;
    DesktopOptions Options() const { return DesktopOptions().Language(language).Theme(theme).Scale(scale); }
};

void PrintTo(Look const &look, std::ostream *out) { *out << look.language << look.theme << look.scale; }

// Pages where panes scroll up and down behind an edge, or lines that are drawn in rows, or both sideways.
std::set<std::string> const kScrollingPanes = {"scroll-pane", "grid"};
std::set<std::string> const kScrollingRows = {"lists", "select-panes", "search"};
std::set<std::string> const kScrollingSideways = {"scroll-pane", "select-panes"};

// What a page shows cut or shortened because that is what it shows.
std::set<std::string> const kShortened = {
    "Recordings/2026/November/Live at the old harbour, second night.wav",
    "Aufnahmen/2026/November/Konzert am alten Hafen, zweiter Abend.wav",
    "Concert hall, rear seats, winter morning", "Konzertsaal, letzte Reihe, Wintermorgen"};

// In a colour of the page, which is none of the theme.
std::set<std::string> const kInOwnColor = {"+0.3 dB", "+0,3 dB"};

typedef std::tuple<PageFile, Look> PageLook;

bool IsSwitchedOff(PageText const &text) {
    RGBColor const &off = kDialogButtonInactiveTextColor;
    return text.color.red == off.red && text.color.green == off.green && text.color.blue == off.blue;
}

class TextsOfPage : public testing::TestWithParam<PageLook> {
protected:
    std::string const &Page() const { return std::get<0>(GetParam()).name; }
    std::vector<PageText> Texts() const {
        std::vector<PageText> texts =
            PageTexts::Of(std::get<0>(GetParam()), std::get<1>(GetParam()).Options());
        EXPECT_GT(texts.size(), 20u); // the frame alone has as many
        return texts;
    }
};

std::string NameOf(testing::TestParamInfo<PageLook> const &info) {
    Look const &look = std::get<1>(info.param);
    return AsTestName(std::get<0>(info.param).name + '-' + look.language + '-' + look.theme + '-' +
                      std::to_string(look.scale) + 'x');
}

} // namespace

TEST_P(TextsOfPage, AreWholeAndLieClearOfEachOtherAndOfWhatIsDrawnAfterThem) {
    std::vector<PageText> const texts = Texts();
    for (auto text = texts.begin(); text != texts.end(); ++text) {
        EXPECT_TRUE(text->HasRoom() || kScrollingSideways.count(Page()) || kShortened.count(text->text))
            << *text;
        EXPECT_TRUE(text->IsWholeUpAndDown() || kScrollingPanes.count(Page()) ||
                    (text->isInRect && kScrollingRows.count(Page())))
            << *text;
        EXPECT_FALSE(text->isCovered) << *text;
        for (auto other = texts.begin(); other != text; ++other)
            EXPECT_FALSE(text->Touches(*other)) << *text << " and " << *other;
    }
}

INSTANTIATE_TEST_SUITE_P(Gallery, TextsOfPage,
                         testing::Combine(testing::ValuesIn(GalleryFiles().Pages()),
                                          testing::Values(Look{"en", "light", 1}, Look{"en", "dark", 2},
                                                          Look{"de", "dark", 1}, Look{"de", "light", 2})),
                         NameOf);

class NumbersOfPage : public TextsOfPage {};

// Three digits behind a mark may be thousands or thousandths, so these are left alone.
TEST_P(NumbersOfPage, HaveTheDecimalMarkOfTheLanguage) {
    std::regex const wrong(std::get<1>(GetParam()).language == "de" ? "\\d\\.(\\d{1,2}|\\d{4,})(?!\\d)"
                                                                    : "\\d,(\\d{1,2}|\\d{4,})(?!\\d)");
    for (PageText const &text : Texts())
        EXPECT_FALSE(std::regex_search(text.text, wrong)) << text;
}

INSTANTIATE_TEST_SUITE_P(Gallery, NumbersOfPage,
                         testing::Combine(testing::ValuesIn(GalleryFiles().Pages()),
                                          testing::Values(Look{"en", "light", 1}, Look{"de", "light", 1})),
                         NameOf);

class ColorsOfPage : public TextsOfPage {};

TEST_P(ColorsOfPage, StandOutFromTheirGround) {
    for (PageText const &text : Texts()) {
        double const least = kInOwnColor.count(text.text) ? 1
                             : IsSwitchedOff(text)        ? kRecognisable
                                                          : kReadable;
        EXPECT_GE(text.contrast, least) << text;
    }
}

INSTANTIATE_TEST_SUITE_P(Gallery, ColorsOfPage,
                         testing::Combine(testing::ValuesIn(GalleryFiles().Pages()),
                                          testing::Values(Look{"en", "light", 1}, Look{"en", "dark", 1})),
                         NameOf);
