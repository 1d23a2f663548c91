#pragma once
#include "artwork/compiler/IconFamily.h"
#include "artwork/compiler/IconIndex.h"
#include "artwork/compiler/Theme.h"
#include <filesystem>
#include <optional>
#include <vector>

// Everything that the compiler reads from one artwork folder: icons/*.svg, icons/index.xml, pictures/*.svg
// and themes/*.xml. The index and the pictures may be absent.
class ArtworkSource {
public:
    // Reads and checks it all. Throws ArtworkError.
    explicit ArtworkSource(std::filesystem::path const &folder);

    std::vector<IconFamily> const &Families() const { return families; } // by number
    std::vector<IconFamily> const &Pictures() const { return pictures; } // by number
    std::vector<Theme> const &Themes() const { return themes; }          // by name
    // Throws ArtworkError with the names that there are.
    Theme const &FindTheme(std::string const &name) const;
    std::vector<IconIndex::Undrawn> FindUndrawn() const;

private:
    std::vector<IconFamily> families;
    std::vector<IconFamily> pictures;
    std::vector<Theme> themes;
    std::optional<IconIndex> index;
};
