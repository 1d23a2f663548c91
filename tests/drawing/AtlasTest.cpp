#include "desktop/resources/Atlas.h"
#include "SampleAtlas.h"
#include "tests/resources/TemporaryDirectory.h"
#include <cstddef>
#include <cstring>
#include <stdexcept>

using namespace AtlasFormat;

namespace {

SampleAtlas Sample() {
    SampleAtlas atlas(1.5);
    atlas.AddFamily(-3, 4, 4);
    atlas.AddIcon(0, 4, 4, 0xFF112233u);
    atlas.AddFamily(1000, 15, 15);
    atlas.AddIcon(1, 15, 15, 0xFF445566u);
    atlas.AddIcon(2, 15, 15, 0x80000000u);
    atlas.AddIcon(20, 14, 8, 0);
    atlas.AddFamily(1001, 9, 9);
    return atlas;
}

class BrokenAtlas {
public:
    BrokenAtlas()
        : bytes(Sample().Bytes()) {}
    // Puts a value at a place in the file.
    template <class Value> BrokenAtlas &Put(std::size_t at, Value value) {
        std::memcpy(&bytes[at], &value, sizeof value);
        return *this;
    }
    BrokenAtlas &Cut(std::size_t length) {
        bytes.resize(length);
        return *this;
    }
    std::size_t Size() const { return bytes.size(); }
    // What opening it throws; empty when it opens.
    std::string Error() const {
        TemporaryDirectory directory;
        std::string const path = directory.Write("a.glogatlas", bytes);
        try {
            Atlas const atlas(path);
        } catch (std::runtime_error const &error) {
            std::string const text = error.what();
            EXPECT_EQ(text.find(path + ": "), 0u) << text;
            return text.substr(path.size() + 2);
        }
        return "";
    }

private:
    std::string bytes;
};

std::size_t const kFamilies = sizeof(Header), kIcons = kFamilies + 3 * sizeof(FamilyRecord);
std::size_t const kFirstImage = kIcons + offsetof(IconRecord, images);

} // namespace

TEST(Atlas, FindsFamiliesIconsAndPixels) {
    TemporaryDirectory directory;
    Atlas const atlas(directory.Write("a", Sample().Bytes()));
    EXPECT_EQ(atlas.ScaleThousandths(), 1500u);
    EXPECT_EQ(atlas.FindFamily(7), nullptr);
    EXPECT_EQ(atlas.FindFamily(2000), nullptr);
    ASSERT_NE(atlas.FindFamily(-3), nullptr);
    FamilyRecord const *family = atlas.FindFamily(1000);
    ASSERT_NE(family, nullptr);
    EXPECT_EQ(family->width, 15);
    for (short index : {0, 3, 19, 21, -1, 32767, -32768})
        EXPECT_EQ(atlas.FindIcon(*family, index), nullptr) << index;
    IconRecord const *icon = atlas.FindIcon(*family, 1);
    ASSERT_NE(icon, nullptr);
    EXPECT_EQ(atlas.PlaceOf(*icon), 1u);
    EXPECT_EQ(icon->images[0].width, 22);
    EXPECT_EQ(icon->images[kWiderImage].width, 23);
    EXPECT_EQ(atlas.Pixels(icon->images[0])[1], 0xFF445566u);
    ASSERT_NE(atlas.FindIcon(*family, 20), nullptr);
    EXPECT_EQ(atlas.FindIcon(*family, 20)->height, 8);
    EXPECT_EQ(atlas.FindIcon(*atlas.FindFamily(1001), 0), nullptr);
}

TEST(Atlas, TheSampleIsGoodAsItIs) { EXPECT_EQ(BrokenAtlas().Error(), ""); }

TEST(Atlas, FilesThatAreNotThereOrNoFilesAreReported) {
    EXPECT_THROW(Atlas("/nowhere/a.glogatlas"), std::runtime_error);
    EXPECT_THROW(Atlas("/tmp"), std::runtime_error);
}

TEST(Atlas, ATruncatedFileIsReportedAtEveryLength) {
    std::size_t const size = BrokenAtlas().Size();
    for (std::size_t length = 0; length < size; length += length < 400 ? 1 : 61)
        EXPECT_NE(BrokenAtlas().Cut(length).Error(), "") << length;
}

