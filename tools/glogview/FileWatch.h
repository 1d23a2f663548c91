// Notices that a file has changed.
#pragma once
#include <string>

class FileWatch {
public:
    // The file as it is now counts as known.
    explicit FileWatch(std::string const &path);
    // Whether the file was written, made or removed since the last call.
    bool HasChanged();

private:
    struct Stamp {
        long long time = 0; // of the last write; 0 while there is no such file
        long long size = 0; // bytes
        bool operator!=(Stamp const &other) const { return time != other.time || size != other.size; }
    };
    Stamp Now() const;

    std::string path;
    Stamp known;
};
