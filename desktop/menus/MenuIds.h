// Numbers for menus that are made while the program runs.
#pragma once
#include <map>

// Stored menus have positive numbers and made ones negative, so that the two never meet; -1 has a meaning of
// its own to those who install menus.
class MenuIds {
public:
    static MenuIds &Instance(); // one for the process

    // A number that no menu has. Numbers come round as late as possible, since items may still name the menu
    // that had one. Does not return normally when all are taken.
    short New();
    void Add(short id) { ++users[id]; }
    void Remove(short id);

private:
    std::map<short, int> users; // how many menus have the number
    short latest = kGreatest + 1;
    static constexpr short kGreatest = -2, kSmallest = -32768;
};
