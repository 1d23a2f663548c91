#include "desktop/editing/ParagraphLayout.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/ShapedText.h"
#include <algorithm>
#include <cmath>
#include <numeric>
#include <pango/pangocairo.h>

namespace {

// Keeps sums of places within 32 bits whatever a text claims to be.
constexpr int kFarthest = 1 << 20;
constexpr double kWholeColor = 65535.0;

int Pixels(int pangoUnits) {
    return PANGO_PIXELS(std::clamp(pangoUnits, -kFarthest * PANGO_SCALE, kFarthest * PANGO_SCALE));
}

guint16 Component(double value) {
    return static_cast<guint16>(std::lround((value > 0 ? std::min(value, 1.0) : 0.0) * kWholeColor));
}

void Insert(PangoAttrList *list, PangoAttribute *attribute, int start, int end) {
    attribute->start_index = static_cast<guint>(start);
    attribute->end_index = static_cast<guint>(end);
    pango_attr_list_insert(list, attribute);
}

void InsertColor(PangoAttrList *list, OS::RGBAColor const &color, int start, int end) {
    Insert(list, pango_attr_foreground_new(Component(color.r), Component(color.g), Component(color.b)), start,
           end);
    // An alpha of 0 would mean none.
    Insert(list, pango_attr_foreground_alpha_new(std::max<guint16>(Component(color.a), 1)), start, end);
}

// The fonts must have been looked up before: finding one may change the context of those after it.
PangoAttrList *NewAttributes(ShownText const &text, StyleRuns::List const &runs) {
    PangoAttrList *const list = pango_attr_list_new();
    for (std::size_t i = 0; i < runs.size(); ++i) {
        int const start = text.ByteOf(runs[i].start);
        int const end = text.ByteOf(i + 1 < runs.size() ? runs[i + 1].start : text.Units());
        FontSpec const font = runs[i].style.Font();
        if (i > 0)
            Insert(list, pango_attr_font_desc_new(FontLibrary::Instance().Description(font)), start, end);
        if (font.face & FontFace::kUnderline)
            Insert(list, pango_attr_underline_new(PANGO_UNDERLINE_SINGLE), start, end);
        if (runs[i].style.colored)
            InsertColor(list, runs[i].style.style.color, start, end);
    }
    return list;
}

// Which way the character at the byte is written.
bool RunsToLeft(PangoLayoutLine const &line, int byte) {
    for (GSList const *node = line.runs; node; node = node->next) {
        PangoItem const &item = *static_cast<PangoGlyphItem const *>(node->data)->item;
        if (byte >= item.offset && byte < item.offset + item.length)
            return item.analysis.level % 2 != 0;
    }
    return false;
}

// A line that is scrolled through stands where it is read from, whatever its alignment: so its beginning is
// what shows first, and all of it can be reached.
int LeftOfLine(ParagraphLayout::Line const &line, ParagraphLayout::Room const &room) {
    if (!room.wraps && line.width > room.width)
        return line.rightToLeft ? room.width - line.width : 0;
    return ShapedText::LineStart(line.width, room.width, room.alignment, line.rightToLeft);
}

PangoLogAttr const *AttributesOf(PangoLayout *layout, std::size_t &count) {
    int all = 0;
    PangoLogAttr const *const attributes = pango_layout_get_log_attrs_readonly(layout, &all);
    count = static_cast<std::size_t>(all);
    return attributes;
}

} // namespace

// What has been made is let go too where memory for the rest is wanting.
ParagraphLayout::ParagraphLayout(std::u16string_view units, StyleRuns::List const &given, Room const &room)
    : ParagraphLayout(units) {
    StyleRuns::List runs = given;
    Make(runs, room);
    if (pango_layout_get_unknown_glyphs_count(layout) != 0 && FontLibrary::Instance().AddSystemFonts())
        Make(runs, room);
    while (!room.wraps && MakeSmaller(runs))
        Make(runs, room);
    MeasureLines(runs, room);
    generation = FontLibrary::Instance().Generation();
}

ParagraphLayout::ParagraphLayout(std::u16string_view units)
    : text(units) {}

ParagraphLayout::~ParagraphLayout() { Replace(nullptr); }

void ParagraphLayout::Replace(PangoLayout *other) {
    if (layout)
        g_object_unref(layout);
    layout = other;
}

bool ParagraphLayout::IsCurrent() const { return generation == FontLibrary::Instance().Generation(); }

