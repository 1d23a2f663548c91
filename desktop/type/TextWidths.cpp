#include "desktop/type/TextWidths.h"
#include "desktop/resources/Utf.h"
#include <algorithm>
#include <functional>
#include <utility>

namespace {

// More fonts and spacings than any window has; each is compared with.
constexpr std::size_t kMostShapes = 64;
constexpr std::size_t kFirstSlots = 64;

} // namespace

TextWidths::TextWidths(std::size_t maxTexts, std::size_t maxUnits)
    : maxTextsOfOne(std::max<std::size_t>(maxTexts / 2, 1))
    , maxUnitsOfOne(maxUnits / 2) {}

std::optional<int> TextWidths::Find(std::u16string_view text, TextShape const &shape) {
    Key const key = KeyOf(text, shape);
    if (Slot const *kept = recent.Find(key))
        return kept->width;
    Slot const *const kept = former.Find(key);
    if (!kept)
        return std::nullopt;
    int const width = kept->width;
    AddToRecent(key, width);
    return width;
}

void TextWidths::Add(std::u16string_view text, TextShape const &shape, int width) {
    AddToRecent(KeyOf(text, shape), width);
}

void TextWidths::Clear() {
    shapes.clear();
    recent = Table();
    former = Table();
}

TextWidths::Key TextWidths::KeyOf(std::u16string_view text, TextShape const &shape) {
    auto known = std::find(shapes.begin(), shapes.end(), shape);
    if (known == shapes.end()) {
        if (shapes.size() == kMostShapes)
            Clear();
        shapes.push_back(shape);
        known = shapes.end() - 1;
    }
    Number const number = static_cast<Number>(known - shapes.begin()) + 1;
    std::size_t const hash = std::hash<std::u16string_view>()(text) + number;
    return {text, static_cast<Number>(hash), number};
}

void TextWidths::AddToRecent(Key const &key, int width) {
    if (key.text.size() > maxUnitsOfOne)
        return;
    if (recent.used == maxTextsOfOne || recent.units.size() + key.text.size() > maxUnitsOfOne)
        former = std::exchange(recent, Table());
    recent.Add(key, width);
}

TextWidths::Slot const *TextWidths::Table::Find(Key const &key) const {
    if (slots.empty())
        return nullptr;
    std::size_t const mask = slots.size() - 1;
    for (std::size_t i = key.hash & mask; slots[i].shape != 0; i = (i + 1) & mask) {
        Slot const &slot = slots[i];
        if (slot.hash == key.hash && slot.shape == key.shape &&
            Utf::SameUnits(std::u16string_view(units).substr(slot.start, slot.length), key.text))
            return &slot;
    }
    return nullptr;
}

void TextWidths::Table::Add(Key const &key, int width) {
    if ((used + 1) * 8 > slots.size() * 7)
        Grow();
    // By less than a string grows by itself.
    if (units.size() + key.text.size() > units.capacity())
        units.reserve(units.size() + units.size() / 4 + key.text.size());
    Enter({key.hash, static_cast<Number>(units.size()), static_cast<Number>(key.text.size()), key.shape,
           width});
    units.append(key.text);
    ++used;
}

void TextWidths::Table::Enter(Slot const &slot) {
    std::size_t const mask = slots.size() - 1;
    std::size_t i = slot.hash & mask;
    while (slots[i].shape != 0)
        i = (i + 1) & mask;
    slots[i] = slot;
}

void TextWidths::Table::Grow() {
    std::vector<Slot> const old =
        std::exchange(slots, std::vector<Slot>(std::max(slots.size() * 2, kFirstSlots), Slot{0, 0, 0, 0, 0}));
    for (Slot const &slot : old)
        if (slot.shape != 0)
            Enter(slot);
}
