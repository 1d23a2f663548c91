// An icon atlas, mapped into memory.
#pragma once
#include "desktop/resources/AtlasFormat.h"
#include <cstddef>
#include <cstdint>
#include <string>

// Everything in the file has been checked once the constructor is done, so that the records and pixels it
// gives can be used as they are. What it gives points into the file, and lives as long as the atlas.
class Atlas {
public:
    // Throws std::runtime_error, with the file's name and what is wrong, for a file that cannot be read, that
    // is not an atlas of this version and byte order, or that has anything out of order or range.
    explicit Atlas(std::string const &path);
    ~Atlas();
    Atlas(Atlas const &) = delete;
    Atlas &operator=(Atlas const &) = delete;

    std::uint32_t ScaleThousandths() const { return Head().scaleThousandths; }
    std::uint32_t IconCount() const { return Head().iconCount; }
    // Null for a family that the atlas does not have.
    AtlasFormat::FamilyRecord const *FindFamily(std::int16_t number) const;
    // Null when there is no such icon.
    AtlasFormat::IconRecord const *FindIcon(AtlasFormat::FamilyRecord const &, std::int16_t index) const;
    // The icon's place in the table, from 0 to IconCount() - 1.
    std::uint32_t PlaceOf(AtlasFormat::IconRecord const &icon) const {
        return static_cast<std::uint32_t>(&icon - Icons());
    }
    // Rows without gaps, 0xAARRGGBB premultiplied.
    std::uint32_t const *Pixels(AtlasFormat::ImageRecord const &) const;

private:
    AtlasFormat::Header const &Head() const;
    AtlasFormat::FamilyRecord const *Families() const;
    AtlasFormat::IconRecord const *Icons() const;

    unsigned char const *bytes; // the mapped file
    std::size_t size;
};
