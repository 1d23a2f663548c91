#include "Canvas.h"
#include "desktop/resources/Resources.h"
#include "host/TarnImage.h"
#include "tests/resources/TemporaryDirectory.h"
#include <filesystem>
#include <functional>

namespace {

class Pictures : public testing::Test {
protected:
    Pictures() {
        directory.Write("themes/light.xml", "<theme name=\"light\"/>");
        directory.Write("themes/dark.xml", "<theme name=\"dark\"/>");
        for (char const *theme : {"light", "dark"})
            std::filesystem::create_directories(directory.Path() + "/pictures/" + theme);
        Resources::Instance().Open(directory.Path());
        Resources::Instance().SetTheme("light");
    }
    ~Pictures() override { Resources::Instance().SetTheme("light"); }
    void Write(std::string const &name, int width, int height, std::uint32_t pixel) {
        Surface surface(width, height);
        for (int y = 0; y < height; ++y)
            for (int x = 0; x < width; ++x)
                surface.Row(y)[x] = pixel;
        std::string error;
        ASSERT_TRUE(surface.WritePng(directory.Path() + "/pictures/" + name, error)) << error;
    }
    // Makes a file of the seeds for fuzzing the picture 42.
    void UseSeed(std::string const &name) {
        std::filesystem::copy_file(std::string(GLOG_TEST_SOURCE_DIR) + "/../fuzz/corpus/FuzzPng/" + name,
                                   directory.Path() + "/pictures/light/42.png",
                                   std::filesystem::copy_options::overwrite_existing);
    }
    static void ChangeTheme(std::string const &theme) {
        Resources::Instance().SetTheme(theme);
        ThemeChangeNotificationProvider::Instance().NotifyThemeChanged();
    }
    TemporaryDirectory directory;
};

std::uint32_t const kBlue = 0xFF0000FFu;

} // namespace

TEST_F(Pictures, AreDrawnIntoTheRectangle) {
    Write("light/42.png", 3, 2, kBlue);
    PngImage picture(42);
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 2, 3}));
    Canvas canvas(12, 10);
    picture.Draw({1, 2, 3, 5});
    EXPECT_EQ(canvas.Count(kBlue), 6);
    picture.Draw({1, 2, 9, 11});
    EXPECT_EQ(canvas.Count(kBlue), 72);
    picture.Draw({5, 5, 5, 5});
    picture.Draw({9, 9, 1, 1});
    EXPECT_EQ(canvas.Count(kBlue), 72);
}

TEST_F(Pictures, AreSharpSquaresAtTwiceTheScale) {
    Write("light/42.png", 3, 2, kBlue);
    PngImage picture(42);
    Canvas canvas(12, 10, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_EQ(canvas.Count(kBlue), 24);
}

TEST_F(Pictures, AreDrawnFromTheDetailedOneWhereThereAreMorePixels) {
    Write("light/42.png", 3, 2, kBlue);
    Write("light/42@2x.png", 6, 4, Canvas::kRed);
    PngImage picture(42);
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 2, 3}));
    {
        Canvas plain(12, 10);
        picture.Draw({0, 0, 2, 3});
        EXPECT_EQ(plain.Count(kBlue), 6);
    }
    Canvas sharp(12, 10, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_EQ(sharp.Count(Canvas::kRed), 24);
}

TEST_F(Pictures, TransparencyMixes) {
    Write("light/42.png", 3, 2, 0x80000000u);
    PngImage picture(42);
    Canvas canvas(3, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_NEAR(canvas.At(1, 1) & 0xFF, 127, 1);
}

TEST_F(Pictures, ANumberWithoutAPictureDrawsNothing) {
    PngImage picture(4711), negative(-1);
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 0, 0}));
    Canvas canvas(5, 5);
    picture.Draw({0, 0, 5, 5});
    negative.Draw({0, 0, 5, 5});
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 25);
}

TEST_F(Pictures, ABrokenPictureIsAsGoodAsNone) {
    directory.Write("pictures/light/42.png", "this is no picture");
    PngImage picture(42);
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 0, 0}));
}

TEST_F(Pictures, FollowTheThemeByThemselves) {
    Write("light/42.png", 3, 2, kBlue);
    Write("dark/42.png", 4, 4, Canvas::kRed);
    Write("light/43.png", 3, 2, kBlue);
    PngImage picture(42), plain(43);
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 2, 3}));
    ChangeTheme("dark");
    EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 4, 4}));
    EXPECT_EQ(plain.GetFrameRect(), (Rect{0, 0, 2, 3})); // has no picture of its own for the theme
    Canvas canvas(4, 4);
    picture.Draw({0, 0, 4, 4});
    EXPECT_EQ(canvas.Count(Canvas::kRed), 16);
}

