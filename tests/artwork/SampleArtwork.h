#pragma once
#include <filesystem>
#include <string>
#include <vector>

// A small artwork folder of a test's own: a theme "day" with the paints ink and glass and the colours of the
// contact sheet, a missing icon, and whatever the test adds. It is removed with the object.
class SampleArtwork {
public:
    SampleArtwork();
    ~SampleArtwork();
    SampleArtwork(SampleArtwork const &) = delete;
    SampleArtwork &operator=(SampleArtwork const &) = delete;

    void Write(std::string const &relativePath, std::string const &content) const;
    // Writes icons/7.svg: family 7, 10 x 10, with this content below the root.
    void WriteFamily(std::string const &content) const;
    std::filesystem::path Folder() const { return folder; }
    std::filesystem::path Output() const { return folder / "out"; }

private:
    std::filesystem::path folder;
};

// What one call of the compiler gave.
struct CompilerRun {
    int status;
    std::string output;
    std::string messages;
};

// Runs the compiler on the folder with further arguments.
CompilerRun RunCompiler(std::filesystem::path const &source, std::vector<std::string> const &arguments);

std::string ReadFile(std::filesystem::path const &);