void ParagraphLayout::Make(StyleRuns::List const &runs, Room const &room) {
    for (StyleRuns::Run const &run : runs)
        FontLibrary::Instance().Description(run.style.Font());
    Replace(FontLibrary::Instance().NewLayout(runs.front().style.Font()));
    bool const plain = runs.size() == 1 && !runs.front().style.colored &&
                       !(runs.front().style.Font().face & FontFace::kUnderline);
    if (!plain) {
        PangoAttrList *const attributes = NewAttributes(text, runs);
        pango_layout_set_attributes(layout, attributes);
        pango_attr_list_unref(attributes);
    }
    pango_layout_set_single_paragraph_mode(layout, TRUE);
    if (room.wraps) {
        pango_layout_set_width(layout, std::clamp(room.width, 1, kFarthest) * PANGO_SCALE);
        pango_layout_set_wrap(layout, PANGO_WRAP_WORD_CHAR);
    }
    pango_layout_set_text(layout, text.Utf8().data(), static_cast<int>(text.Utf8().size()));
}

// A line that goes on beyond where places can be told is set in smaller letters. False when it need not or
// cannot be.
bool ParagraphLayout::MakeSmaller(StyleRuns::List &runs) const {
    long long width = 0; // of more glyphs than Pango adds up
    for (GSList const *node = PangoLine(0)->runs; node; node = node->next) {
        PangoGlyphString const &glyphs = *static_cast<PangoGlyphItem const *>(node->data)->glyphs;
        for (int i = 0; i < glyphs.num_glyphs; ++i)
            width += glyphs.glyphs[i].geometry.width;
    }
    width /= PANGO_SCALE;
    bool smaller = false;
    for (StyleRuns::Run &run : runs) {
        long long const size = run.style.Font().size;
        run.style.style.size = static_cast<short>(
            width > kFarthest ? std::max<long long>(size * kFarthest / width, FontSpec::kSmallestSize)
                              : size);
        smaller = smaller || run.style.style.size < size;
    }
    return smaller;
}

// Lines are as high as their fonts, also where other fonts stand in for characters that these lack: so a
// line stays where it is whatever is typed.
void ParagraphLayout::MeasureLines(StyleRuns::List const &runs, Room const &room) {
    int const count = pango_layout_get_line_count(layout);
    lines.reserve(static_cast<std::size_t>(count));
    int top = 0;
    std::size_t run = 0;
    for (int i = 0; i < count; ++i) {
        PangoLayoutLine *const pangoLine = pango_layout_get_line_readonly(layout, i);
        Line line;
        line.start = text.UnitOfByte(pangoLine->start_index);
        line.end =
            i + 1 == count ? text.Units() : text.UnitOfByte(pangoLine->start_index + pangoLine->length);
        line.rightToLeft = pango_layout_line_get_resolved_direction(pangoLine) == PANGO_DIRECTION_RTL;
        int ascent = 0, descent = 0;
        while (run + 1 < runs.size() && runs[run + 1].start <= line.start)
            ++run;
        for (std::size_t r = run; r < runs.size() && (r == run || runs[r].start < line.end); ++r) {
            FontMetrics const &metrics = FontLibrary::Instance().Metrics(runs[r].style.Font());
            ascent = std::max(ascent, metrics.ascent);
            descent = std::max(descent, metrics.descent);
        }
        PangoRectangle ink, logical;
        pango_layout_line_get_extents(pangoLine, &ink, &logical);
        line.width = std::max(Pixels(logical.width), 0);
        line.left = LeftOfLine(line, room);
        line.top = top;
        line.height = std::max(ascent + descent, 1);
        line.baseline = top + ascent;
        // Finer pixels may round outward once more, and a line below the text is no ink.
        line.inkTop = std::min(line.baseline + Pixels(ink.y) - 1, line.top);
        line.inkBottom = std::max(line.baseline + Pixels(ink.y + ink.height) + 1, line.top + line.height);
        top += line.height;
        lines.push_back(line);
    }
}

PangoLayoutLine *ParagraphLayout::PangoLine(std::size_t line) const {
    return pango_layout_get_line_readonly(layout, static_cast<int>(line));
}

std::size_t ParagraphLayout::LineAtUnit(std::size_t unit) const {
    auto const next =
        std::upper_bound(lines.begin() + 1, lines.end(), unit,
                         [](std::size_t place, Line const &line) { return place < line.start; });
    return static_cast<std::size_t>(next - lines.begin()) - 1;
}

std::size_t ParagraphLayout::LineAtHeight(int v) const {
    auto const next = std::upper_bound(lines.begin() + 1, lines.end(), v,
                                       [](int place, Line const &line) { return place < line.top; });
    return static_cast<std::size_t>(next - lines.begin()) - 1;
}

// Places

