#include "desktop/printing/OutputFile.h"
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <stdexcept>
#include <sys/stat.h>
#include <unistd.h>
#include <vector>

namespace {

mode_t const kNewFileMode = 0666; // less what the user masks

mode_t UsersMask() {
    mode_t const mask = umask(0);
    umask(mask);
    return mask;
}

} // namespace

OutputFile::OutputFile(std::string const &path_)
    : path(path_)
    , target(path_) {
    std::error_code unresolved;
    std::filesystem::path const resolved = std::filesystem::canonical(path, unresolved);
    if (!unresolved)
        target = resolved.string();
    struct stat known;
    bool const exists = stat(target.c_str(), &known) == 0;
    if (exists && S_ISDIR(known.st_mode))
        Fail(EISDIR);
    if (exists && access(target.c_str(), W_OK) != 0)
        Fail(errno);
    if (exists && !S_ISREG(known.st_mode)) {
        file = open(target.c_str(), O_WRONLY | O_CLOEXEC);
        if (file < 0)
            Fail(errno);
        return;
    }
    OpenBeside();
    fchmod(file, exists ? known.st_mode & 07777 : kNewFileMode & ~UsersMask());
}

OutputFile::~OutputFile() {
    if (file >= 0)
        close(file);
    if (!beside.empty())
        unlink(beside.c_str());
}

void OutputFile::OpenBeside() {
    std::string const pattern = target + ".XXXXXX";
    std::vector<char> name(pattern.begin(), pattern.end());
    name.push_back('\0');
    file = mkstemp(name.data());
    if (file < 0)
        Fail(errno);
    beside = name.data();
}

bool OutputFile::Write(unsigned char const *bytes, std::size_t count) {
    while (count > 0 && failure == 0) {
        ssize_t const written = write(file, bytes, count);
        if (written < 0 && errno != EINTR)
            failure = errno;
        if (written > 0) {
            bytes += written;
            count -= static_cast<std::size_t>(written);
        }
    }
    return failure == 0;
}

void OutputFile::Finish() {
    int const closing = file;
    file = -1;
    if (close(closing) != 0 && failure == 0)
        failure = errno;
    if (failure != 0)
        Fail(failure);
    if (beside.empty())
        return;
    if (std::rename(beside.c_str(), target.c_str()) != 0)
        Fail(errno);
    beside.clear();
}

void OutputFile::Fail(int reason) const {
    throw std::runtime_error("cannot write " + path + ": " + std::strerror(reason));
}
