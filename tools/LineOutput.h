// Where a program writes lines to: a file, or standard output.
#pragma once
#include <fstream>
#include <string>

class LineOutput {
public:
    // "-" is standard output. Throws std::runtime_error when the file cannot be opened.
    explicit LineOutput(std::string const &path);

    // Writes text as it is, or with a line end; at once, so that whoever reads along sees it. Throws
    // std::runtime_error when that fails.
    void Write(std::string const &text);
    void WriteLine(std::string const &line) { Write(line + '\n'); }

private:
    std::ostream &Stream();

    std::string path;
    std::ofstream file;
};
