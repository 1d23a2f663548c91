#include "tools/gallery/PageFiles.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <utility>

namespace {

namespace fs = std::filesystem;

char const kOwnProgram[] = "/proc/self/exe";
char const kPlaceInPrefix[] = "share/glogpanes/gallery";

// "10-grid" comes after "9-scroll-pane".
bool ComesBefore(fs::path const &a, fs::path const &b) {
    auto const number = [](fs::path const &page) { return std::atoi(page.stem().c_str()); };
    return std::make_pair(number(a), a) < std::make_pair(number(b), b);
}

std::string NameOf(fs::path const &page) {
    std::string const stem = page.stem().string();
    std::size_t const dash = stem.find('-');
    return dash == std::string::npos ? stem : stem.substr(dash + 1);
}

} // namespace

std::string PageFiles::OwnDirectory() {
    std::error_code failed;
    fs::path const program = fs::read_symlink(kOwnProgram, failed);
    return (program.parent_path().parent_path() / kPlaceInPrefix).string();
}

PageFiles::PageFiles(std::string const &given) {
    fs::path const place = given.empty() ? OwnDirectory() : given;
    directory = place.string();
    frame = (place / "gallery.xml").string();
    std::error_code failed;
    std::vector<fs::path> found;
    for (fs::directory_entry const &entry : fs::directory_iterator(place / "pages", failed)) {
        if (entry.path().extension() == ".xml")
            found.push_back(entry.path());
    }
    if (failed || found.empty())
        throw std::runtime_error(directory + ": there are no pages of a gallery here");
    std::sort(found.begin(), found.end(), ComesBefore);
    for (fs::path const &page : found)
        pages.push_back({NameOf(page), page.string()});
}

void PageFiles::AddResources() const {
    Resources &resources = Resources::Instance();
    std::vector<std::string> const known = resources.Directories();
    if (std::find(known.begin(), known.end(), directory) == known.end())
        resources.AddDirectory(directory);
}

std::size_t PageFiles::Find(std::string const &name) const {
    std::string known;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        if (pages[i].name == name)
            return i;
        known += (i ? ", " : "") + pages[i].name;
    }
    throw std::runtime_error("there is no page \"" + name + "\"; there are " + known);
}
