#include "desktop/windows/SdlComposeCache.h"
#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <dlfcn.h>
#include <filesystem>
#include <string>
#include <sys/stat.h>
#include <system_error>
// Last, since it defines common words.
#include <X11/Xlib.h>

namespace fs = std::filesystem;

static char const kVariable[] = "XCOMPOSECACHE"; // Xlib's
static char const kFolder[] = "glogpanes", kPrefix[] = "compose-";
static unsigned int const kSuperuser = 0;
static mode_t const kOwnerOnly = 0700;
// In bytes. A table that was cut off stays, and Xlib complains of it at each start.
static std::uintmax_t const kNeededSpace = 16000000;

static bool UserHasSettled(fs::path const &home) {
    std::error_code error;
    return std::getenv(kVariable) != nullptr || std::getenv("XCOMPOSEFILE") != nullptr ||
           fs::exists(home / ".XCompose", error) || fs::exists(home / ".compose-cache", error);
}

static fs::path CacheOf(fs::path const &home) {
    char const *const named = std::getenv("XDG_CACHE_HOME");
    fs::path const place = named != nullptr ? named : "";
    return place.is_absolute() ? place : home / ".cache";
}

// Its own for each file of Xlib: another release may come with other texts, which Xlib knows by their size
// alone. Empty when the file cannot be found.
static std::string NameForXlib() {
    Dl_info library = {};
    struct stat file = {};
    if (dladdr(reinterpret_cast<void *>(&XOpenIM), &library) == 0 || stat(library.dli_fname, &file) != 0)
        return {};
    return kPrefix + std::to_string(file.st_ino) + '-' + std::to_string(file.st_mtime);
}

static void RemoveOthers(fs::path const &directory) {
    std::error_code error;
    fs::directory_iterator place(directory.parent_path(), error);
    for (; !error && place != fs::directory_iterator(); place.increment(error)) {
        fs::path const other = place->path();
        std::error_code ignored;
        if (other.filename().string().rfind(kPrefix, 0) == 0 && other != directory)
            fs::remove_all(other, ignored);
    }
}

static bool MakeDirectory(fs::path const &directory) {
    std::error_code error;
    fs::create_directories(directory.parent_path(), error);
    if (mkdir(directory.c_str(), kOwnerOnly) != 0)
        return errno == EEXIST;
    RemoveOthers(directory);
    return true;
}

static bool HasRoom(fs::path const &directory) {
    std::error_code error;
    fs::space_info const space = fs::space(directory, error);
    return !error && space.available >= kNeededSpace;
}

SdlComposeCache::SdlComposeCache(unsigned int user)
    : isSet(false) {
    char const *const named = std::getenv("HOME");
    fs::path const home = named != nullptr ? named : "";
    if (user == kSuperuser || !home.is_absolute() || UserHasSettled(home))
        return;
    std::string const name = NameForXlib();
    fs::path const directory = CacheOf(home) / kFolder / name;
    if (!name.empty() && MakeDirectory(directory) && HasRoom(directory))
        isSet = setenv(kVariable, directory.c_str(), true) == 0;
}

SdlComposeCache::~SdlComposeCache() {
    if (isSet)
        unsetenv(kVariable);
}
