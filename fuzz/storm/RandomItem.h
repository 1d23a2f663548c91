// Items of dialogs that nobody would write.
#pragma once
#include "fuzz/storm/Chance.h"
#include "host/Geometry.h"
#include <string>
#include <vector>

class KeyList;
struct KeySchema;

// Writes items of all registered types by what their keys allow.
class RandomItem {
public:
    // Items get the numbers from `firstID` on, and may use the scroll bars with these numbers, each once.
    RandomItem(Chance &, int firstID, std::vector<int> freeBars);

    // An item as XML that can be loaded, at about this place.
    std::string Write(Rect const &place);
    int NextID() const { return nextID; }

private:
    std::string Once(Rect const &place, int depth);
    std::string Inside(Rect const &place, int depth);
    std::string Keys(KeyList const &);
    std::string Element(KeySchema const &);
    std::string Attributes(KeyList const &);
    std::string Value(KeySchema const &);
    std::string Number(KeySchema const &);
    std::string Text(std::string const &key);
    std::string Place(KeySchema const &);
    bool IsWanted(KeySchema const &);

    Chance &chance;
    int nextID;
    std::vector<int> freeBars;
    Rect place = {0, 0, 0, 0}; // of the item that is being written
};
