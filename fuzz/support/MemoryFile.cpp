#include "fuzz/support/MemoryFile.h"
#include "fuzz/support/Require.h"
#include <sys/mman.h>
#include <unistd.h>

MemoryFile::MemoryFile(std::uint8_t const *data, std::size_t size)
    : descriptor(memfd_create("input", MFD_CLOEXEC))
    , path("/proc/self/fd/" + std::to_string(descriptor)) {
    Require(descriptor >= 0, "a file in memory can be made");
    for (std::size_t done = 0; done < size;) {
        ssize_t const written = write(descriptor, data + done, size - done);
        Require(written > 0, "a file in memory can be written");
        done += static_cast<std::size_t>(written);
    }
}

MemoryFile::~MemoryFile() { close(descriptor); }
