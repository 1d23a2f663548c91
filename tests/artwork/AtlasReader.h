#pragma once
#include "desktop/resources/AtlasFormat.h"
#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

// An atlas read back, for tests to look into.
class AtlasReader {
public:
    explicit AtlasReader(std::filesystem::path const &);

    AtlasFormat::Header const &Header() const { return header; }
    std::vector<AtlasFormat::FamilyRecord> const &Families() const { return families; }
    std::vector<AtlasFormat::IconRecord> const &Icons() const { return icons; }
    std::size_t FileSize() const { return file.size(); }
    // Null when there is no such icon.
    AtlasFormat::IconRecord const *Find(int family, int index) const;
    std::uint32_t Pixel(AtlasFormat::ImageRecord const &, int h, int v) const;

private:
    std::string file;
    AtlasFormat::Header header;
    std::vector<AtlasFormat::FamilyRecord> families;
    std::vector<AtlasFormat::IconRecord> icons;
};
