#include "SampleAtlas.h"
#include <algorithm>
#include <cstring>

using namespace AtlasFormat;

namespace {

int const kOne = 1000;
std::size_t const kPixelsPerBlock = kPixelAlignment / kBytesPerPixel;

std::uint16_t RoundedDown(int side, int thousandths) {
    return static_cast<std::uint16_t>(std::max(side * thousandths / kOne, 1));
}

std::uint16_t RoundedUp(int side, int thousandths) {
    return static_cast<std::uint16_t>((side * thousandths + kOne - 1) / kOne);
}

std::uint32_t Aligned(std::size_t offset) {
    return static_cast<std::uint32_t>((offset + kPixelAlignment - 1) / kPixelAlignment * kPixelAlignment);
}

} // namespace

SampleAtlas::SampleAtlas(double factor)
    : thousandths(static_cast<int>(factor * kOne + 0.5)) {}

void SampleAtlas::AddFamily(short number, int width, int height) {
    families.push_back({number, static_cast<std::uint16_t>(width), static_cast<std::uint16_t>(height), 0,
                        static_cast<std::uint32_t>(icons.size()), 0});
}

void SampleAtlas::AddIcon(short index, int width, int height, std::uint32_t color) {
    IconRecord icon = {index, static_cast<std::uint16_t>(width), static_cast<std::uint16_t>(height), 0, {}};
    for (int choice = 0; choice < kImageChoices; ++choice)
        AddImage(icon.images[choice],
                 choice & kWiderImage ? RoundedUp(width, thousandths) : RoundedDown(width, thousandths),
                 choice & kTallerImage ? RoundedUp(height, thousandths) : RoundedDown(height, thousandths),
                 color);
    icons.push_back(icon);
    ++families.back().iconCount;
}

void SampleAtlas::AddImage(ImageRecord &image, int width, int height, std::uint32_t color) {
    pixels.resize((pixels.size() + kPixelsPerBlock - 1) / kPixelsPerBlock * kPixelsPerBlock);
    image.offset = static_cast<std::uint32_t>(pixels.size() * kBytesPerPixel);
    image.width = static_cast<std::uint16_t>(width);
    image.height = static_cast<std::uint16_t>(height);
    std::uint32_t const alpha = color >> 24;
    image.flags = static_cast<std::uint16_t>(alpha == 0xFF ? kImageOpaque : alpha == 0 ? kImageEmpty : 0);
    pixels.resize(pixels.size() + static_cast<std::size_t>(width * height), color);
    if (alpha == 0xFF) {
        pixels[image.offset / kBytesPerPixel] = 0xFFFFFFFFu;
        pixels.back() = 0xFF000000u;
    }
}

std::string SampleAtlas::Bytes() const {
    Header header = {};
    std::copy(std::begin(kMagic), std::end(kMagic), header.magic);
    header.version = kVersion;
    header.byteOrder = kByteOrderMark;
    header.scaleThousandths = static_cast<std::uint32_t>(thousandths);
    header.familyCount = static_cast<std::uint32_t>(families.size());
    header.iconCount = static_cast<std::uint32_t>(icons.size());
    header.familyTable = sizeof header;
    header.iconTable = static_cast<std::uint32_t>(sizeof header + families.size() * sizeof(FamilyRecord));
    header.pixels = Aligned(header.iconTable + icons.size() * sizeof(IconRecord));
    header.fileSize = static_cast<std::uint32_t>(header.pixels + pixels.size() * kBytesPerPixel);
    std::vector<IconRecord> placed = icons;
    for (IconRecord &icon : placed)
        for (ImageRecord &image : icon.images)
            image.offset += header.pixels;

    std::string bytes(header.fileSize, '\0');
    auto put = [&bytes](std::size_t at, void const *from, std::size_t size) {
        if (size > 0)
            std::memcpy(&bytes[at], from, size);
    };
    put(0, &header, sizeof header);
    put(header.familyTable, families.data(), families.size() * sizeof(FamilyRecord));
    put(header.iconTable, placed.data(), placed.size() * sizeof(IconRecord));
    put(header.pixels, pixels.data(), pixels.size() * kBytesPerPixel);
    return bytes;
}

std::string SampleAtlas::Name(std::string const &theme) const {
    return "atlas-" + theme + '-' + std::to_string(thousandths / 10) + ".glogatlas";
}