TEST_F(Pictures, AreReadOnce) {
    Write("light/42.png", 3, 2, kBlue);
    Write("light/42@2x.png", 6, 4, Canvas::kRed);
    PngImage picture(42);
    {
        Canvas plain(12, 10);
        picture.Draw({0, 0, 2, 3});
    }
    Write("light/42.png", 3, 2, 0xFF00FF00u);
    {
        Canvas plain(12, 10);
        picture.Draw({0, 0, 2, 3});
        EXPECT_EQ(plain.Count(kBlue), 6);
    }
    Canvas sharp(12, 10, 2);
    picture.Draw({0, 0, 2, 3});
    Write("light/42@2x.png", 6, 4, 0xFF00FF00u);
    picture.Draw({0, 3, 2, 6});
    EXPECT_EQ(sharp.Count(Canvas::kRed), 48);
}

TEST_F(Pictures, AreReadOnceForEachThemeAndScale) {
    std::uint32_t const kGreen = 0xFF00FF00u, kPink = 0xFFFF80FFu;
    struct Case {
        std::string theme;
        int scale;
        std::uint32_t pixel;
    };
    std::vector<Case> const cases = {
        {"light", 1, kBlue}, {"light", 2, kGreen}, {"dark", 1, Canvas::kRed}, {"dark", 2, kPink}};
    auto const writeAll = [&](std::function<std::uint32_t(Case const &)> const &pixelOf) {
        for (Case const &c : cases)
            Write(c.theme + (c.scale == 2 ? "/42@2x.png" : "/42.png"), 3 * c.scale, 2 * c.scale, pixelOf(c));
    };
    writeAll([](Case const &c) { return c.pixel; });
    PngImage picture(42);
    for (int round = 0; round < 3; ++round) {
        for (Case const &c : cases) {
            ChangeTheme(c.theme);
            Canvas canvas(3, 2, c.scale);
            picture.Draw({0, 0, 2, 3});
            EXPECT_EQ(canvas.Count(c.pixel), 6 * c.scale * c.scale)
                << "round " << round << ", " << c.theme << " at " << c.scale;
        }
        writeAll([](Case const &) { return Canvas::kBlack; });
    }
}

TEST_F(Pictures, TheDetailedOneIsOfTheSameTheme) {
    Write("light/42.png", 3, 2, kBlue);
    Write("light/42@2x.png", 6, 4, kBlue);
    Write("dark/42.png", 3, 2, Canvas::kRed);
    PngImage picture(42);
    ChangeTheme("dark");
    Canvas sharp(3, 2, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_EQ(sharp.Count(Canvas::kRed), 24) << "the dark one, made larger";
}

TEST_F(Pictures, TheDetailedOneIsReadWhereItIsWanted) {
    Write("light/42.png", 3, 2, kBlue);
    PngImage picture(42);
    {
        Canvas plain(12, 10);
        picture.Draw({0, 0, 2, 3});
    }
    Write("light/42@2x.png", 6, 4, Canvas::kRed);
    Canvas sharp(12, 10, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_EQ(sharp.Count(Canvas::kRed), 24);
}

TEST_F(Pictures, ATranslucentDetailedOneLetsTheGroundShow) {
    Write("light/42.png", 3, 2, kBlue);
    Write("light/42@2x.png", 6, 4, 0x80000000u);
    PngImage picture(42);
    Canvas sharp(12, 10, 2);
    picture.Draw({0, 0, 2, 3});
    EXPECT_NEAR(sharp.At(1, 1) & 0xFF, 127, 1);
}

TEST_F(Pictures, AreReadHoweverTheyAreStored) {
    struct Case {
        char const *name;
        int x, y;
        std::uint32_t pixel; // there, on white
    };
    for (Case const &c :
         {Case{"gray.png", 1, 0, 0xFF404040u}, Case{"gray-1-bit.png", 1, 0, 0xFF000000u},
          Case{"palette.png", 1, 0, 0xFF040506u}, Case{"rgb.png", 1, 1, 0xFF00FF00u},
          Case{"rgb-16-bit.png", 0, 0, 0xFF000000u}, Case{"interlaced-whole.png", 2, 1, 0xFF3C1E80u},
          Case{"rgba.png", 0, 0, 0xFFE3B198u}, Case{"rgba-16-bit.png", 0, 0, 0xFF88AACCu},
          Case{"gray-alpha.png", 0, 0, 0xFFDFDFDFu}}) {
        UseSeed(c.name);
        PngImage picture(42);
        Canvas canvas(8, 8);
        picture.Draw(picture.GetFrameRect());
        for (int shift : {0, 8, 16})
            EXPECT_NEAR(canvas.At(c.x, c.y) >> shift & 0xFF, c.pixel >> shift & 0xFF, 1) << c.name;
    }
}

TEST_F(Pictures, FilesThatAreNoPicturesDrawNothing) {
    for (char const *name :
         {"bad-depth", "bad-filter", "claim-65535", "cut-in-data", "cut-in-header", "empty", "jpeg",
          "no-width", "one-too-wide", "signature-only", "wide-claim", "wrong-checksum"}) {
        UseSeed(name);
        PngImage picture(42);
        EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 0, 0})) << name;
        Canvas canvas(5, 5);
        picture.Draw({0, 0, 5, 5});
        EXPECT_EQ(canvas.Count(Canvas::kWhite), 25) << name;
    }
}
