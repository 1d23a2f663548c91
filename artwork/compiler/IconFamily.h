#pragma once
#include "artwork/compiler/ArtworkFile.h"
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

// The drawings of one icon family, as they stand in its SVG file. The root tells number, name and size of the
// family (data-family, data-name, data-size="width height") and how many rows at the bottom of its icons are
// shadow only (data-shadow, 0 unless it is there); each icon is a group below the root with the id
// "i" and its index, holding an invisible <rect class="frame"> of the icon's exact size. Where the group is
// moved to on the sheet, by a translation, is for people only: an icon begins at its own frame.
class IconFamily {
public:
    struct Icon {
        std::int16_t index;
        int width; // logical pixels
        int height;
        pugi::xml_node group;
    };

    // Throws ArtworkError for anything that would be drawn wrongly or not at all: stray elements, icons
    // without a frame, sides outside 1 to the largest, an index twice, styles of the file's own, references
    // to nothing.
    IconFamily(std::filesystem::path const &file, int largestSide);

    std::int16_t Number() const { return number; }
    std::string const &Name() const { return name; }
    int Width() const { return width; }
    int Height() const { return height; }
    int ShadowHeight() const { return shadow; }
    std::vector<Icon> const &Icons() const { return icons; } // by index
    Icon const *Find(int index) const;                       // null when it is not drawn
    pugi::xml_node Definitions() const { return source->Root().child("defs"); }
    ArtworkFile const &Source() const { return *source; }

private:
    void ReadMetadata();
    void ReadIcon(pugi::xml_node);
    void CheckElements() const;

    int largestSide;                     // logical pixels
    std::unique_ptr<ArtworkFile> source; // on the heap, so that nodes stay valid when the family moves
    std::int16_t number = 0;
    std::string name;
    int width = 0;
    int height = 0;
    int shadow = 0;
    std::vector<Icon> icons;
};
