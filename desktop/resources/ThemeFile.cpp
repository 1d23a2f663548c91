#include "desktop/resources/ThemeFile.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/resources/XmlFile.h"
#include "host/RGBColor.h"
#include <utility>

namespace {

constexpr std::size_t kHexColorLength = 7; // #rrggbb
constexpr int kWiden = 0x101;              // from 8 bits to 16, so that full stays full

// The digit's value; -1 for another character.
int HexDigit(char c) {
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    return c >= 'A' && c <= 'F' ? c - 'A' + 10 : -1;
}

bool ParseComponent(std::string const &text, std::size_t at, unsigned short &out) {
    int const high = HexDigit(text[at]), low = HexDigit(text[at + 1]);
    out = static_cast<unsigned short>((high * 16 + low) * kWiden);
    return high >= 0 && low >= 0;
}

bool ParseColor(std::string const &text, RGBColor &out) {
    return text.size() == kHexColorLength && text[0] == '#' && ParseComponent(text, 1, out.red) &&
           ParseComponent(text, 3, out.green) && ParseComponent(text, 5, out.blue);
}

typedef std::vector<std::pair<std::string, RGBColor>> ColorList;

void ReadColors(std::string const &path, ColorList &colors) {
    XmlFile const file = XmlFile::Read(path);
    file.RequireRoot("theme");
    for (XmlNode const &node : file.Root().children) {
        if (node.name != "color")
            continue; // paints are the icons' concern
        std::string const &name = file.RequireText(node, "name");
        std::string const &value = file.RequireText(node, "value");
        RGBColor color, present;
        if (!ParseColor(value, color))
            throw file.ErrorAt(node, "\"" + value + "\" is no colour of the form #rrggbb");
        if (!GetNamedColor(name, &present))
            throw file.ErrorAt(node, "there is no named colour \"" + name + "\"");
        colors.emplace_back(name, color);
    }
}

} // namespace

void ApplyThemeFiles(std::string const &themeName, std::vector<std::string> const &paths) {
    if (paths.empty())
        throw ResourceError("themes/" + themeName + ".xml", 0, "there is no such theme");
    ColorList colors;
    for (std::string const &path : paths)
        ReadColors(path, colors);
    for (auto const &[name, color] : colors)
        SetNamedColor(name, color);
}
