#include "desktop/type/ShapedTextCache.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/TextLru.h"
#include <memory>

namespace {

// A few windows full of labels.
constexpr std::size_t kMaxTexts = 512;
constexpr std::size_t kMaxTextUnits = 1 << 17;
// Widths are small, and a list measures more strings than it shows.
constexpr std::size_t kMaxWidths = 8192;
constexpr std::size_t kMaxWidthUnits = 1 << 19;

struct Caches {
    TextLru<std::unique_ptr<ShapedText>> texts{kMaxTexts, kMaxTextUnits};
    TextLru<int> widths{kMaxWidths, kMaxWidthUnits};
    unsigned int generation = 0;
};

Caches &CurrentCaches() {
    // The fonts first: they go last.
    unsigned int const generation = FontLibrary::Instance().Generation();
    static Caches caches;
    if (caches.generation != generation) {
        caches.texts.Clear();
        caches.widths.Clear();
        caches.generation = generation;
    }
    return caches;
}

} // namespace

ShapedText const &ShapedTextCache::Get(std::u16string_view text, TextShape const &shape) {
    if (std::unique_ptr<ShapedText> const *kept = CurrentCaches().texts.Find(text, shape))
        return **kept;
    auto shaped = std::make_unique<ShapedText>(text, shape);
    // Asked for again: shaping may have added fonts.
    return *CurrentCaches().texts.Add(text, shape, std::move(shaped));
}

ShapedText const &ShapedTextCache::GetFitted(std::u16string_view text, TextShape const &shape) {
    TextShape whole = shape;
    whole.truncation = TextSettings::kTruncateNone;
    whole.width = TextShape::kUnlimited;
    ShapedText const &unshortened = Get(text, whole);
    bool const fits = shape.width < 0 || unshortened.Width() <= shape.width;
    return fits || shape.truncation == TextSettings::kTruncateNone ? unshortened : Get(text, shape);
}

int ShapedTextCache::Width(std::u16string_view text, TextShape const &shape) {
    if (int const *kept = CurrentCaches().widths.Find(text, shape))
        return *kept;
    int const width = ShapedText(text, shape).Width();
    return CurrentCaches().widths.Add(text, shape, width);
}
