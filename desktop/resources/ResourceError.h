// What is wrong with a resource file.
#pragma once
#include <stdexcept>
#include <string>

// A resource that cannot be used. what() is "file:line: message", or "file: message" where no line is to
// blame.
class ResourceError : public std::runtime_error {
public:
    // `line` counts from 1; 0 is none.
    ResourceError(std::string const &file, int line, std::string const &message);
    std::string const &File() const { return file; }
    int Line() const { return line; }
    std::string const &Message() const { return message; }

protected:
    ResourceError(std::string const &what, std::string const &file, int line, std::string const &message);

private:
    std::string file;
    int line;
    std::string message;
};
