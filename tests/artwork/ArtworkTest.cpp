#include "artwork/compiler/ArtworkFile.h"
#include "artwork/compiler/Theme.h"
#include "tests/artwork/AtlasReader.h"
#include "tests/artwork/SampleArtwork.h"
#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <map>
#include <set>

namespace {

// How far the renderer's anti-aliasing of a curve and of its mirror image may be apart, of 255.
constexpr int kAntiAliasing = 8;

constexpr double kReadable = 4.5;     // contrast of text that has to be read
constexpr double kRecognisable = 3.0; // of text that is dimmed, and of controls and marks

std::filesystem::path const kSource = GLOG_ARTWORK_SOURCE_DIR;
constexpr char const *kThemes[] = {"light", "dark"};
constexpr char const *kLanguages[] = {"en", "de"};
constexpr int kScalePercents[] = {100, 125, 150, 200, 300};

std::filesystem::path AtlasName(std::string const &theme, int percent) {
    return "atlas-" + theme + "-" + std::to_string(percent) + ".glogatlas";
}

using Column = std::vector<std::uint32_t>;

Column ColumnOf(AtlasReader const &atlas, AtlasFormat::ImageRecord const &image, int h) {
    Column result;
    for (int v = 0; v < image.height; ++v)
        result.push_back(atlas.Pixel(image, h, v));
    return result;
}

Column PixelsOf(AtlasReader const &atlas, AtlasFormat::ImageRecord const &image) {
    Column result;
    for (int h = 0; h < image.width; ++h) {
        Column const column = ColumnOf(atlas, image, h);
        result.insert(result.end(), column.begin(), column.end());
    }
    return result;
}

double Luminance(Theme::Colour colour) {
    auto const linear = [](std::uint8_t component) {
        double const c = component / 255.0;
        return c <= 0.03928 ? c / 12.92 : std::pow((c + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(colour.red) + 0.7152 * linear(colour.green) + 0.0722 * linear(colour.blue);
}

double Contrast(Theme::Colour a, Theme::Colour b) {
    double const first = Luminance(a) + 0.05, second = Luminance(b) + 0.05;
    return std::max(first, second) / std::min(first, second);
}

Theme::Colour Colour(Theme const &theme, std::string const &name) {
    Theme::Colour const *found = theme.NamedColour(name);
    if (!found)
        found = theme.Paint(name);
    if (!found)
        throw std::runtime_error(theme.Name() + " has no " + name);
    return *found;
}

// "LIST/INDEX" or "GROUP/KEY" of every text in a file of strings or help tags, none of them empty.
std::set<std::string> TextsIn(std::filesystem::path const &path, char const *root, char const *group,
                              char const *key) {
    ArtworkFile const file(path, root);
    std::set<std::string> result;
    for (pugi::xml_node list : file.Root().children())
        for (pugi::xml_node text : list.children()) {
            EXPECT_STRNE("", text.child_value()) << path << " " << text.attribute(key).value();
            EXPECT_TRUE(result.insert(file.Text(list, group) + "/" + file.Text(text, key)).second)
                << path << ": twice " << text.attribute(key).value();
        }
    return result;
}

std::set<std::string> StringsIn(std::string const &language) {
    return TextsIn(kSource / "strings" / (language + ".xml"), "strings", "number", "index");
}

std::set<std::string> HelpTagsIn(std::string const &language) {
    return TextsIn(kSource / "helptags" / (language + ".xml"), "helptags", "name", "key");
}

} // namespace

class Artwork : public testing::Test {
protected:
    static void SetUpTestSuite() {
        sample = new SampleArtwork;
        CompilerRun const run = RunCompiler(kSource, {"--out", sample->Output().string()});
        ASSERT_EQ(0, run.status) << run.messages;
    }
    static void TearDownTestSuite() { delete sample; }

    static AtlasReader Atlas(std::string const &theme, int percent) {
        return AtlasReader(sample->Output() / AtlasName(theme, percent));
    }
    // Calls with each atlas in turn.
    template <class Check> static void ForEachAtlas(Check check) {
        for (char const *theme : kThemes)
            for (int const percent : kScalePercents) {
                SCOPED_TRACE(AtlasName(theme, percent));
                check(Atlas(theme, percent));
            }
    }

    static SampleArtwork *sample;
};

SampleArtwork *Artwork::sample = nullptr;

TEST_F(Artwork, ComesOutTheSameEachTime) {
    SampleArtwork again;
    ASSERT_EQ(0, RunCompiler(kSource, {"--out", again.Output().string()}).status);
    std::size_t files = 0;
    for (auto const &entry : std::filesystem::recursive_directory_iterator(sample->Output()))
        if (entry.is_regular_file()) {
            ++files;
            std::filesystem::path const other =
                again.Output() / entry.path().lexically_relative(sample->Output());
            EXPECT_TRUE(ReadFile(entry.path()) == ReadFile(other)) << entry.path() << " differs";
        }
    EXPECT_GE(files, std::size(kThemes) * std::size(kScalePercents));
}

TEST_F(Artwork, HasADrawingForEveryIconThatThePanesDraw) {
    CompilerRun const run = RunCompiler(kSource, {"--undrawn"});
    EXPECT_EQ("0 undrawn\n", run.output);
}

TEST_F(Artwork, DrawsEveryIconVisibly) {
    ForEachAtlas([](AtlasReader const &atlas) {
        for (AtlasFormat::FamilyRecord const &family : atlas.Families())
            for (std::size_t i = 0; i < family.iconCount; ++i)
                for (AtlasFormat::ImageRecord const &image : atlas.Icons()[family.firstIcon + i].images)
                    EXPECT_FALSE(image.flags & AtlasFormat::kImageEmpty)
                        << family.number << " " << atlas.Icons()[family.firstIcon + i].index;
    });
}

// The pieces of a stretched button must meet without a seam, and its middle may be cut anywhere.
TEST_F(Artwork, JoinsButtonPiecesWithoutASeam) {
    struct Triple {
        int family, first;
    };
    ForEachAtlas([](AtlasReader const &atlas) {
        for (Triple const triple : {Triple{1841, 0}, {1841, 3}, {1004, 0}, {1004, 3}, {1004, 6}})
            for (int choice = 0; choice < AtlasFormat::kImageChoices; ++choice) {
                SCOPED_TRACE(std::to_string(triple.family) + " " + std::to_string(triple.first));
                AtlasFormat::ImageRecord const left = atlas.Find(triple.family, triple.first)->images[choice];
                AtlasFormat::ImageRecord const middle =
                    atlas.Find(triple.family, triple.first + 1)->images[choice];
                AtlasFormat::ImageRecord const right =
                    atlas.Find(triple.family, triple.first + 2)->images[choice];
                Column const joint = ColumnOf(atlas, middle, 0);
                for (int h = 0; h < middle.width; ++h)
                    EXPECT_EQ(joint, ColumnOf(atlas, middle, h)) << "column " << h;
                EXPECT_EQ(joint, ColumnOf(atlas, left, left.width - 1));
                EXPECT_EQ(joint, ColumnOf(atlas, right, 0));
            }
    });
}

TEST_F(Artwork, MirrorsTheCapsOfButtons) {
    ForEachAtlas([](AtlasReader const &atlas) {
        for (int const family : {1841, 1004}) {
            AtlasFormat::ImageRecord const left = atlas.Find(family, 0)->images[0];
            AtlasFormat::ImageRecord const right = atlas.Find(family, 2)->images[0];
            for (int h = 0; h < left.width; ++h)
                for (int v = 0; v < left.height; ++v)
                    for (int shift = 0; shift < 32; shift += 8) {
                        int const a = static_cast<int>(atlas.Pixel(left, h, v) >> shift & 0xff);
                        int const b =
                            static_cast<int>(atlas.Pixel(right, right.width - 1 - h, v) >> shift & 0xff);
                        ASSERT_NEAR(a, b, kAntiAliasing) << family << " at " << h << ", " << v;
                    }
        }
    });
}

TEST_F(Artwork, ShowsEveryStateDifferently) {
    ForEachAtlas([](AtlasReader const &atlas) {
        auto const differ = [&](int family, std::vector<int> const &indices) {
            std::set<Column> seen;
            for (int const index : indices)
                seen.insert(PixelsOf(atlas, atlas.Find(family, index)->images[0]));
            EXPECT_EQ(indices.size(), seen.size()) << "family " << family;
        };
        differ(1000, {61, 62, 63});
        differ(1007, {17, 51});
        differ(1007, {68, 69, 70});
        differ(1841, {1, 4});
        differ(1004, {1, 4, 7});
        differ(1608, {69, 70, 71});
        differ(1821, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17});
        differ(2000, {0, 1, 2, 3, 4});
        differ(2002, {0, 1, 2, 3, 4});
        differ(2004, {0, 1, 2});
        differ(2005, {0, 1, 2, 3, 4});
    });
}

// A border of one logical pixel is a whole number of device pixels, with nothing blurred on either side of
// it.
TEST_F(Artwork, DrawsBordersSharpAtEveryScale) {
    ForEachAtlas([](AtlasReader const &atlas) {
        for (AtlasFormat::ImageRecord const &image : atlas.Find(1608, 71)->images) {
            // The disabled face has one flat colour inside: down the middle there may be only two.
            Column const column = ColumnOf(atlas, image, image.width / 2);
            std::set<std::uint32_t> colours;
            for (std::uint32_t const pixel : column)
                colours.insert(pixel & 0xf8f8f8f8);
            EXPECT_EQ(2u, colours.size()) << image.width << " x " << image.height;
            EXPECT_EQ(column.front(), column.back());
        }
    });
}

TEST_F(Artwork, SetsReadableTextOnEveryGround) {
    struct Pair {
        char const *text, *ground;
    };
    for (char const *name : kThemes) {
        Theme const theme(kSource / "themes" / (std::string(name) + ".xml"));
        for (Pair const pair : {Pair{"kDialogActiveTextColor", "kWindowBackgroundColor"},
                                {"kDialogButtonActiveTextColor", "face-top"},
                                {"kDialogButtonActiveTextColor", "face-bottom"},
                                {"kDialogButtonActiveTextColor", "pressed-top"},
                                {"kDialogButtonActiveTextColor", "pressed-bottom"},
                                {"kDialogListTextColor", "kDialogListBackgroundColor"},
                                {"kSmallListActiveTextColor", "kListItemColor"},
                                {"kSmallListActiveTextColor", "kSystemHiliteColor"},
                                {"kTextWellTextColor", "kTextWellBackgroundColor"},
                                {"kTextWellTextColor", "kSystemHiliteColor"},
                                {"kDialogInactiveTextColor", "kWindowBackgroundColor"}, // also of notes
                                {"kDialogInactiveTextColor", "kDialogListBackgroundColor"},
                                {"kDialogInactiveTextColor", "kListItemColor"},
                                {"kDialogListInactiveTextColor", "kDialogListBackgroundColor"},
                                {"kDialogListInactiveTextColor", "kListBackgroundColor"},
                                {"kDialogListInactiveTextColor", "kListItemColor"},
                                {"kDialogListTextColor", "kSystemHiliteColor"},
                                {"kDialogActiveTextColor", "kDialogListBackgroundColor"},
                                {"kDialogActiveTextColor", "kScrollBarBackgroundColor"},
                                {"kDialogActiveTextColor", "kSystemHiliteColor"},
                                {"kDialogButtonActiveTextColor", "tab-top"},
                                {"kDialogButtonActiveTextColor", "tab-bottom"},
                                {"kDialogButtonActiveTextColor", "kPopupFaceTopColor"},
                                {"kDialogButtonActiveTextColor", "kPopupFaceBottomColor"},
                                {"kMenuTextColor", "kMenuBackgroundColor"},
                                {"kMenuHiliteTextColor", "kMenuHiliteColor"},
                                {"kTooltipTextColor", "kTooltipBackgroundColor"},
                                {"ink", "on-top"},
                                {"ink", "on-bottom"},
                                {"ink", "face-bottom"}})
            EXPECT_GE(Contrast(Colour(theme, pair.text), Colour(theme, pair.ground)), kReadable)
                << name << ": " << pair.text << " on " << pair.ground;
    }
}

TEST_F(Artwork, TellsControlsAndMarksFromTheirGround) {
    struct Pair {
        char const *mark, *ground;
    };
    for (char const *name : kThemes) {
        Theme const theme(kSource / "themes" / (std::string(name) + ".xml"));
        for (Pair const pair : {Pair{"choice-border-top", "kDialogListBackgroundColor"},
                                {"choice-border-top", "kWindowBackgroundColor"},
                                {"choice-border-bottom", "kDialogListBackgroundColor"},
                                {"choice-border-bottom", "kWindowBackgroundColor"},
                                {"choice-on-border", "kDialogListBackgroundColor"},
                                {"choice-on-border", "kWindowBackgroundColor"},
                                {"ink-on", "on-top"},
                                {"ink-on", "on-bottom"},
                                {"ink", "face-top"},
                                {"ink", "pressed-top"},
                                {"ink", "pressed-bottom"},
                                {"ink-soft", "face-top"},
                                {"ink-soft", "face-bottom"},
                                {"ink-soft", "scroll-ground"},
                                {"ink-soft", "kDialogListBackgroundColor"},
                                {"record", "face-top"},
                                {"record", "face-bottom"},
                                {"record-on", "armed-top"},
                                {"record-on", "armed-bottom"},
                                {"accent", "kDialogListBackgroundColor"},
                                {"badge", "kDialogListBackgroundColor"},
                                {"scroll-thumb", "scroll-channel"},
                                {"scroll-thumb", "scroll-ground"},
                                {"field-border-top", "field-ground"},
                                {"field-border-bottom", "field-ground"},
                                {"field-mark", "field-ground"},
                                {"field-cancel", "field-ground"},
                                {"groove-border-top", "kDialogListBackgroundColor"},
                                {"groove-border-bottom", "kDialogListBackgroundColor"},
                                {"progress-top", "groove-top"},
                                {"progress-top", "groove-bottom"},
                                {"progress-bottom", "groove-top"},
                                {"progress-bottom", "groove-bottom"},
                                {"slider-fill", "slider-wedge"},
                                {"kHiliteColor", "kDialogListBackgroundColor"},
                                {"kFocusRingColor", "kWindowBackgroundColor"},
                                {"kFocusRingColor", "kDialogListBackgroundColor"}})
            EXPECT_GE(Contrast(Colour(theme, pair.mark), Colour(theme, pair.ground)), kRecognisable)
                << name << ": " << pair.mark << " on " << pair.ground;
    }
}

TEST_F(Artwork, DimsTextThatIsInactiveAndKeepsItRecognisable) {
    struct Triple {
        char const *inactive, *active, *ground;
    };
    for (char const *name : kThemes) {
        Theme const theme(kSource / "themes" / (std::string(name) + ".xml"));
        for (Triple const t :
             {Triple{"kDialogInactiveTextColor", "kDialogActiveTextColor", "kWindowBackgroundColor"},
              {"kDialogButtonInactiveTextColor", "kDialogButtonActiveTextColor", "face-top"},
              {"kDialogButtonInactiveTextColor", "kDialogButtonActiveTextColor", "face-bottom"},
              {"kDialogButtonInactiveTextColor", "kDialogButtonActiveTextColor", "disabled-face"},
              {"kDialogListInactiveTextColor", "kDialogListTextColor", "kDialogListBackgroundColor"}}) {
            double const inactive = Contrast(Colour(theme, t.inactive), Colour(theme, t.ground));
            EXPECT_GE(inactive, kRecognisable) << name << ": " << t.inactive << " on " << t.ground;
            EXPECT_LE(inactive * 1.5, Contrast(Colour(theme, t.active), Colour(theme, t.ground)))
                << name << ": " << t.inactive << " on " << t.ground;
        }
    }
}

TEST_F(Artwork, GivesEveryNamedColourInEveryTheme) {
    for (char const *name : kThemes) {
        Theme const theme(kSource / "themes" / (std::string(name) + ".xml"));
        for (char const *colour : {"kDialogActiveTextColor",
                                   "kDialogInactiveTextColor",
                                   "kDialogButtonActiveTextColor",
                                   "kDialogButtonInactiveTextColor",
                                   "kDialogListBackgroundColor",
                                   "kDialogListTextColor",
                                   "kDialogListInactiveTextColor",
                                   "kListBackgroundColor",
                                   "kListItemColor",
                                   "kSmallListActiveTextColor",
                                   "kPanelUnderline",
                                   "kScrollBarBackgroundColor",
                                   "kScrollBarBorderColor",
                                   "kTextWellBackgroundColor",
                                   "kTextWellTextColor",
                                   "kWindowBackgroundColor",
                                   "kHiliteColor",
                                   "kSystemHiliteColor",
                                   "kTooltipBackgroundColor",
                                   "kTooltipTextColor",
                                   "kTooltipBorderColor",
                                   "kFocusRingColor"}) {
            ASSERT_TRUE(theme.NamedColour(colour)) << name << ": " << colour;
            EXPECT_EQ(255, theme.NamedColour(colour)->alpha) << name << ": " << colour;
        }
    }
}

TEST_F(Artwork, HasTheSamePaintsInEveryTheme) {
    auto const namesIn = [](std::string const &theme) {
        ArtworkFile const file(kSource / "themes" / (theme + ".xml"), "theme");
        std::set<std::string> names;
        for (pugi::xml_node node : file.Root().children())
            names.insert(file.Text(node, "name"));
        return names;
    };
    EXPECT_EQ(namesIn("light"), namesIn("dark"));
}

TEST_F(Artwork, HasNoPaintThatNoDrawingUses) {
    std::string drawings;
    for (char const *folder : {"icons", "pictures"})
        for (auto const &entry : std::filesystem::directory_iterator(kSource / folder))
            drawings += ReadFile(entry.path());
    ArtworkFile const theme(kSource / "themes" / "light.xml", "theme");
    for (pugi::xml_node paint : theme.Root().children("paint")) {
        std::string const name = theme.Text(paint, "name");
        bool used = false;
        for (char const *prefix : {"fill-", "stroke-", "stop-"})
            for (char const *end : {"\"", " "})
                used = used || drawings.find(prefix + name + end) != std::string::npos;
        EXPECT_TRUE(used) << name;
    }
}

TEST_F(Artwork, DrawsEveryCursorWithItsHotSpotInside) {
    ArtworkFile const file(kSource / "cursors.xml", "cursors");
    AtlasReader const atlas = Atlas("light", 100);
    std::set<int> numbers;
    for (pugi::xml_node cursor : file.Root().children("cursor")) {
        numbers.insert(file.Integer(cursor, "number", 0, 32767));
        AtlasFormat::IconRecord const *const icon =
            atlas.Find(file.Integer(cursor, "family", 0, 32767), file.Integer(cursor, "icon", 0, 32767));
        ASSERT_TRUE(icon) << file.Text(cursor, "name");
        file.Integer(cursor, "hotH", 0, icon->width - 1);
        file.Integer(cursor, "hotV", 0, icon->height - 1);
    }
    EXPECT_EQ((std::set<int>{0, 1, 2, 650, 651, 652, 653, 654, 655, 656, 657}), numbers);
}

TEST_F(Artwork, NamesOnlyIconSetsThatAreDrawn) {
    ArtworkFile const file(kSource / "iconsets.xml", "iconsets");
    AtlasReader const atlas = Atlas("light", 100);
    for (pugi::xml_node set : file.Root().children("iconset")) {
        int const number = file.Integer(set, "number", 1, 32767);
        EXPECT_TRUE(
            std::any_of(atlas.Families().begin(), atlas.Families().end(),
                        [&](AtlasFormat::FamilyRecord const &family) { return family.number == number; }))
            << file.Text(set, "name");
    }
}

TEST_F(Artwork, NamesOnlyPicturesThatAreDrawnInEveryTheme) {
    ArtworkFile const file(kSource / "pictures.xml", "pictures");
    for (pugi::xml_node picture : file.Root().children("picture"))
        for (char const *theme : kThemes)
            for (char const *suffix : {".png", "@2x.png"}) {
                std::filesystem::path const path =
                    sample->Output() / "pictures" / theme / (file.Text(picture, "number") + suffix);
                EXPECT_TRUE(std::filesystem::exists(path)) << path;
            }
}

TEST_F(Artwork, HasEveryStringInEveryLanguage) {
    std::set<std::string> const english = StringsIn("en");
    for (char const *language : kLanguages)
        EXPECT_EQ(english, StringsIn(language)) << language;
    EXPECT_EQ(1u, english.count("4325/22"));
    for (int index = 1; index <= 41; ++index)
        EXPECT_EQ(index <= 11 || index == 13 || index >= 16,
                  english.count("4333/" + std::to_string(index)) == 1)
            << index;
}

TEST_F(Artwork, HasEveryHelpTagInEveryLanguage) {
    std::set<std::string> const english = HelpTagsIn("en");
    for (char const *language : kLanguages)
        EXPECT_EQ(english, HelpTagsIn(language)) << language;
    for (char const *tag : {"kTrackSelector/kTrackSelector", "kGlobalTags/kZoomPopupPane", "kZoom/kHZoomIn",
                            "kZoom/kVZoomIn", "kZoom/kHZoomOut", "kZoom/kVZoomOut"})
        EXPECT_EQ(1u, english.count(tag)) << tag;
}

TEST_F(Artwork, HasTheTenFontsAndTheirFiles) {
    ArtworkFile const file(kSource / "fonts.xml", "fonts");
    std::set<int> indices;
    for (pugi::xml_node font : file.Root().children("font")) {
        indices.insert(file.Integer(font, "index", 0, 32767));
        file.Integer(font, "size", 6, 72);
    }
    for (int index = 0; index < 10; ++index)
        EXPECT_EQ(1u, indices.count(index)) << index;
    for (pugi::xml_node node : file.Root().children("file"))
        EXPECT_TRUE(std::filesystem::exists(std::filesystem::path(file.Text(file.Root(), "directory")) /
                                            file.Text(node, "name")))
            << file.Text(node, "name");
}
