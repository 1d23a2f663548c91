#pragma once
#include <cstdint>
#include <filesystem>
#include <map>
#include <pugixml.hpp>
#include <string>

// The colours of one theme: the paints that icons name in their class attributes, and the named colours that
// the desktop gives to panes, of which the contact sheet borrows some.
class Theme {
public:
    struct Colour {
        std::uint8_t red, green, blue, alpha;
    };

    // Reads themes/NAME.xml; the theme is called as its file says. Throws ArtworkError for a colour that is
    // not #rrggbb or #rrggbbaa and for a name that comes twice.
    explicit Theme(std::filesystem::path const &file);

    std::string const &Name() const { return name; }
    // Null when the theme has no such paint or colour.
    Colour const *Paint(std::string const &paintName) const;
    Colour const *NamedColour(std::string const &colourName) const;

private:
    std::string name;
    std::map<std::string, Colour> paints;
    std::map<std::string, Colour> colours;
};
