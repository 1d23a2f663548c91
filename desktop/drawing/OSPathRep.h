// What stands behind an OSPath.
#pragma once
#include "host/OSPath.h"
#include <vector>

struct OSPath::Rep {
    enum class Verb { kBegin, kLine, kClose };
    struct Step {
        Verb verb;
        double h, v; // 0 when closing
    };
    std::vector<Step> steps;
};

// The way from a path to its representation, for those who draw it.
struct PathAccess {
    typedef OSPath::Rep Rep;
    static Rep const &Of(OSPath const &path) { return *path.rep; }
};
