#include "Canvas.h"
#include "desktop/drawing/PixelScope.h"
#include "tests/resources/TemporaryDirectory.h"
#include <algorithm>
#include <fstream>
#include <iterator>
#include <memory>
#include <random>

namespace {

std::string Contents(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(file), {});
}

// A picture with transparency, as PNG file.
std::string Sample(TemporaryDirectory const &directory) {
    Surface surface(7, 5);
    surface.Row(0)[0] = 0xFFFF0000u;
    surface.Row(2)[3] = 0x80000080u;
    surface.Row(4)[6] = 0;
    std::string error;
    EXPECT_TRUE(surface.WritePng(directory.Path() + "/sample.png", error)) << error;
    return directory.Path() + "/sample.png";
}

std::string ErrorOf(std::string const &path) {
    std::string error;
    EXPECT_EQ(Surface::ReadPng(path, error), nullptr);
    return error;
}

void PutBigEndian(std::string &bytes, std::size_t at, unsigned value) {
    for (int i = 0; i < 4; ++i)
        bytes[at + static_cast<std::size_t>(i)] = static_cast<char>(value >> (24 - 8 * i) & 0xFF);
}

std::size_t const kWidthOffset = 16, kHeightOffset = 20;

} // namespace

TEST(Surface, StartsOpaqueBlackAndHasAtLeastOnePixel) {
    Surface surface(0, -5);
    EXPECT_EQ(surface.Width(), 1);
    EXPECT_EQ(surface.Height(), 1);
    EXPECT_EQ(surface.Row(0)[0], 0xFF000000u);
    EXPECT_TRUE(surface.IsOpaque());
}

TEST(Surface, APngFileReadsBackTheSame) {
    TemporaryDirectory directory;
    std::string const path = Sample(directory);
    std::string error;
    std::unique_ptr<Surface> const read = Surface::ReadPng(path, error);
    ASSERT_NE(read, nullptr) << error;
    EXPECT_EQ(read->Width(), 7);
    EXPECT_EQ(read->Height(), 5);
    EXPECT_EQ(read->Row(0)[0], 0xFFFF0000u);
    EXPECT_EQ(read->Row(2)[3], 0x80000080u);
    EXPECT_EQ(read->Row(4)[6], 0u);
    EXPECT_EQ(read->Row(1)[1], 0xFF000000u);
    EXPECT_FALSE(read->IsOpaque());
}

TEST(Surface, AnOpaquePngFileStaysOpaque) {
    TemporaryDirectory directory;
    Surface surface(3, 3);
    std::string error;
    ASSERT_TRUE(surface.WritePng(directory.Path() + "/a.png", error));
    std::unique_ptr<Surface> const read = Surface::ReadPng(directory.Path() + "/a.png", error);
    ASSERT_NE(read, nullptr);
    EXPECT_TRUE(read->IsOpaque());
}

TEST(Surface, APngFileThatCannotBeWrittenIsReported) {
    Surface surface(3, 3);
    std::string error;
    EXPECT_FALSE(surface.WritePng("/nowhere/at/all.png", error));
    EXPECT_EQ(error, "/nowhere/at/all.png: No such file or directory");
}

TEST(Surface, MissingFilesAndOtherFilesAreReported) {
    TemporaryDirectory directory;
    EXPECT_NE(ErrorOf(directory.Path() + "/none.png").find("cannot be opened"), std::string::npos);
    EXPECT_NE(ErrorOf(directory.Write("text.png", "no picture")).find("not a PNG"), std::string::npos);
    EXPECT_NE(ErrorOf(directory.Write("empty.png", "")).find("not a PNG"), std::string::npos);
    EXPECT_NE(ErrorOf(directory.Path()).find("not a PNG"), std::string::npos);
}

TEST(Surface, AbsurdSizesAreRefusedBeforeDecoding) {
    TemporaryDirectory directory;
    std::string const good = Contents(Sample(directory));
    for (unsigned side : {0u, 8193u, 0x7FFFFFFFu, 0xFFFFFFFFu}) {
        std::string bad = good;
        PutBigEndian(bad, kWidthOffset, side);
        EXPECT_NE(ErrorOf(directory.Write("bad.png", bad)).find("each side may have 1 to 8192"),
                  std::string::npos);
        bad = good;
        PutBigEndian(bad, kHeightOffset, side);
        EXPECT_NE(ErrorOf(directory.Write("bad.png", bad)).find("each side may have 1 to 8192"),
                  std::string::npos);
    }
}

