#include "desktop/drawing/IconStore.h"
#include "desktop/drawing/AreaScale.h"
#include "desktop/drawing/Region.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <filesystem>
#include <pixman.h>
#include <stdexcept>
#include <system_error>

namespace {

constexpr char kPrefix[] = "atlas-", kSuffix[] = ".glogatlas";
constexpr int kPercentPerThousandths = 10;
constexpr std::size_t kMostDigits = 4;
constexpr std::uint32_t kHalfAlpha = 0x80;

// Percent of the scale in the name of an atlas of the theme; 0 for any other file.
int ScaleInName(std::string const &file, std::string const &theme) {
    std::string const start = kPrefix + theme + '-', end = kSuffix;
    if (file.size() <= start.size() + end.size() || file.compare(0, start.size(), start) != 0 ||
        file.compare(file.size() - end.size(), end.size(), end) != 0)
        return 0;
    std::string const digits = file.substr(start.size(), file.size() - start.size() - end.size());
    bool const number = digits.size() <= kMostDigits && std::all_of(digits.begin(), digits.end(), [](char c) {
                            return c >= '0' && c <= '9';
                        });
    return number ? std::stoi(digits) : 0;
}

std::vector<std::pair<int, std::string>> AtlasesIn(std::string const &directory, std::string const &theme) {
    std::vector<std::pair<int, std::string>> found;
    std::error_code problem;
    for (std::filesystem::directory_iterator file(directory, problem), end; !problem && file != end;
         file.increment(problem))
        if (int const percent = ScaleInName(file->path().filename().string(), theme))
            found.emplace_back(percent, file->path().string());
    std::sort(found.begin(), found.end());
    return found;
}

// The runs of pixels that are at least half covered.
void AddRuns(OSRgn &region, std::uint32_t const *pixels, int width, int height) {
    auto covered = [](std::uint32_t pixel) { return pixel >> 24 >= kHalfAlpha; };
    for (int y = 0; y < height; ++y) {
        std::uint32_t const *row = pixels + static_cast<std::ptrdiff_t>(y) * width, *end = row + width;
        for (std::uint32_t const *x = row; (x = std::find_if(x, end, covered)) != end;) {
            std::uint32_t const *runEnd = std::find_if_not(x, end, covered);
            Region::UniteRect(region, {static_cast<short>(y), static_cast<short>(x - row),
                                       static_cast<short>(y + 1), static_cast<short>(runEnd - row)});
            x = runEnd;
        }
    }
}

} // namespace

IconStore &IconStore::Instance() {
    static IconStore store;
    return store;
}

void IconStore::FollowResources() {
    Resources &resources = Resources::Instance();
    if (generation == resources.Generation() && theme == resources.Theme())
        return;
    generation = resources.Generation();
    theme = resources.Theme();
    error.clear();
    atlases.clear();
    sets.clear();
    outlines.clear();
    latest = nullptr;
    try {
        for (std::string const &directory : resources.Directories())
            atlases.push_back(AtlasesIn(directory, theme));
    } catch (std::runtime_error const &problem) {
        error = problem.what(); // there is no artwork anywhere
    }
    generation = resources.Generation(); // asking for the directories may have opened them
}

std::vector<std::string> IconStore::AtlasesFor(DeviceScale scale) const {
    std::vector<std::string> chosen;
    for (auto const &directory : atlases) {
        if (directory.empty())
            continue;
        auto atLeast = std::find_if(directory.begin(), directory.end(), [&](auto const &atlas) {
            return atlas.first >= scale.Thousandths() / kPercentPerThousandths;
        });
        chosen.push_back(atLeast != directory.end() ? atLeast->second : directory.back().second);
    }
    return chosen;
}

IconSet &IconStore::Demand(DeviceScale scale) {
    std::unique_ptr<IconSet> &set = sets[scale.Thousandths()];
    if (!set) {
        try {
            set.reset(new IconSet(AtlasesFor(scale)));
        } catch (std::runtime_error const &problem) {
            error = problem.what();
            set.reset(new IconSet({}));
        }
    }
    return *set;
}

IconSet &IconStore::ForScale(DeviceScale scale) {
    FollowResources();
    if (!latest || latestScale != scale.Thousandths()) {
        latest = &Demand(scale);
        latestScale = scale.Thousandths();
    }
    return *latest;
}

IconSet &IconStore::AnyScale() {
    FollowResources();
    return latest ? *latest : ForScale(DeviceScale());
}

OSRgn const &IconStore::Outline(short family, short index) {
    FollowResources();
    auto found = outlines.find({family, index});
    if (found != outlines.end())
        return found->second;
    IconSet &set = Demand(DeviceScale()); // the one scale at which an icon has a pixel for each of the region
    IconSet::Icon const icon = set.Find(family, index);
    OSRgn outline;
    if (icon.layer < 0) { // the mark that lines make
        Region::SetRect(outline, {0, 0, static_cast<short>(icon.height), static_cast<short>(icon.width)});
    } else {
        PixelImage const image = set.Image(icon, icon.width, icon.height);
        AddRuns(outline, pixman_image_get_data(image.pixels), image.width, image.height);
    }
    return outlines.emplace(std::make_pair(family, index), outline).first->second;
}