// Where the direction changes there are two places; it stands at the one that goes on as the line does.
int ParagraphLayout::LeftOf(std::size_t unit) const {
    std::size_t const index = LineAtUnit(unit);
    Line const &line = lines[index];
    PangoLayoutLine *const pangoLine = PangoLine(index);
    int const byte = text.ByteOf(unit);
    if (byte <= pangoLine->start_index)
        return line.rightToLeft ? line.left + line.width : line.left;
    int const before = text.ByteOf(text.UnitOfCharacter(text.CharacterOf(unit) - 1));
    int h = 0;
    if (RunsToLeft(*pangoLine, before) == line.rightToLeft)
        pango_layout_line_index_to_x(pangoLine, before, TRUE, &h);
    else if (byte < pangoLine->start_index + pangoLine->length)
        pango_layout_line_index_to_x(pangoLine, byte, FALSE, &h);
    else
        return line.rightToLeft ? line.left : line.left + line.width;
    return line.left + Pixels(h);
}

std::size_t ParagraphLayout::UnitAt(std::size_t line, int h) const {
    int byte = 0, trailing = 0;
    Line const &place = lines[line];
    int const inLine = std::clamp(h - place.left, -kFarthest, kFarthest);
    pango_layout_line_x_to_index(PangoLine(line), inLine * PANGO_SCALE, &byte, &trailing);
    std::size_t const unit =
        text.UnitOfCharacter(text.CharacterOf(text.UnitOfByte(byte)) + static_cast<std::size_t>(trailing));
    // The end of a broken line is the start of the next one: where it is wanted, it stands before the last
    // character, which is mostly a space.
    if (line + 1 < lines.size() && unit >= place.end)
        return std::max(Before(place.end), place.start);
    return unit;
}

std::size_t ParagraphLayout::CharacterAt(std::size_t line, int h) const {
    int byte = 0, trailing = 0;
    int const inLine = std::clamp(h - lines[line].left, -kFarthest, kFarthest);
    pango_layout_line_x_to_index(PangoLine(line), inLine * PANGO_SCALE, &byte, &trailing);
    return text.UnitOfByte(byte);
}

std::vector<ParagraphLayout::Range> ParagraphLayout::RangesOf(std::size_t line, std::size_t start,
                                                              std::size_t end) const {
    std::vector<Range> ranges;
    int const from = text.ByteOf(start), to = text.ByteOf(end);
    int left = 0;
    for (GSList const *node = PangoLine(line)->runs; node; node = node->next) {
        PangoGlyphItem const &run = *static_cast<PangoGlyphItem const *>(node->data);
        PangoItem const &item = *run.item;
        int const first = std::max(from, item.offset), last = std::min(to, item.offset + item.length);
        if (first < last) {
            char *const bytes = const_cast<char *>(text.Utf8().data()) + item.offset;
            PangoAnalysis *const analysis = &run.item->analysis;
            int a = 0, b = 0;
            pango_glyph_string_index_to_x(run.glyphs, bytes, item.length, analysis, first - item.offset,
                                          FALSE, &a);
            pango_glyph_string_index_to_x(run.glyphs, bytes, item.length, analysis, last - item.offset, FALSE,
                                          &b);
            Range const range(lines[line].left + Pixels(left + std::min(a, b)),
                              lines[line].left + Pixels(left + std::max(a, b)));
            if (!ranges.empty() && ranges.back().second == range.first)
                ranges.back().second = range.second;
            else
                ranges.push_back(range);
        }
        left += pango_glyph_string_get_width(run.glyphs);
    }
    return ranges;
}

// Steps

bool ParagraphLayout::IsStop(std::size_t character) const {
    std::size_t count = 0;
    PangoLogAttr const *const attributes = AttributesOf(layout, count);
    return character >= count || attributes[character].is_cursor_position;
}

std::size_t ParagraphLayout::Before(std::size_t unit) const {
    std::size_t character = text.CharacterOf(unit);
    if (text.UnitOfCharacter(character) < unit)
        return text.UnitOfCharacter(character); // it was within one
    while (character > 0 && !IsStop(--character)) {
    }
    return text.UnitOfCharacter(character);
}

std::size_t ParagraphLayout::After(std::size_t unit) const {
    std::size_t const last = text.CharacterOf(text.Units());
    std::size_t character = text.CharacterOf(unit);
    while (character < last && !IsStop(++character)) {
    }
    return text.UnitOfCharacter(character);
}

