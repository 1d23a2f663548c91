#include "desktop/type/FontLibrary.h"
#include "desktop/resources/Resources.h"
#include "desktop/type/FontFamilies.h"
#include "desktop/type/PlainShaper.h"
#include <algorithm>
#include <cmath>
#include <fontconfig/fontconfig.h>
#include <pango/pangocairo.h>
#include <set>
#include <utility>

// What is kept of a font once it was used.
struct FontLibrary::Font {
    PangoFontDescription *description = nullptr;
    FontMetrics metrics = {0, 0, 0};
    bool measured = false;
    std::unique_ptr<PlainShaper> plain; // of the map at that time

    Font() {}
    ~Font() { pango_font_description_free(description); }
    Font(Font const &) = delete;
    Font &operator=(Font const &) = delete;
};

namespace {

// Shaping must not depend on the user's locale.
constexpr char kShapingLanguage[] = "en";

FcChar8 const *FcText(std::string const &text) { return reinterpret_cast<FcChar8 const *>(text.c_str()); }

std::string FamilyOf(FcPattern *font) {
    FcChar8 *family = nullptr;
    return FcPatternGetString(font, FC_FAMILY, 0, &family) == FcResultMatch ? reinterpret_cast<char *>(family)
                                                                            : "";
}

std::set<std::string> FamiliesOf(FcFontSet const *set) {
    std::set<std::string> families;
    for (int i = 0; set && i < set->nfont; ++i)
        families.insert(FamilyOf(set->fonts[i]));
    return families;
}

template <class Wanted> FcConfig *NewConfig(std::vector<FontFile> const &files, Wanted const &wanted) {
    FcConfig *config = FcConfigCreate();
    for (FontFile const &file : files) {
        if (wanted(file))
            FcConfigAppFontAddFile(config, FcText(file.path));
    }
    return config;
}

// Puts fonts behind those that are there, except those of the given families.
void Append(FcFontSet *own, FcFontSet const *others, std::set<std::string> const &except = {}) {
    for (int i = 0; others && i < others->nfont; ++i) {
        FcPattern *font = others->fonts[i];
        if (except.count(FamilyOf(font)))
            continue;
        FcPatternReference(font);
        FcFontSetAdd(own, font);
    }
}

// A map's thread looks into the tables of its map whenever it is done with a font, and the map does not wait
// for it, neither when it goes away nor when its fonts change: a map is left as it is for good.
void Retire(PangoFontMap *map) {
    static std::vector<PangoFontMap *> &retired = *new std::vector<PangoFontMap *>; // outlives the exit
    retired.push_back(map);
}

cairo_font_options_t *NewFontOptions() {
    cairo_font_options_t *options = cairo_font_options_create();
    cairo_font_options_set_antialias(options, CAIRO_ANTIALIAS_GRAY);
    cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_SLIGHT);
    cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_ON);
    return options;
}

PangoFontDescription *NewDescription(FontSpec const &spec) {
    // The dialog family stands in for families that are not there. It is not named twice: Pango measures
    // lines in the family that it found, which then has the same description and is not looked up once more.
    std::string const &family = FontFamilies::NameOf(spec.family), &standIn = FontFamilies::NameOf(0u);
    std::string families = family == standIn ? family : family + ',' + standIn;
    if (spec.face & FontFace::kCondensed)
        families = family + " Condensed," + families;
    PangoFontDescription *description = pango_font_description_new();
    pango_font_description_set_family(description, families.c_str());
    pango_font_description_set_weight(description,
                                      spec.face & FontFace::kBold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
    pango_font_description_set_style(description,
                                     spec.face & FontFace::kItalic ? PANGO_STYLE_ITALIC : PANGO_STYLE_NORMAL);
    pango_font_description_set_absolute_size(description, double(spec.size) * PANGO_SCALE);
    return description;
}

// The font that the layouts have looked up too: asking for it in another way would look it up once more, in
// threads, and Pango's own metrics shape a sample of the language.
cairo_font_extents_t ExtentsOf(PangoContext *context, PangoFontDescription const *description) {
    constexpr unsigned int kAnyLetter = 'n';
    cairo_font_extents_t extents = {};
    PangoFontset *set = pango_context_load_fontset(context, description, pango_context_get_language(context));
    if (!set)
        return extents;
    if (PangoFont *font = pango_fontset_get_font(set, kAnyLetter)) {
        cairo_scaled_font_extents(pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(font)), &extents);
        g_object_unref(font);
    }
    g_object_unref(set);
    return extents;
}

// Rounded as Pango rounds the places of lines.
int WholePixels(double height) { return PANGO_PIXELS_CEIL(pango_units_from_double(height)); }

FontMetrics Measure(PangoContext *context, PangoFontDescription const *description) {
    constexpr double kWidest = 32767.0;
    cairo_font_extents_t const extents = ExtentsOf(context, description);
    FontMetrics metrics;
    metrics.ascent = WholePixels(extents.ascent);
    metrics.descent = WholePixels(extents.descent);
    metrics.maxWidth = static_cast<int>(std::clamp(std::ceil(extents.max_x_advance), 0.0, kWidest));
    return metrics;
}

} // namespace

std::size_t FontLibrary::SpecHash::operator()(FontSpec const &spec) const {
    std::size_t hash = spec.family;
    hash = hash * 64 + static_cast<std::size_t>(spec.face);
    return hash * 1024 + static_cast<std::size_t>(spec.size);
}

