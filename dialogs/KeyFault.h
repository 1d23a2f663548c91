// A complaint about a key of an item.
#pragma once
#include <stdexcept>
#include <string>

// Thrown by makers of panes about a value that the list of keys could not judge, such as the name of a thing
// that does not exist. The loader turns it into a LoadError with file, line, column and item.
class KeyFault : public std::runtime_error {
public:
    KeyFault(std::string const &key_, std::string const &message)
        : std::runtime_error(message)
        , key(key_) {}
    std::string const &Key() const { return key; } // the key that is wrong

private:
    std::string key;
};
