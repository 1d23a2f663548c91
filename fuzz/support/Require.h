// What must hold for every input.
#pragma once
#include <cstdio>
#include <cstdlib>

// Ends the process, which makes the input a finding, with the sentence that does not hold.
inline void Require(bool holds, char const *sentence) {
    if (holds)
        return;
    std::fprintf(stderr, "does not hold: %s\n", sentence);
    std::abort();
}
