#include "artwork/compiler/IconIndex.h"
#include "desktop/resources/AtlasFormat.h"
#include <limits>

namespace {

constexpr int kLargest = std::numeric_limits<std::int16_t>::max();

int OptionalSide(ArtworkFile const &file, pugi::xml_node node, char const *attribute) {
    return node.attribute(attribute) ? file.Integer(node, attribute, 1, AtlasFormat::kMaxIconSide) : 0;
}

bool SideFits(int side, int exact, int most) {
    return (exact == 0 || side == exact) && (most == 0 || side <= most);
}

std::string DescribeSide(int exact, int most) {
    if (exact)
        return std::to_string(exact);
    return most ? "at most " + std::to_string(most) : "any";
}

} // namespace

IconIndex::IconIndex(std::filesystem::path const &path) {
    ArtworkFile const file(path, "icons");
    for (pugi::xml_node family : file.Root().children("family"))
        for (pugi::xml_node run : family.children("icon"))
            ReadRun(file, family, run);
}

void IconIndex::ReadRun(ArtworkFile const &file, pugi::xml_node family, pugi::xml_node run) {
    int const number = file.Integer(family, "number", 1, kLargest);
    int const first = file.Integer(run, "index", 0, kLargest);
    int const last = run.attribute("last") ? file.Integer(run, "last", first, kLargest) : first;
    Entry const entry{OptionalSide(file, run, "width"), OptionalSide(file, run, "height"),
                      OptionalSide(file, run, "maxWidth"), OptionalSide(file, run, "maxHeight"),
                      file.Text(run, "shows")};
    for (int index = first; index <= last; ++index)
        if (!entries.emplace(Key(number, index), entry).second)
            file.Fail(run, "the index " + std::to_string(index) + " is listed twice");
}

std::vector<IconIndex::Undrawn> IconIndex::FindUndrawn(std::vector<IconFamily> const &families) const {
    std::map<int, IconFamily const *> byNumber;
    for (IconFamily const &family : families)
        byNumber[family.Number()] = &family;
    std::vector<Undrawn> result;
    for (auto const &[key, entry] : entries) {
        auto const family = byNumber.find(key.first);
        if (family == byNumber.end() || !family->second->Find(key.second))
            result.push_back({key.first, key.second, entry.shows});
    }
    return result;
}

void IconIndex::CheckSizes(IconFamily const &family) const {
    for (IconFamily::Icon const &icon : family.Icons()) {
        auto const found = entries.find(Key(family.Number(), icon.index));
        if (found == entries.end())
            continue;
        Entry const &entry = found->second;
        if (!SideFits(icon.width, entry.width, entry.maxWidth) ||
            !SideFits(icon.height, entry.height, entry.maxHeight))
            family.Source().Fail(icon.group, "is " + std::to_string(icon.width) + " x " +
                                                 std::to_string(icon.height) + "; the panes rely on " +
                                                 DescribeSide(entry.width, entry.maxWidth) + " x " +
                                                 DescribeSide(entry.height, entry.maxHeight));
    }
}
