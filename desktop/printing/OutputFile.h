// A file that appears whole or not at all.
#pragma once
#include <cstddef>
#include <string>

// What is written goes to a new file beside the one that is named, which takes its place at the end. Until
// then, and when anything goes wrong, an older file of that name stays as it was. What is no plain file, such
// as a pipe, is written to at once.
class OutputFile {
public:
    // Throws std::runtime_error with path and reason when the file could not be written.
    explicit OutputFile(std::string const &path);
    ~OutputFile(); // without Finish, nothing has happened
    OutputFile(OutputFile const &) = delete;
    OutputFile &operator=(OutputFile const &) = delete;

    // False once something could not be written; Finish then tells why.
    bool Write(unsigned char const *bytes, std::size_t count);
    // Puts the file in its place; throws std::runtime_error as above.
    void Finish();

private:
    void OpenBeside();
    [[noreturn]] void Fail(int reason) const;

    std::string path;   // as it was named
    std::string target; // where links lead
    std::string beside; // the new file; empty when there is none
    int file = -1;
    int failure = 0; // of the first write that failed, as in errno
};
