#include "desktop/type/PlainShaper.h"
#include <boost/container/small_vector.hpp>
#include <pango/pango.h>
#include <string>

// Digits and signs among themselves have no script of their own.
struct PlainShaper::Kind {
    PangoAnalysis analysis = {};
    bool usable = false;
};

namespace {

char16_t const kFirst = 0x20, kLast = 0x7E;

bool IsLetter(char16_t c) { return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z'); }

std::string AllCharacters(bool letters) {
    std::string all;
    for (char16_t c = kFirst; c <= kLast; ++c)
        if (letters || !IsLetter(c))
            all += static_cast<char>(c);
    return all;
}

} // namespace

PlainShaper::PlainShaper(PangoLayout *layout)
    : kinds(new Kind[2]) {
    for (bool letters : {false, true})
        kinds[letters].usable = Look(layout, letters, kinds[letters].analysis);
}

PlainShaper::~PlainShaper() {
    for (bool letters : {false, true})
        if (kinds[letters].usable)
            g_object_unref(kinds[letters].analysis.font);
}

// A font that has all of them gives a single run.
bool PlainShaper::Look(PangoLayout *layout, bool letters, PangoAnalysis &analysis) {
    std::string const all = AllCharacters(letters);
    pango_layout_set_text(layout, all.data(), static_cast<int>(all.size()));
    GSList const *const runs = pango_layout_get_line_readonly(layout, 0)->runs;
    if (pango_layout_get_unknown_glyphs_count(layout) != 0 || !runs || runs->next)
        return false;
    PangoAnalysis const &found = static_cast<PangoLayoutRun const *>(runs->data)->item->analysis;
    if (found.extra_attrs || found.level != 0)
        return false;
    analysis = found;
    g_object_ref(analysis.font);
    return true;
}

PangoFont *PlainShaper::Shape(std::u16string_view text, PangoGlyphString *glyphs) const {
    std::size_t const kMostOfLabel = 64;
    boost::container::small_vector<char, kMostOfLabel> ascii;
    bool letters = false;
    for (char16_t c : text) {
        if (c < kFirst || c > kLast)
            return nullptr;
        letters = letters || IsLetter(c);
        ascii.push_back(static_cast<char>(c));
    }
    Kind const &kind = kinds[letters];
    if (ascii.empty() || !kind.usable)
        return nullptr;
    int const length = static_cast<int>(ascii.size());
    pango_shape_with_flags(ascii.data(), length, ascii.data(), length, &kind.analysis, glyphs,
                           PANGO_SHAPE_ROUND_POSITIONS);
    return kind.analysis.font;
}
