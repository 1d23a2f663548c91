#include "desktop/type/ShapedTextCache.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/TextLru.h"
#include "desktop/type/TextWidths.h"
#include <memory>
#include <optional>

namespace {

// A few windows full of labels.
constexpr std::size_t kMaxTexts = 512;
constexpr std::size_t kMaxTextUnits = 1 << 17;
// As many as a window that is being made measures before it draws them.
constexpr std::size_t kMaxMeasured = 256;
constexpr std::size_t kMaxMeasuredUnits = 1 << 15;
// A long row of tabs in every look that it can have.
constexpr std::size_t kMaxAside = 512;
constexpr std::size_t kMaxAsideUnits = 1 << 15;
// Widths are small, and a list measures more strings than it shows.
constexpr std::size_t kMaxWidths = 8192;
constexpr std::size_t kMaxWidthUnits = 1 << 19;

struct Caches {
    TextLru<std::unique_ptr<ShapedText>> texts{kMaxTexts, kMaxTextUnits};
    // Shaped for their widths alone. Those that are drawn soon after, as labels are, move to the texts; the
    // thousands that a list measures do not drive those out.
    TextLru<std::unique_ptr<ShapedText>> measured{kMaxMeasured, kMaxMeasuredUnits};
    TextLru<std::unique_ptr<ShapedText>> aside{kMaxAside, kMaxAsideUnits};
    TextWidths widths{kMaxWidths, kMaxWidthUnits};
    unsigned int generation = 0;
};

Caches &CurrentCaches() {
    // The fonts first: they go last.
    unsigned int const generation = FontLibrary::Instance().Generation();
    static Caches caches;
    if (caches.generation != generation) {
        caches.texts.Clear();
        caches.measured.Clear();
        caches.aside.Clear();
        caches.widths.Clear();
        caches.generation = generation;
    }
    return caches;
}

} // namespace

ShapedText const &ShapedTextCache::Get(std::u16string_view text, TextShape const &shape) {
    Caches &caches = CurrentCaches();
    if (std::unique_ptr<ShapedText> const *kept = caches.texts.Find(text, shape))
        return **kept;
    std::unique_ptr<ShapedText> shaped = caches.measured.Take(text, shape);
    if (!shaped)
        shaped = std::make_unique<ShapedText>(text, shape);
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
    Caches &caches = CurrentCaches();
    if (std::optional<int> const kept = caches.widths.Find(text, shape))
        return *kept;
    if (std::unique_ptr<ShapedText> const *shown = caches.texts.Find(text, shape)) {
        caches.widths.Add(text, shape, (*shown)->Width());
        return (*shown)->Width();
    }
    auto shaped = std::make_unique<ShapedText>(text, shape);
    int const width = shaped->Width();
    // Asked for again: shaping may have added fonts.
    Caches &present = CurrentCaches();
    present.measured.Take(text, shape); // its width was forgotten before it
    present.measured.Add(text, shape, std::move(shaped));
    present.widths.Add(text, shape, width);
    return width;
}

void ShapedTextCache::SetAside(std::u16string_view text, TextShape const &shape,
                               std::unique_ptr<ShapedText> shaped) {
    Caches &caches = CurrentCaches();
    if (!shaped->IsCurrent())
        return;
    caches.aside.Take(text, shape); // another layout's
    caches.aside.Add(text, shape, std::move(shaped));
}

std::unique_ptr<ShapedText> ShapedTextCache::TakeAside(std::u16string_view text, TextShape const &shape) {
    std::unique_ptr<ShapedText> shaped = CurrentCaches().aside.Take(text, shape);
    return shaped ? std::move(shaped) : std::make_unique<ShapedText>(text, shape);
}
