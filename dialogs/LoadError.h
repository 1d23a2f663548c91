// What is wrong with a dialog.
#pragma once
#include <stdexcept>
#include <string>

// A dialog that cannot be loaded. what() is "file:line:column: item 3 (OvalButton): key TextNum: message",
// without the parts that there are none of; for a binary dialog the place is "file: byte 34: ".
class LoadError : public std::runtime_error {
public:
    struct Place {                // where a dialog is wrong
        std::string file;         // its path, or the name that was given for it
        int line = 0, column = 0; // from 1, the column in characters; 0: none
        long long byte = -1;      // offset in a binary dialog, from 0; -1: none
        std::string item;         // such as "item 3 (OvalButton)"; empty for what is no item's
        std::string key;          // keys within each other are joined by a slash
    };

    LoadError(Place const &, std::string const &message);

    // The parts of the place, and the message without it.
    std::string const &File() const { return place.file; }
    int Line() const { return place.line; }
    int Column() const { return place.column; }
    long long Byte() const { return place.byte; }
    std::string const &Item() const { return place.item; }
    std::string const &Key() const { return place.key; }
    std::string const &Message() const { return message; }

private:
    Place place;
    std::string message;
};
