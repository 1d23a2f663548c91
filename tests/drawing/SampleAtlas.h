// Atlases made up for tests.
#pragma once
#include "desktop/resources/AtlasFormat.h"
#include <cstdint>
#include <string>
#include <vector>

// Writes atlas files. The pixels of an icon are its colour; the top left device pixel is white, the one at
// the bottom right black, so that a test sees where an icon lies, and that it has not been scaled.
class SampleAtlas {
public:
    explicit SampleAtlas(double factor = 1.0);

    // Families and the icons in them have to come in order.
    void AddFamily(short number, int width, int height);
    // An icon of the last family, in a premultiplied colour. The corners are left out where they would not
    // show.
    void AddIcon(short index, int width, int height, std::uint32_t color);

    // The file's contents.
    std::string Bytes() const;
    // The file's name for a theme.
    std::string Name(std::string const &theme = "light") const;

private:
    void AddImage(AtlasFormat::ImageRecord &, int width, int height, std::uint32_t color);

    int thousandths;
    std::vector<AtlasFormat::FamilyRecord> families;
    std::vector<AtlasFormat::IconRecord> icons;
    std::vector<std::uint32_t> pixels; // image offsets count from here until Bytes
};
