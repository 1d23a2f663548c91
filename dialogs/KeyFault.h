// A complaint about a key of an item.
#pragma once
#include <stdexcept>
#include <string>

class GlogPane;

// Thrown by makers of panes about a value that the list of keys could not judge, such as the name of a thing
// that does not exist. The loader turns it into a LoadError with file, line, column and item.
class KeyFault : public std::runtime_error {
public:
    // The pane is the one that the key belongs to, for faults that show once the whole dialog stands.
    KeyFault(std::string const &key_, std::string const &message, GlogPane const *pane_ = nullptr)
        : std::runtime_error(message)
        , key(key_)
        , pane(pane_) {}
    std::string const &Key() const { return key; } // the key that is wrong
    GlogPane const *Pane() const { return pane; }  // null: the one that is being made

private:
    std::string key;
    GlogPane const *pane;
};
