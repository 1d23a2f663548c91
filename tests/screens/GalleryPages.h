// The gallery's pages, for tests that look at each.
#pragma once
#include "tools/gallery/PageFiles.h"
#include <ostream>
#include <string>
#include <vector>

inline std::string TreeDirectory() { return std::string(GLOG_TEST_SOURCE_DIR) + "/.."; }

inline PageFiles const &GalleryFiles() {
    static PageFiles const files(TreeDirectory() + "/tools/gallery");
    return files;
}

// Test names are made of letters and digits.
inline std::string AsTestName(std::string text) {
    for (char &c : text) {
        if (c == '-' || c == '.')
            c = '_';
    }
    return text;
}

inline void PrintTo(PageFile const &page, std::ostream *out) { *out << page.name; }
