#include "tests/screens/GoldenPicture.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <memory>

namespace {

std::uint32_t const kSame = 0xFF000000;      // black
std::uint32_t const kDifferent = 0xFFFF00FF; // magenta
int const kGap = 8;                          // pixels between the three pictures

std::string const kTop = std::string(GLOG_TEST_SOURCE_DIR) + "/../";

std::string GoldenPath(std::string const &name) { return kTop + "tests/screens/golden/" + name + ".png"; }

std::string OutputPath(std::string const &name) {
    std::string const directory = std::string(GLOG_TEST_OUTPUT_DIR) + "/screens";
    std::filesystem::create_directories(directory);
    return directory + '/' + name + ".png";
}

bool IsUpdating() {
    char const *const wish = std::getenv("GLOG_UPDATE_GOLDEN");
    return wish && std::string(wish) == "1";
}

std::uint32_t PixelOf(Surface const &picture, int x, int y) {
    return x < picture.Width() && y < picture.Height() ? picture.Row(y)[x] : 0;
}

void Place(Surface const &picture, Surface &sheet, int left) {
    for (int y = 0; y < picture.Height(); ++y)
        std::copy(picture.Row(y), picture.Row(y) + picture.Width(), sheet.Row(y) + left);
}

testing::AssertionResult Write(Surface const &picture, std::string const &path, std::string const &message) {
    std::string error;
    if (!picture.WritePng(path, error))
        return testing::AssertionFailure() << path << " cannot be written: " << error;
    return testing::AssertionFailure() << message;
}

testing::AssertionResult ComparedWith(Surface const &actual, std::string const &path,
                                      std::string const &name) {
    std::string error;
    std::unique_ptr<Surface> const expected = Surface::ReadPng(path, error);
    if (!expected)
        return testing::AssertionFailure() << "there is no golden picture " << name << ": " << error;

    int const width = std::max(expected->Width(), actual.Width());
    int const height = std::max(expected->Height(), actual.Height());
    Surface sheet(3 * width + 2 * kGap, height);
    int different = 0;
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            bool const same = PixelOf(*expected, x, y) == PixelOf(actual, x, y);
            different += !same;
            sheet.Row(y)[2 * (width + kGap) + x] = same ? kSame : kDifferent;
        }
    }
    if (different == 0)
        return testing::AssertionSuccess();
    Place(*expected, sheet, 0);
    Place(actual, sheet, width + kGap);
    return Write(sheet, OutputPath(name),
                 std::to_string(different) + " pixels of " + name +
                     " differ; expected, actual and difference: " + OutputPath(name));
}

testing::AssertionResult ComparedOrWritten(Surface const &actual, std::string const &path,
                                           std::string const &name) {
    if (!IsUpdating())
        return ComparedWith(actual, path, name);
    return Write(actual, path,
                 "the golden picture " + name + " was written anew: look at it, then run again");
}

} // namespace

testing::AssertionResult GoldenPicture::Matches(Surface const &actual, std::string const &name) {
    return ComparedOrWritten(actual, GoldenPath(name), name);
}

testing::AssertionResult GoldenPicture::MatchesFile(Surface const &actual, std::string const &path) {
    return ComparedOrWritten(actual, kTop + path, std::filesystem::path(path).stem().string());
}

testing::AssertionResult GoldenPicture::Compared(Surface const &actual, std::string const &name) {
    return ComparedWith(actual, GoldenPath(name), name);
}
