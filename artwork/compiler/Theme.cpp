#include "artwork/compiler/Theme.h"
#include "artwork/compiler/ArtworkFile.h"
#include <charconv>

namespace {

constexpr std::size_t kOpaqueLength = 7;      // #rrggbb
constexpr std::size_t kTranslucentLength = 9; // #rrggbbaa

bool ParseColour(std::string const &text, Theme::Colour &result) {
    if ((text.size() != kOpaqueLength && text.size() != kTranslucentLength) || text[0] != '#')
        return false;
    std::uint32_t value = 0;
    auto const parsed = std::from_chars(text.data() + 1, text.data() + text.size(), value, 16);
    if (parsed.ec != std::errc() || parsed.ptr != text.data() + text.size())
        return false;
    if (text.size() == kOpaqueLength)
        value = value << 8 | 0xff;
    result = {static_cast<std::uint8_t>(value >> 24), static_cast<std::uint8_t>(value >> 16 & 0xff),
              static_cast<std::uint8_t>(value >> 8 & 0xff), static_cast<std::uint8_t>(value & 0xff)};
    return true;
}

void ReadColours(ArtworkFile const &file, char const *element, std::map<std::string, Theme::Colour> &result) {
    for (pugi::xml_node node : file.Root().children(element)) {
        Theme::Colour colour;
        if (!ParseColour(file.Text(node, "value"), colour))
            file.Fail(node, "value must be #rrggbb or #rrggbbaa");
        if (!result.emplace(file.Text(node, "name"), colour).second)
            file.Fail(node, "this name is there twice");
    }
}

Theme::Colour const *Find(std::map<std::string, Theme::Colour> const &map, std::string const &name) {
    auto const found = map.find(name);
    return found == map.end() ? nullptr : &found->second;
}

} // namespace

Theme::Theme(std::filesystem::path const &path) {
    ArtworkFile const file(path, "theme");
    name = file.Text(file.Root(), "name");
    if (name != path.stem().string())
        file.Fail(file.Root(), "the theme and its file must have the same name");
    ReadColours(file, "paint", paints);
    ReadColours(file, "color", colours);
}

Theme::Colour const *Theme::Paint(std::string const &paintName) const { return Find(paints, paintName); }
Theme::Colour const *Theme::NamedColour(std::string const &colourName) const {
    return Find(colours, colourName);
}
