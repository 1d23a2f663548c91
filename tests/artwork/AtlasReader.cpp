#include "tests/artwork/AtlasReader.h"
#include "tests/artwork/SampleArtwork.h"
#include <cstring>
#include <stdexcept>

namespace {

template <class Record> Record Get(std::string const &file, std::size_t offset) {
    if (offset > file.size() || file.size() - offset < sizeof(Record))
        throw std::out_of_range("the atlas is cut short");
    Record record;
    std::memcpy(&record, file.data() + offset, sizeof record);
    return record;
}

} // namespace

AtlasReader::AtlasReader(std::filesystem::path const &path)
    : file(ReadFile(path))
    , header(Get<AtlasFormat::Header>(file, 0)) {
    for (std::size_t i = 0; i < header.familyCount; ++i)
        families.push_back(
            Get<AtlasFormat::FamilyRecord>(file, header.familyTable + i * sizeof(AtlasFormat::FamilyRecord)));
    for (std::size_t i = 0; i < header.iconCount; ++i)
        icons.push_back(
            Get<AtlasFormat::IconRecord>(file, header.iconTable + i * sizeof(AtlasFormat::IconRecord)));
}

AtlasFormat::IconRecord const *AtlasReader::Find(int number, int index) const {
    for (AtlasFormat::FamilyRecord const &family : families)
        if (family.number == number)
            for (std::size_t i = family.firstIcon; i < family.firstIcon + family.iconCount; ++i)
                if (icons.at(i).index == index)
                    return &icons[i];
    return nullptr;
}

std::uint32_t AtlasReader::Pixel(AtlasFormat::ImageRecord const &image, int h, int v) const {
    return Get<std::uint32_t>(
        file, image.offset + static_cast<std::size_t>((v * image.width + h) * AtlasFormat::kBytesPerPixel));
}