TEST(Atlas, TheHeaderIsChecked) {
    EXPECT_EQ(BrokenAtlas().Put(3, 'X').Error(), "not an icon atlas");
    EXPECT_EQ(BrokenAtlas().Put(offsetof(Header, version), std::uint32_t(2)).Error(),
              "an icon atlas of version 2; this is version 1");
    EXPECT_EQ(BrokenAtlas().Put(offsetof(Header, byteOrder), std::uint32_t(0x04030201)).Error(),
              "an icon atlas for a machine of another byte order");
    EXPECT_NE(BrokenAtlas().Put(offsetof(Header, fileSize), std::uint32_t(5)).Error(), "");
    EXPECT_NE(BrokenAtlas().Put(offsetof(Header, scaleThousandths), std::uint32_t(0)).Error(), "");
    EXPECT_NE(BrokenAtlas().Put(offsetof(Header, scaleThousandths), std::uint32_t(4001)).Error(), "");
}

TEST(Atlas, TablesBeyondTheFileAreReported) {
    for (std::size_t field : {offsetof(Header, familyTable), offsetof(Header, iconTable)}) {
        EXPECT_NE(BrokenAtlas().Put(field, std::uint32_t(0xFFFFFFF0)).Error().find("table reaches"),
                  std::string::npos);
        EXPECT_NE(BrokenAtlas().Put(field, std::uint32_t(kFamilies + 1)).Error().find("table reaches"),
                  std::string::npos);
    }
    for (std::size_t field : {offsetof(Header, familyCount), offsetof(Header, iconCount)})
        EXPECT_NE(BrokenAtlas().Put(field, std::uint32_t(0x10000001)).Error().find("table reaches"),
                  std::string::npos);
}

TEST(Atlas, FamiliesHaveToBeInOrderAndHaveTheirIcons) {
    EXPECT_EQ(BrokenAtlas().Put(kFamilies, std::int16_t(1000)).Error(), "family 1000 is out of order");
    std::size_t const second = kFamilies + sizeof(FamilyRecord);
    EXPECT_EQ(BrokenAtlas().Put(second + offsetof(FamilyRecord, firstIcon), std::uint32_t(2)).Error(),
              "family 1000 has icons beyond the icon table");
    EXPECT_EQ(
        BrokenAtlas().Put(second + offsetof(FamilyRecord, iconCount), std::uint32_t(0xFFFFFFFF)).Error(),
        "family 1000 has icons beyond the icon table");
    EXPECT_NE(BrokenAtlas().Put(second + offsetof(FamilyRecord, width), std::uint16_t(0)).Error(), "");
}

TEST(Atlas, IconsHaveToBeInOrderAndOfSaneSize) {
    std::size_t const third = kIcons + 2 * sizeof(IconRecord);
    EXPECT_EQ(BrokenAtlas().Put(third, std::int16_t(1)).Error(), "family 1000, icon 1 is out of order");
    EXPECT_NE(BrokenAtlas().Put(kIcons + offsetof(IconRecord, width), std::uint16_t(513)).Error(), "");
}

TEST(Atlas, ImagesHaveToFitTheIconAndTheFile) {
    EXPECT_EQ(BrokenAtlas().Put(kFirstImage + offsetof(ImageRecord, width), std::uint16_t(8)).Error(),
              "family -3, icon 0 has an image of the wrong size");
    EXPECT_EQ(BrokenAtlas().Put(kFirstImage, std::uint32_t(0)).Error(),
              "family -3, icon 0 has misplaced pixels");
    EXPECT_EQ(BrokenAtlas().Put(kFirstImage, std::uint32_t(0xFFFFFFC0)).Error(),
              "family -3, icon 0 has pixels beyond the file");
    std::uint32_t const lastBlock =
        static_cast<std::uint32_t>(BrokenAtlas().Size() / kPixelAlignment * kPixelAlignment);
    EXPECT_EQ(BrokenAtlas().Put(kFirstImage, lastBlock).Error(),
              "family -3, icon 0 has pixels beyond the file");
}

TEST(Atlas, NoSingleBrokenByteOfTheTablesLeadsOutOfTheFile) {
    std::string const good = Sample().Bytes();
    Header header;
    std::memcpy(&header, good.data(), sizeof header);
    TemporaryDirectory directory;
    for (std::size_t at = 0; at < header.pixels; ++at) {
        std::string bytes = good;
        bytes[at] = static_cast<char>(bytes[at] ^ 0x81);
        std::string const path = directory.Write("a", bytes);
        try {
            Atlas const atlas(path);
            std::uint32_t sum = 0; // the sanitizer watches
            for (int number = -32768; number < 32768; ++number)
                if (FamilyRecord const *family = atlas.FindFamily(static_cast<short>(number)))
                    for (short index = -2; index < 30; ++index)
                        if (IconRecord const *icon = atlas.FindIcon(*family, index))
                            for (ImageRecord const &image : icon->images)
                                sum += atlas.Pixels(image)[image.width * image.height - 1];
            EXPECT_GE(sum, 0u);
        } catch (std::runtime_error const &) {
        }
    }
}
