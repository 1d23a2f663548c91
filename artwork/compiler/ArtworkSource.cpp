#include "artwork/compiler/ArtworkSource.h"
#include "artwork/compiler/ArtworkError.h"
#include "desktop/resources/AtlasFormat.h"
#include <algorithm>

namespace {

constexpr int kLargestPictureSide = 4096; // logical pixels; pictures are in no atlas

// The files of a folder with this ending, in the order of their names; none when there is no such folder.
std::vector<std::filesystem::path> FilesIn(std::filesystem::path const &folder, char const *extension) {
    std::vector<std::filesystem::path> result;
    if (std::filesystem::is_directory(folder))
        for (auto const &entry : std::filesystem::directory_iterator(folder))
            if (entry.path().extension() == extension)
                result.push_back(entry.path());
    std::sort(result.begin(), result.end());
    return result;
}

std::vector<IconFamily> ReadFamilies(std::filesystem::path const &folder, int largestSide) {
    std::vector<IconFamily> result;
    for (std::filesystem::path const &file : FilesIn(folder, ".svg"))
        result.emplace_back(file, largestSide);
    std::sort(result.begin(), result.end(),
              [](IconFamily const &a, IconFamily const &b) { return a.Number() < b.Number(); });
    auto const twice =
        std::adjacent_find(result.begin(), result.end(),
                           [](IconFamily const &a, IconFamily const &b) { return a.Number() == b.Number(); });
    if (twice != result.end())
        throw ArtworkError(twice->Source().Path().string() + ": family " + std::to_string(twice->Number()) +
                           " is also in " + std::next(twice)->Source().Path().string());
    return result;
}

} // namespace

ArtworkSource::ArtworkSource(std::filesystem::path const &folder)
    : families(ReadFamilies(folder / "icons", AtlasFormat::kMaxIconSide))
    , pictures(ReadFamilies(folder / "pictures", kLargestPictureSide)) {
    for (std::filesystem::path const &file : FilesIn(folder / "themes", ".xml"))
        themes.emplace_back(file);
    if (themes.empty())
        throw ArtworkError((folder / "themes").string() + ": no theme");
    if (std::none_of(families.begin(), families.end(), [](IconFamily const &family) {
            return family.Number() == AtlasFormat::kMissingIconFamily;
        }))
        throw ArtworkError((folder / "icons").string() + ": no drawing for missing icons (family 0)");
    for (IconFamily const &picture : pictures)
        if (!picture.Find(0))
            picture.Source().Fail(picture.Source().Root(), "a picture is the icon i0 of its file");
    std::filesystem::path const indexFile = folder / "icons" / "index.xml";
    if (!std::filesystem::exists(indexFile))
        return;
    index.emplace(indexFile);
    for (IconFamily const &family : families)
        index->CheckSizes(family);
}

Theme const &ArtworkSource::FindTheme(std::string const &name) const {
    std::string known;
    for (Theme const &theme : themes) {
        if (theme.Name() == name)
            return theme;
        known += " " + theme.Name();
    }
    throw ArtworkError("no theme \"" + name + "\"; there are:" + known);
}

std::vector<IconIndex::Undrawn> ArtworkSource::FindUndrawn() const {
    return index ? index->FindUndrawn(families) : std::vector<IconIndex::Undrawn>();
}
