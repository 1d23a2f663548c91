// What every fuzz target defines.
#pragma once
#include <cstddef>
#include <cstdint>

// Tries one input, whatever it is. Always 0; what must not happen ends the process.
extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size);
