#include "artwork/compiler/AtlasBuilder.h"
#include "artwork/compiler/ArtworkError.h"
#include <array>
#include <cstring>
#include <limits>

namespace {

constexpr int kThousand = 1000;

std::size_t Align(std::size_t size) {
    return (size + AtlasFormat::kPixelAlignment - 1) / AtlasFormat::kPixelAlignment *
           AtlasFormat::kPixelAlignment;
}

template <class Record>
void Put(std::vector<char> &file, std::size_t offset, Record const *records, std::size_t count) {
    if (count > 0)
        std::memcpy(file.data() + offset, records, count * sizeof(Record));
}

// A side in device pixels, rounded down and up, at least 1.
std::array<int, 2> DeviceSides(int side, int scaleThousandths) {
    int const exact = side * scaleThousandths;
    return {std::max(1, exact / kThousand), std::max(1, (exact + kThousand - 1) / kThousand)};
}

} // namespace

AtlasBuilder::AtlasBuilder(Theme const &t, int scale)
    : theme(t)
    , scaleThousandths(scale) {}

void AtlasBuilder::Add(IconFamily const &family) {
    families.push_back({family.Number(), static_cast<std::uint16_t>(family.Width()),
                        static_cast<std::uint16_t>(family.Height()), 0,
                        static_cast<std::uint32_t>(icons.size()),
                        static_cast<std::uint32_t>(family.Icons().size())});
    IconRenderer const renderer(family, theme);
    for (IconFamily::Icon const &icon : family.Icons())
        icons.push_back(DrawIcon(renderer, icon));
}

std::vector<char> AtlasBuilder::Finish() {
    AtlasFormat::Header header{};
    std::size_t const familyTable = sizeof header;
    std::size_t const iconTable = familyTable + families.size() * sizeof(AtlasFormat::FamilyRecord);
    std::size_t const pixels = Align(iconTable + icons.size() * sizeof(AtlasFormat::IconRecord));
    std::size_t const fileSize = pixels + blocks.size();
    if (fileSize > std::numeric_limits<std::uint32_t>::max())
        throw ArtworkError("the atlas of theme " + theme.Name() + " is larger than 4 GiB");

    std::memcpy(header.magic, AtlasFormat::kMagic, sizeof header.magic);
    header.version = AtlasFormat::kVersion;
    header.byteOrder = AtlasFormat::kByteOrderMark;
    header.scaleThousandths = static_cast<std::uint32_t>(scaleThousandths);
    header.familyCount = static_cast<std::uint32_t>(families.size());
    header.iconCount = static_cast<std::uint32_t>(icons.size());
    header.familyTable = static_cast<std::uint32_t>(familyTable);
    header.iconTable = static_cast<std::uint32_t>(iconTable);
    header.pixels = static_cast<std::uint32_t>(pixels);
    header.fileSize = static_cast<std::uint32_t>(fileSize);
    for (AtlasFormat::IconRecord &icon : icons)
        for (AtlasFormat::ImageRecord &image : icon.images)
            image.offset += header.pixels;

    std::vector<char> file(fileSize);
    Put(file, 0, &header, 1);
    Put(file, familyTable, families.data(), families.size());
    Put(file, iconTable, icons.data(), icons.size());
    Put(file, pixels, blocks.data(), blocks.size());
    return file;
}

AtlasFormat::IconRecord AtlasBuilder::DrawIcon(IconRenderer const &renderer, IconFamily::Icon const &icon) {
    AtlasFormat::IconRecord record{
        icon.index, static_cast<std::uint16_t>(icon.width), static_cast<std::uint16_t>(icon.height), 0, {}};
    std::array<int, 2> const widths = DeviceSides(icon.width, scaleThousandths);
    std::array<int, 2> const heights = DeviceSides(icon.height, scaleThousandths);
    for (int choice = 0; choice < AtlasFormat::kImageChoices; ++choice) {
        bool const wider = choice & AtlasFormat::kWiderImage;
        bool const taller = choice & AtlasFormat::kTallerImage;
        // Where a side comes out whole, rounding it up gives the image that is there already.
        int const narrowed = (widths[0] == widths[1] ? choice & ~AtlasFormat::kWiderImage : choice) &
                             (heights[0] == heights[1] ? ~AtlasFormat::kTallerImage : ~0);
        record.images[choice] = narrowed < choice
                                    ? record.images[narrowed]
                                    : Store(renderer.Render(icon, widths[wider], heights[taller]));
    }
    return record;
}

AtlasFormat::ImageRecord AtlasBuilder::Store(RenderedImage const &image) {
    std::size_t const offset = blocks.size();
    std::size_t const size = image.Pixels().size() * AtlasFormat::kBytesPerPixel;
    blocks.resize(Align(offset + size));
    std::memcpy(blocks.data() + offset, image.Pixels().data(), size);
    if (blocks.size() > std::numeric_limits<std::uint32_t>::max())
        throw ArtworkError("the atlas of theme " + theme.Name() + " is larger than 4 GiB");
    std::uint16_t const flags =
        static_cast<std::uint16_t>((image.IsOpaque() ? AtlasFormat::kImageOpaque : 0) |
                                   (image.IsEmpty() ? AtlasFormat::kImageEmpty : 0));
    return {static_cast<std::uint32_t>(offset), static_cast<std::uint16_t>(image.Width()),
            static_cast<std::uint16_t>(image.Height()), flags, 0};
}