// Pango has a call for this, which takes a time that grows with the square of the line.
bool ParagraphLayout::Step(std::size_t &unit, bool toTheRight) const {
    std::size_t const index = LineAtUnit(unit);
    Line const &line = lines[index];
    std::vector<int> places = PlacesIn(index);
    if (index + 1 < lines.size())
        places.pop_back(); // it is the next line's first
    std::size_t const first = text.CharacterOf(line.start);
    std::size_t const here = text.CharacterOf(unit) - first;
    std::size_t next = here;
    for (std::size_t i = 0; i < places.size(); ++i) {
        bool const beyond = toTheRight ? places[i] > places[here] : places[i] < places[here];
        bool const nearer =
            next == here || (toTheRight ? places[i] < places[next] : places[i] > places[next]);
        if (beyond && nearer && IsStop(first + i))
            next = i;
    }
    if (next != here) {
        unit = text.UnitOfCharacter(first + next);
        return true;
    }
    bool const onward = toTheRight != line.rightToLeft;
    if (onward ? index + 1 == lines.size() : index == 0)
        return false;
    unit = onward ? lines[index + 1].start : Before(line.start);
    return true;
}

// Where an insertion point stands before each character of the line, and behind the last: as LeftOf has it,
// but in Pango's units and in equal parts of what several characters make up.
std::vector<int> ParagraphLayout::PlacesIn(std::size_t index) const {
    struct Edges {
        int before, behind;
        bool toLeft;
    };
    Line const &line = lines[index];
    std::size_t const first = text.CharacterOf(line.start);
    std::vector<Edges> edges(text.CharacterOf(line.end) - first, Edges{0, 0, false});
    std::vector<int> widths;
    int left = 0;
    for (GSList const *node = PangoLine(index)->runs; node; node = node->next) {
        PangoGlyphItem const &run = *static_cast<PangoGlyphItem const *>(node->data);
        PangoItem const &item = *run.item;
        widths.resize(static_cast<std::size_t>(item.num_chars));
        pango_glyph_string_get_logical_widths(run.glyphs, text.Utf8().data() + item.offset, item.length,
                                              item.analysis.level, widths.data());
        bool const toLeft = item.analysis.level % 2 != 0;
        int const right = std::accumulate(widths.begin(), widths.end(), left);
        int place = toLeft ? right : left;
        std::size_t character = text.CharacterOf(text.UnitOfByte(item.offset)) - first;
        for (int width : widths) {
            int const behind = toLeft ? place - width : place + width;
            edges[character++] = {place, behind, toLeft};
            place = behind;
        }
        left = right;
    }
    int const start = line.rightToLeft ? left : 0, end = left - start;
    std::vector<int> places(1, start);
    for (std::size_t i = 0; i < edges.size(); ++i) {
        bool const goesOn = edges[i].toLeft == line.rightToLeft;
        places.push_back(goesOn ? edges[i].behind : i + 1 < edges.size() ? edges[i + 1].before : end);
    }
    return places;
}

std::size_t ParagraphLayout::WordStartBefore(std::size_t unit) const {
    std::size_t count = 0;
    PangoLogAttr const *const attributes = AttributesOf(layout, count);
    std::size_t character = text.CharacterOf(unit);
    while (character > 0 && !attributes[--character].is_word_start) {
    }
    return text.UnitOfCharacter(character);
}

std::size_t ParagraphLayout::WordEndAfter(std::size_t unit) const {
    std::size_t count = 0;
    PangoLogAttr const *const attributes = AttributesOf(layout, count);
    std::size_t character = text.CharacterOf(unit);
    while (character + 1 < count && !attributes[++character].is_word_end) {
    }
    return text.UnitOfCharacter(character);
}

void ParagraphLayout::WordAround(std::size_t unit, std::size_t &start, std::size_t &end) const {
    std::size_t count = 0;
    PangoLogAttr const *const attributes = AttributesOf(layout, count);
    std::size_t const character = text.CharacterOf(unit);
    std::size_t first = character, last = character;
    while (first > 0 && !attributes[first].is_word_start && !attributes[first].is_word_end)
        --first;
    if (attributes[first].is_word_start) {
        while (last + 1 < count && !attributes[++last].is_word_end) {
        }
        start = text.UnitOfCharacter(first);
        end = text.UnitOfCharacter(last);
        return;
    }
    start = unit;
    end = After(unit);
}

std::size_t ParagraphLayout::DeletionStart(std::size_t unit) const {
    std::size_t count = 0;
    PangoLogAttr const *const attributes = AttributesOf(layout, count);
    std::size_t const character = text.CharacterOf(unit);
    if (character > 0 && character < count && attributes[character].backspace_deletes_character)
        return text.UnitOfCharacter(character - 1);
    return Before(unit);
}

// Drawing

void ParagraphLayout::DrawLine(cairo_t *context, std::size_t line, int h, int v) const {
    cairo_move_to(context, h + lines[line].left, v + lines[line].baseline);
    pango_cairo_show_layout_line(context, PangoLine(line));
    cairo_new_path(context);
}
