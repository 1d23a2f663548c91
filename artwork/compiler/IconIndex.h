#pragma once
#include "artwork/compiler/IconFamily.h"
#include <filesystem>
#include <map>
#include <string>
#include <vector>

// The list of every icon that the panes draw, with the sizes that their arithmetic relies on. It tells which
// icons still have to be drawn, and refuses a drawing of another size.
class IconIndex {
public:
    // Reads icons/index.xml. Throws ArtworkError.
    explicit IconIndex(std::filesystem::path const &file);

    struct Undrawn {
        int family;
        int index;
        std::string shows; // what it has to show
    };
    std::vector<Undrawn> FindUndrawn(std::vector<IconFamily> const &) const;
    // Throws ArtworkError for the first icon whose size is not as the list says.
    void CheckSizes(IconFamily const &) const;
    std::size_t Size() const { return entries.size(); }

private:
    // 0 where any side will do.
    struct Entry {
        int width, height;
        int maxWidth, maxHeight;
        std::string shows;
    };
    using Key = std::pair<int, int>; // family and index

    void ReadRun(ArtworkFile const &, pugi::xml_node family, pugi::xml_node run);

    std::map<Key, Entry> entries;
};
