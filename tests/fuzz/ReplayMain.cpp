// Gives a fuzz target every file of its corpus.
//
//     replay_NAME DIRECTORY
//
// Ends with 1 when the directory holds no input: a test of nothing would pass.
#include "fuzz/support/Entry.h"
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace {

std::vector<std::filesystem::path> FilesIn(char const *directory) {
    std::vector<std::filesystem::path> files;
    std::error_code problem;
    for (std::filesystem::directory_iterator entry(directory, problem), end; entry != end; ++entry)
        if (entry->is_regular_file())
            files.push_back(entry->path());
    std::sort(files.begin(), files.end());
    return files;
}

std::vector<char> ContentOf(std::filesystem::path const &path) {
    std::ifstream file(path, std::ios::binary);
    return std::vector<char>(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
}

// The name comes first, so that it is the last line when the target ends the process.
void Replay(std::filesystem::path const &path) {
    std::printf("%s\n", path.filename().c_str());
    std::fflush(stdout);
    std::vector<char> const content = ContentOf(path);
    // Not the file's buffer, which is larger: the address sanitizer has to see a read beyond the end.
    std::vector<std::uint8_t> const bytes(content.begin(), content.end());
    LLVMFuzzerTestOneInput(bytes.data(), bytes.size());
}

} // namespace

int main(int argc, char **argv) {
    std::vector<std::filesystem::path> const files =
        argc == 2 ? FilesIn(argv[1]) : std::vector<std::filesystem::path>();
    if (files.empty()) {
        std::fprintf(stderr, "usage: %s DIRECTORY, with at least one input in it\n", argv[0]);
        return EXIT_FAILURE;
    }
    for (std::filesystem::path const &file : files)
        Replay(file);
    std::printf("%zu inputs\n", files.size());
}
