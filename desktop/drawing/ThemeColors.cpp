#include "desktop/drawing/ThemeColors.h"
#include "desktop/drawing/NamedColorTable.h"
#include <algorithm>
#include <iterator>

namespace {

constexpr unsigned kMiddleGray = 0x8000;
// How bright the eye finds the components, in thousandths.
constexpr unsigned kRedShare = 299, kGreenShare = 587, kBlueShare = 114;

RGBColor *Find(std::string const &name) {
    auto entry = std::find_if(std::begin(kNamedColorTable), std::end(kNamedColorTable),
                              [&](NamedColorEntry const &e) { return name == e.name; });
    return entry == std::end(kNamedColorTable) ? nullptr : entry->color;
}

} // namespace

bool ThemeColors::IsDark() {
    RGBColor const &window = kWindowBackgroundColor;
    return (window.red * kRedShare + window.green * kGreenShare + window.blue * kBlueShare) / 1000 <
           kMiddleGray;
}

bool SetNamedColor(std::string const &name, RGBColor const &value) {
    RGBColor *color = Find(name);
    if (color)
        *color = value;
    return color != nullptr;
}

bool GetNamedColor(std::string const &name, RGBColor *value) {
    RGBColor const *color = Find(name);
    if (color)
        *value = *color;
    return color != nullptr;
}

std::vector<std::string> NamedColorNames() {
    std::vector<std::string> names;
    for (NamedColorEntry const &entry : kNamedColorTable)
        names.push_back(entry.name);
    return names;
}
