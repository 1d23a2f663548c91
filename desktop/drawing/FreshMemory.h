// Memory that has just been had from the system.
#pragma once
#include <cstddef>

namespace FreshMemory {

// The system gives fresh memory page by page, at the first touch of each, which for a window's pixels takes
// several times as long as getting them all at once. Where it cannot do that, nothing is lost.
void GetPages(void *start, std::size_t bytes);

} // namespace FreshMemory
