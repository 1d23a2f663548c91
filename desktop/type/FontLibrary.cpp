#include "desktop/type/FontLibrary.h"
#include "desktop/resources/Resources.h"
#include "desktop/type/FontFamilies.h"
#include <algorithm>
#include <cmath>
#include <fontconfig/fontconfig.h>
#include <pango/pangocairo.h>
#include <pango/pangofc-fontmap.h>
#include <set>

// What is kept of a font once it was used.
struct FontLibrary::Font {
    PangoFontDescription *description = nullptr;
    FontMetrics metrics = {0, 0, 0};
    bool measured = false;

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

// Puts fonts behind those that are there. Other copies of the same families are left out: they would take
// turns with the pinned files.
void AppendOtherFamilies(FcFontSet *own, FcFontSet const *others) {
    std::set<std::string> const ownFamilies = FamiliesOf(own);
    for (int i = 0; others && i < others->nfont; ++i) {
        FcPattern *font = others->fonts[i];
        if (ownFamilies.count(FamilyOf(font)))
            continue;
        FcPatternReference(font);
        FcFontSetAdd(own, font);
    }
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

FontLibrary &FontLibrary::Instance() {
    static FontLibrary library;
    return library;
}

FontLibrary::FontLibrary() {}

FontLibrary::~FontLibrary() { Close(); }

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

// The configuration must be current before there is a font map, or the map loads the system's. The map takes
// the current one: setting it as the map's own would leak it.
void FontLibrary::Open() {
    config = FcConfigCreate();
    FcConfigSetCurrent(config);
    LoadFace(0); // while there is no map yet: a map starts threads whenever its fonts change
    map = pango_cairo_font_map_new_for_font_type(CAIRO_FONT_TYPE_FT);
    context = pango_font_map_create_context(map);
    pango_context_set_language(context, pango_language_from_string(kShapingLanguage));
    pango_context_set_round_glyph_positions(context, TRUE);
    cairo_font_options_t *options = NewFontOptions();
    pango_cairo_context_set_font_options(context, options);
    cairo_font_options_destroy(options);
    if (!FcConfigGetFonts(config, FcSetApplication))
        AddSystemFonts(); // better any text than none
}

void FontLibrary::Close() {
    fonts.clear();
    if (!context)
        return;
    g_object_unref(context);
    g_object_unref(map);
    FcConfigSetCurrent(nullptr);
    FcConfigDestroy(config);
    context = nullptr;
    map = nullptr;
    config = nullptr;
    loadedFaces = 0;
    systemFonts = false;
}

void FontLibrary::LoadFace(int faceBits) {
    std::uint64_t const bit = std::uint64_t(1) << faceBits;
    if (loadedFaces & bit)
        return;
    loadedFaces |= bit;
    bool added = false;
    for (FontFile const &file : files) {
        if (file.face == faceBits && FcConfigAppFontAddFile(config, FcText(file.path)))
            added = true;
    }
    if (added && map)
        pango_fc_font_map_config_changed(PANGO_FC_FONT_MAP(map));
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

PangoContext *FontLibrary::Context() {
    Generation();
    return context;
}

PangoFontDescription const *FontLibrary::Description(FontSpec const &spec) { return Find(spec).description; }

FontMetrics const &FontLibrary::Metrics(FontSpec const &spec) {
    Font &font = Find(spec);
    if (!font.measured) {
        font.metrics = Measure(context, font.description);
        font.measured = true;
    }
    return font.metrics;
}

bool FontLibrary::AddSystemFonts() {
    if (systemFonts)
        return false;
    systemFonts = true;
    for (FontFile const &file : files)
        LoadFace(file.face);
    if (FcConfig *system = FcInitLoadConfigAndFonts()) {
        if (FcFontSet *own = FcConfigGetFonts(config, FcSetApplication)) {
            AppendOtherFamilies(own, FcConfigGetFonts(system, FcSetSystem));
            FcConfigDestroy(system);
        } else {
            UseConfig(system);
        }
    }
    pango_fc_font_map_config_changed(PANGO_FC_FONT_MAP(map));
    fonts.clear();
    ++generation;
    return true;
}

void FontLibrary::UseConfig(FcConfig *other) {
    FcConfigSetCurrent(other);
    FcConfigDestroy(config);
    config = other;
}
