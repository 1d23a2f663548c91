#include "desktop/drawing/FreshMemory.h"
#include <cstdint>
#include <sys/mman.h>
#include <unistd.h>

void FreshMemory::GetPages(void *start, std::size_t bytes) {
#ifdef MADV_POPULATE_WRITE
    constexpr std::size_t kWorthwhile = std::size_t(256) << 10;
    if (bytes < kWorthwhile)
        return;
    std::uintptr_t const page = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
    std::uintptr_t const address = reinterpret_cast<std::uintptr_t>(start);
    std::uintptr_t const first = (address + page - 1) / page * page, end = (address + bytes) / page * page;
    madvise(static_cast<char *>(start) + (first - address), end - first, MADV_POPULATE_WRITE);
#else
    static_cast<void>(start);
    static_cast<void>(bytes);
#endif
}
