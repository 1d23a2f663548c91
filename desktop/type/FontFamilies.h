// Font families by name.
#pragma once
#include "host/OSFont.h"
#include <deque>
#include <string>

// Gives each family name one number for as long as the program runs. Number 0 is the family of dialog text,
// which is the family of the font table's entry 0.
class FontFamilies {
public:
    // The family of that name; an empty one is the family of dialog text.
    static OS::Font::FamilyID Named(std::string const &name);
    static std::string const &NameOf(OS::Font::FamilyID const &);
    static std::string const &NameOf(unsigned int number); // an unknown number is taken as 0
    static void SetDialogFamily(std::string const &name);

private:
    typedef OS::Font::FamilyID::Rep Family;
    static Family *Known(std::string const &name);
    static std::deque<Family> &All(); // number 1 first; families never move or go
};
