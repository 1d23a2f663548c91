#include "desktop/resources/Resources.h"
#include "desktop/resources/ThemeFile.h"
#include <dlfcn.h>
#include <filesystem>

namespace {

namespace fs = std::filesystem;

constexpr char kArtworkPlace[] = "share/glogpanes/artwork";
constexpr std::size_t kLanguageLength = 2;

bool IsDirectory(fs::path const &path) {
    std::error_code ignored;
    return fs::is_directory(path, ignored);
}

void RequireDirectory(std::string const &directory) {
    if (!IsDirectory(directory))
        throw ResourceError(directory, 0, "there is no such directory of resources");
}

// The directory of the library that this code is in.
fs::path LibraryDirectory() {
    Dl_info info;
    if (!dladdr(reinterpret_cast<void const *>(&Resources::FindDirectory), &info) || !info.dli_fname)
        return fs::path();
    std::error_code ignored;
    fs::path const library = fs::canonical(info.dli_fname, ignored);
    return library.parent_path();
}

bool IsLanguageCode(std::string const &code) {
    if (code.size() != kLanguageLength)
        return false;
    for (char c : code) {
        if (c < 'a' || c > 'z')
            return false;
    }
    return true;
}

} // namespace

Resources::Resources() {}

Resources &Resources::Instance() {
    static Resources resources;
    return resources;
}

std::string Resources::FindDirectory() {
    fs::path const library = LibraryDirectory();
    fs::path const places[] = {library.parent_path() / kArtworkPlace,
                               library.parent_path().parent_path() / kArtworkPlace};
    for (fs::path const &place : places) {
        if (IsDirectory(place))
            return place.string();
    }
    throw ResourceError(places[0].string(), 0,
                        "there is no artwork here, nor in " + places[1].string() +
                            "; the library and its artwork must be installed together");
}

void Resources::Open(std::string const &directory) {
    RequireDirectory(directory);
    directories.assign(1, directory);
    ++generation;
}

std::string const &Resources::Directory() {
    if (directories.empty())
        directories.push_back(FindDirectory());
    return directories.front();
}

void Resources::AddDirectory(std::string const &directory) {
    RequireDirectory(directory);
    Directory();
    directories.push_back(directory);
    ++generation;
}

std::vector<std::string> Resources::Directories() {
    Directory();
    return directories;
}

std::vector<std::string> Resources::FindAll(std::string const &relativePath) {
    Directory();
    std::vector<std::string> found;
    for (std::string const &directory : directories) {
        fs::path const path = fs::path(directory) / relativePath;
        std::error_code ignored;
        if (fs::exists(path, ignored))
            found.push_back(path.string());
    }
    return found;
}

std::string Resources::Find(std::string const &relativePath) {
    std::vector<std::string> const found = FindAll(relativePath);
    return found.empty() ? std::string() : found.back();
}

void Resources::SetTheme(std::string const &name) {
    ApplyThemeFiles(name, FindAll("themes/" + name + ".xml"));
    theme = name;
}

void Resources::SetLanguage(std::string const &code) {
    if (!IsLanguageCode(code))
        throw ResourceError(code, 0, "this is no code of a language, such as \"en\" or \"de\"");
    if (code == language)
        return;
    language = code;
    ++generation;
}

unsigned int Resources::LanguageCode() const {
    // Language and country. Searches compare with "enus" to tell English; a language alone stands for its own
    // country.
    std::string const code = language == "en" ? "enus" : language + language;
    unsigned int value = 0;
    for (char c : code)
        value = value << 8 | static_cast<unsigned char>(c);
    return value;
}