// Never destroyed, as its map's thread may still be at work when the process ends.
FontLibrary &FontLibrary::Instance() {
    static FontLibrary &library = *new FontLibrary;
    return library;
}

FontLibrary::FontLibrary() {}

unsigned int FontLibrary::Generation() {
    if (resourceGeneration != Resources::Instance().Generation())
        Refresh();
    return generation;
}

// After a change of language only, everything stays.
void FontLibrary::Refresh() {
    FontTable const &table = TheFontTable();
    auto const dialogFont = table.Entries().find(0);
    std::string const dialogFamily =
        dialogFont == table.Entries().end() ? std::string() : dialogFont->second.family;
    bool const changed = !context || files != table.Files() || dialogFamily != FontFamilies::NameOf(0u);
    if (changed) {
        Close();
        files = table.Files();
        if (!dialogFamily.empty())
            FontFamilies::SetDialogFamily(dialogFamily);
        Open();
        ++generation;
    }
    resourceGeneration = Resources::Instance().Generation();
}

void FontLibrary::Open() {
    UseConfig(FcConfigCreate());
    LoadFace(0);
    if (!context)
        OpenMap();
    if (!FcConfigGetFonts(config, FcSetApplication))
        AddSystemFonts(); // better any text than none
}

// The configuration must be current before there is a font map, or the map loads the system's. The map takes
// the current one: setting it as the map's own would leak it. What was shaped before keeps the map before.
void FontLibrary::OpenMap() {
    CloseMap();
    map = pango_cairo_font_map_new_for_font_type(CAIRO_FONT_TYPE_FT);
    context = pango_font_map_create_context(map);
    pango_context_set_language(context, pango_language_from_string(kShapingLanguage));
    pango_context_set_round_glyph_positions(context, TRUE);
    cairo_font_options_t *options = NewFontOptions();
    pango_cairo_context_set_font_options(context, options);
    cairo_font_options_destroy(options);
}

void FontLibrary::CloseMap() {
    if (!context)
        return;
    g_object_unref(context);
    Retire(map);
    context = nullptr;
    map = nullptr;
    for (auto &font : fonts)
        font.second.plain.reset();
}

void FontLibrary::Close() {
    fonts.clear();
    CloseMap();
    UseConfig(nullptr);
    loadedFaces = 0;
    systemFonts = false;
}

// In a configuration of its own: a thread may still be looking through the one before.
void FontLibrary::LoadFace(int faceBits) {
    std::uint64_t const bit = std::uint64_t(1) << faceBits;
    if (loadedFaces & bit)
        return;
    loadedFaces |= bit;
    FcConfig *grown = NewConfig(files, [faceBits](FontFile const &file) { return file.face == faceBits; });
    FcFontSet *own = FcConfigGetFonts(grown, FcSetApplication);
    if (!own) {
        FcConfigDestroy(grown);
        return;
    }
    Append(own, FcConfigGetFonts(config, FcSetApplication));
    UseConfig(grown);
    OpenMap();
}

FontLibrary::Font &FontLibrary::Find(FontSpec const &spec) {
    Generation();
    auto const [found, added] = fonts.try_emplace(spec);
    if (added) {
        LoadFace(spec.face & FontFace::kFileBits);
        found->second.description = NewDescription(spec);
    }
    return found->second;
}

// The font comes first: finding it may change the context.
PangoLayout *FontLibrary::NewLayout(FontSpec const &spec) {
    PangoFontDescription const *description = Find(spec).description;
    PangoLayout *layout = pango_layout_new(context);
    pango_layout_set_font_description(layout, description);
    return layout;
}

PlainShaper const &FontLibrary::Plain(FontSpec const &spec) {
    std::unique_ptr<PlainShaper> &plain = Find(spec).plain;
    if (!plain) {
        struct Unref {
            void operator()(PangoLayout *layout) const { g_object_unref(layout); }
        };
        std::unique_ptr<PangoLayout, Unref> const layout(NewLayout(spec));
        plain = std::make_unique<PlainShaper>(layout.get());
    }
    return *plain;
}

FontMetrics const &FontLibrary::Metrics(FontSpec const &spec) {
    Font &font = Find(spec);
    if (!font.measured) {
        font.metrics = Measure(context, font.description);
        font.measured = true;
    }
    return font.metrics;
}

PangoFontDescription const *FontLibrary::Description(FontSpec const &spec) { return Find(spec).description; }

// Other copies of the pinned files' families are left out: they would take turns with these.
bool FontLibrary::AddSystemFonts() {
    if (systemFonts)
        return false;
    systemFonts = true;
    if (FcConfig *system = FcInitLoadConfigAndFonts()) {
        FcConfig *grown = NewConfig(files, [](FontFile const &) { return true; });
        if (FcFontSet *own = FcConfigGetFonts(grown, FcSetApplication)) {
            Append(own, FcConfigGetFonts(system, FcSetSystem), FamiliesOf(own));
            std::swap(grown, system);
        }
        FcConfigDestroy(grown);
        UseConfig(system);
    }
    loadedFaces = ~std::uint64_t(0);
    OpenMap();
    fonts.clear();
    ++generation;
    return true;
}

void FontLibrary::UseConfig(FcConfig *other) {
    FcConfigSetCurrent(other);
    if (config)
        FcConfigDestroy(config);
    config = other;
}
