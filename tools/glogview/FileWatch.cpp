#include "tools/glogview/FileWatch.h"
#include <filesystem>

FileWatch::FileWatch(std::string const &path_)
    : path(path_)
    , known(Now()) {}

FileWatch::Stamp FileWatch::Now() const {
    Stamp stamp;
    std::error_code failed;
    auto const time = std::filesystem::last_write_time(path, failed);
    if (failed)
        return stamp;
    stamp.time = static_cast<long long>(time.time_since_epoch().count());
    stamp.size = static_cast<long long>(std::filesystem::file_size(path, failed));
    return stamp;
}

bool FileWatch::HasChanged() {
    Stamp const now = Now();
    bool const changed = now != known;
    known = now;
    return changed;
}
