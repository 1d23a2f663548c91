// Reads PDF files with the programs of poppler-utils, which know nothing of how they were made.
#pragma once
#include "desktop/drawing/Surface.h"
#include "tests/resources/TemporaryDirectory.h"
#include <array>
#include <cstdio>
#include <gtest/gtest.h>
#include <memory>
#include <string>

namespace PdfReading {

inline std::string OutputOf(std::string const &command) {
    FILE *const pipe = popen(command.c_str(), "r");
    if (!pipe)
        return "cannot run " + command;
    std::string output;
    std::array<char, 4096> part;
    while (std::size_t const count = std::fread(part.data(), 1, part.size(), pipe))
        output.append(part.data(), count);
    EXPECT_EQ(pclose(pipe), 0) << command;
    return output;
}

// What pdfinfo says of the key, such as "Pages".
inline std::string Fact(std::string const &file, std::string const &key) {
    std::string const facts = OutputOf("pdfinfo '" + file + "'");
    std::size_t const line = facts.find(key + ":");
    if (line == std::string::npos)
        return "";
    std::size_t const start = facts.find_first_not_of(" ", line + key.size() + 1);
    return facts.substr(start, facts.find('\n', start) - start);
}

inline int Pages(std::string const &file) { return std::stoi("0" + Fact(file, "Pages")); }

// The words of one page, with a blank or line break after each.
inline std::string Text(std::string const &file, int page) {
    std::string const number = std::to_string(page);
    return OutputOf("pdftotext -layout -f " + number + " -l " + number + " '" + file + "' -");
}

// The first page in so many pixels to a point.
inline std::unique_ptr<Surface> Picture(std::string const &file, int pixelsPerPoint) {
    TemporaryDirectory const directory;
    std::string const name = directory.Path() + "/page";
    OutputOf("pdftoppm -singlefile -png -r " + std::to_string(72 * pixelsPerPoint) + " '" + file + "' " +
             name);
    std::string error;
    std::unique_ptr<Surface> picture = Surface::ReadPng(name + ".png", error);
    EXPECT_NE(picture, nullptr) << error;
    return picture;
}

} // namespace PdfReading