TEST(Surface, TruncatedAndDamagedFilesGiveAnErrorAtEveryLength) {
    TemporaryDirectory directory;
    std::string const good = Contents(Sample(directory));
    for (std::size_t length = 0; length + 12 < good.size();
         ++length) // without the mere end mark it may still do
        EXPECT_NE(ErrorOf(directory.Write("bad.png", good.substr(0, length))), "") << length;
    std::string bad = good;
    PutBigEndian(bad, kWidthOffset, 6); // the sum over the chunk is wrong now
    EXPECT_NE(ErrorOf(directory.Write("bad.png", bad)), "");
}

TEST(Surface, CairoAndPixmanSeeTheSamePixels) {
    Canvas canvas(8, 8);
    OSPort::Current().PaintRoundRect({0, 0, 8, 4}, {0, 0});
    Rect const r = {4, 0, 8, 8};
    VelaDrawing::PaintRect(&r);
    OSPort::Current().SetForeColor(OS::RGBAColor(1, 0, 0, 1));
    OSPort::Current().PaintRoundRect({0, 3, 8, 2}, {0, 0});
    EXPECT_EQ(canvas.Picture(Canvas::kRed)[3], "########");
    EXPECT_EQ(canvas.Picture(Canvas::kRed)[4], "########");
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 48);
}

TEST(Surface, FillsRectanglesOfEveryWidthAndNothingBesideThem) {
    for (int width = 0; width < 40; ++width) {
        Surface surface(44, 5);
        surface.Fill({2, 1, 2 + width, 4}, 0xFF123456u);
        for (int y = 0; y < 5; ++y)
            for (int x = 0; x < 44; ++x) {
                bool const filled = x >= 2 && x < 2 + width && y >= 1 && y < 4;
                ASSERT_EQ(surface.Row(y)[x], filled ? 0xFF123456u : 0xFF000000u)
                    << width << ": " << x << ' ' << y;
            }
    }
}

TEST(Surface, BlendsNarrowRectanglesToTheSamePixelsAsWideOnes) {
    int const kWidth = 51, kHeight = 7;
    std::minstd_rand random(1);
    std::uniform_real_distribution<double> any(0.0, 1.0);
    for (int round = 0; round < 300; ++round) {
        OS::RGBAColor const color(any(random), any(random), any(random), any(random));
        std::vector<std::uint32_t> pixels[2];
        for (int narrow = 0; narrow < 2; ++narrow) {
            Canvas canvas(kWidth, kHeight);
            canvas.FillWithPattern();
            PixelScope scope(canvas.port);
            int const step = narrow ? 1 + round % 16 : kWidth;
            for (int x = 0; x < kWidth; x += step)
                scope.Fill({x, 0, std::min(x + step, kWidth), kHeight}, color);
            pixels[narrow] = canvas.Pixels();
        }
        ASSERT_EQ(pixels[0], pixels[1]) << color.r << ' ' << color.g << ' ' << color.b << ' ' << color.a;
    }
}

TEST(Surface, KnowsTheOpaquePartThatHasNothingRoundIt) {
    Surface surface(6, 4);
    EXPECT_EQ(surface.OpaquePart().Width(), 6) << "a new one is opaque";
    std::fill(surface.Pixels(), surface.Row(4), 0);
    EXPECT_TRUE(surface.OpaquePart().Empty()) << "nothing is opaque";
    for (int y = 1; y < 4; ++y)
        for (int x = 2; x < 5; ++x)
            surface.Row(y)[x] = 0xFF102030u;
    DeviceRect const part = surface.OpaquePart();
    EXPECT_EQ(part.left, 2);
    EXPECT_EQ(part.top, 1);
    EXPECT_EQ(part.right, 5);
    EXPECT_EQ(part.bottom, 4);
    surface.Row(2)[0] = 0x01000000u;
    EXPECT_TRUE(surface.OpaquePart().Empty()) << "something translucent lies beside it";
    surface.Row(2)[0] = 0;
    surface.Row(2)[3] = 0x80102030u;
    EXPECT_TRUE(surface.OpaquePart().Empty()) << "it has a translucent hole";
}
