#include "tools/LineOutput.h"
#include <iostream>
#include <stdexcept>

namespace {

char const kStandardOutput[] = "-";

} // namespace

LineOutput::LineOutput(std::string const &path_)
    : path(path_) {
    if (path == kStandardOutput)
        return;
    file.open(path, std::ios::binary);
    if (!file)
        throw std::runtime_error(path + ": the file cannot be written");
}

std::ostream &LineOutput::Stream() { return path == kStandardOutput ? std::cout : file; }

void LineOutput::Write(std::string const &text) {
    Stream() << text << std::flush;
    if (!Stream())
        throw std::runtime_error(path + ": the file cannot be written");
}
