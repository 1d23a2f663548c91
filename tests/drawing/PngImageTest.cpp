#include "Canvas.h"
#include "desktop/resources/Resources.h"
#include "host/TarnImage.h"
#include "tests/resources/TemporaryDirectory.h"
#include <filesystem>

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
    Resources::Instance().SetTheme("dark");
    ThemeChangeNotificationProvider::Instance().NotifyThemeChanged();
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
    for (char const *name : {"gray.png", "gray-1-bit.png", "palette.png", "rgb.png", "rgb-16-bit.png",
                             "interlaced-whole.png", "rgba.png", "rgba-16-bit.png", "gray-alpha.png"}) {
        std::filesystem::copy_file(std::string(GLOG_TEST_SOURCE_DIR) + "/../fuzz/corpus/FuzzPng/" + name,
                                   directory.Path() + "/pictures/light/42.png",
                                   std::filesystem::copy_options::overwrite_existing);
        PngImage picture(42);
        EXPECT_GT(picture.GetFrameRect().right, 0) << name;
    }
}

TEST_F(Pictures, FilesThatAreNoPicturesDrawNothing) {
    for (char const *name :
         {"bad-depth", "bad-filter", "claim-65535", "cut-in-data", "cut-in-header", "empty", "jpeg",
          "no-width", "one-too-wide", "signature-only", "wide-claim", "wrong-checksum"}) {
        std::filesystem::copy_file(std::string(GLOG_TEST_SOURCE_DIR) + "/../fuzz/corpus/FuzzPng/" + name,
                                   directory.Path() + "/pictures/light/42.png",
                                   std::filesystem::copy_options::overwrite_existing);
        PngImage picture(42);
        EXPECT_EQ(picture.GetFrameRect(), (Rect{0, 0, 0, 0})) << name;
        Canvas canvas(5, 5);
        picture.Draw({0, 0, 5, 5});
        EXPECT_EQ(canvas.Count(Canvas::kWhite), 25) << name;
    }
}
