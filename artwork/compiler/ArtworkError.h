#pragma once
#include <stdexcept>
#include <string>

// What is wrong with a source of the artwork. The message begins with the file and names the element, so that
// it can be shown to a person as it is.
class ArtworkError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
    ArtworkError(std::string const &file, std::string const &element, std::string const &problem)
        : std::runtime_error(file + ": " + element + ": " + problem) {}
};
