#include "artwork/compiler/ContactSheet.h"
#include "artwork/compiler/ArtworkError.h"
#include "artwork/compiler/IconRenderer.h"
#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <memory>

namespace {

// Measures of the sheet, logical pixels.
constexpr double kMargin = 16;
constexpr double kSheetWidth = 720;
constexpr double kTitleHeight = 20;
constexpr double kTitleSize = 12;
constexpr double kNumberHeight = 14;
constexpr double kNumberSize = 8;
constexpr double kCellGap = 10;
constexpr double kLeastCell = 22;
constexpr double kButtonSize = 12;
constexpr double kButtonRow = 32;
constexpr double kButtonColumn = 120;

constexpr int kOvalFamily = 1841;
constexpr int kOvalPressed = 3;
constexpr int kStudFamily = 1004;
constexpr int kStudPressed = 3;
constexpr int kStudDisabled = 6;
constexpr int kFaceFamily = 1608;
constexpr int kNoteFamily = 1821;
// Where a mark stands on a stock frame.
constexpr double kMarkLeft = 8;
constexpr double kMarkTop = 1;

constexpr char kBackground[] = "kWindowBackgroundColor";
constexpr char kText[] = "kDialogActiveTextColor";
constexpr char kFaintText[] = "kDialogInactiveTextColor";
constexpr char kButtonText[] = "kDialogButtonActiveTextColor";
constexpr char kInactiveButtonText[] = "kDialogButtonInactiveTextColor";

// The text rectangle of a button ends this far above its bottom.
constexpr double kButtonTextRise = 2;

} // namespace

ContactSheet::ContactSheet(std::vector<IconFamily> const &f, Theme const &t, double s)
    : families(f)
    , theme(t)
    , scale(s) {}

void ContactSheet::Write(std::filesystem::path const &png) {
    Size const size = Draw(nullptr);
    RenderedImage image(int(ToDevice(size.width)), int(ToDevice(size.height)));
    RenderedImage::Surface const surface = image.MakeSurface();
    std::unique_ptr<cairo_t, void (*)(cairo_t *)> const context(cairo_create(surface.get()), cairo_destroy);
    Draw(context.get());
    cairo_surface_flush(surface.get());
    image.WritePng(png);
}

ContactSheet::Size ContactSheet::Draw(cairo_t *context) const {
    if (context) {
        SetColour(context, kBackground);
        cairo_paint(context);
    }
    double top = kMargin;
    for (IconFamily const &family : families)
        top += DrawFamily(context, family, top).height + kMargin;
    top += DrawAssembledButtons(context, top).height;
    top += DrawFramedNotes(context, top).height;
    return {kSheetWidth, top};
}

ContactSheet::Size ContactSheet::DrawFamily(cairo_t *context, IconFamily const &family, double top) const {
    DrawText(context, std::to_string(family.Number()) + "  " + family.Name(), kMargin, top + kTitleSize,
             kTitleSize, kText);
    double left = kMargin;
    double rowTop = top + kTitleHeight;
    double rowHeight = 0;
    for (IconFamily::Icon const &icon : family.Icons()) {
        double const cell = std::max(double(icon.width), kLeastCell) + kCellGap;
        if (left + cell > kSheetWidth - kMargin) {
            left = kMargin;
            rowTop += rowHeight;
            rowHeight = 0;
        }
        if (context)
            DrawIcon(context, family, icon, left, rowTop);
        DrawText(context, std::to_string(icon.index), left, rowTop + icon.height + kNumberSize + 2,
                 kNumberSize, kFaintText);
        left += cell;
        rowHeight = std::max(rowHeight, icon.height + kNumberHeight);
    }
    return {kSheetWidth, rowTop + rowHeight - top};
}

ContactSheet::Size ContactSheet::DrawAssembledButtons(cairo_t *context, double top) const {
    struct Sample {
        int family, firstIndex, width;
        char const *label, *colour;
    };
    static constexpr Sample kRows[2][5] = {{{kOvalFamily, 0, 90, "Cancel", kButtonText},
                                            {kOvalFamily, kOvalPressed, 90, "Cancel", kButtonText},
                                            {kOvalFamily, 0, 90, "Cancel", kInactiveButtonText},
                                            {kOvalFamily, 0, 101, "Don’t Save", kButtonText},
                                            {kOvalFamily, 0, 32, "OK", kButtonText}},
                                           {{kStudFamily, 0, 72, "Quantize", kButtonText},
                                            {kStudFamily, kStudPressed, 72, "Quantize", kButtonText},
                                            {kStudFamily, kStudDisabled, 72, "Quantize", kInactiveButtonText},
                                            {kStudFamily, 0, 55, "Solo", kButtonText},
                                            {kStudFamily, kStudPressed, 55, "Mute", kButtonText}}};
    for (auto const &row : kRows) {
        double left = kMargin;
        for (Sample const &sample : row) {
            if (context)
                DrawAssembledButton(context, sample.family, sample.firstIndex, left, top, sample.width,
                                    sample.label, sample.colour);
            left += kButtonColumn;
        }
        top += kButtonRow;
    }
    return {kSheetWidth, 2 * kButtonRow};
}

void ContactSheet::DrawAssembledButton(cairo_t *context, int number, int first, double left, double top,
                                       int width, std::string const &label, char const *textColour) const {
    IconFamily const *const family = FindFamily(number);
    if (!family || !family->Find(first) || !family->Find(first + 1) || !family->Find(first + 2))
        return;
    IconFamily::Icon const &middle = *family->Find(first + 1);
    int const cap = family->Find(first)->width;
    DrawIcon(context, *family, *family->Find(first), left, top);
    cairo_save(context);
    cairo_rectangle(context, ToDevice(left + cap), 0, ToDevice(left + width - cap) - ToDevice(left + cap),
                    1e5);
    cairo_clip(context);
    for (int h = cap; h < width - cap; h += middle.width)
        DrawIcon(context, *family, middle, left + h, top);
    cairo_restore(context);
    DrawIcon(context, *family, *family->Find(first + 2), left + width - cap, top);

    cairo_text_extents_t extents;
    cairo_font_extents_t font;
    cairo_set_font_size(context, kButtonSize * scale);
    cairo_text_extents(context, label.c_str(), &extents);
    cairo_font_extents(context, &font);
    double const drop = number == kOvalFamily && first == kOvalPressed ? 1 : 0;
    double const middleLine = top + drop + (middle.height - kButtonTextRise) / 2.0;
    DrawText(context, label, left + (width - extents.x_advance / scale) / 2,
             middleLine + (font.ascent - font.descent) / scale / 2, kButtonSize, textColour);
}

ContactSheet::Size ContactSheet::DrawFramedNotes(cairo_t *context, double top) const {
    IconFamily const *const faces = FindFamily(kFaceFamily);
    IconFamily const *const notes = FindFamily(kNoteFamily);
    if (context && faces && notes) {
        double left = kMargin;
        std::size_t next = 0;
        for (IconFamily::Icon const &note : notes->Icons()) {
            IconFamily::Icon const &face = faces->Icons()[next++ % faces->Icons().size()];
            DrawIcon(context, *faces, face, left, top);
            DrawIcon(context, *notes, note, left + kMarkLeft, top + kMarkTop);
            left += face.width + kCellGap;
        }
    }
    return {kSheetWidth, kButtonRow};
}

IconFamily const *ContactSheet::FindFamily(int number) const {
    auto const found = std::find_if(families.begin(), families.end(),
                                    [&](IconFamily const &family) { return family.Number() == number; });
    return found == families.end() ? nullptr : &*found;
}

void ContactSheet::DrawIcon(cairo_t *context, IconFamily const &family, IconFamily::Icon const &icon,
                            double left, double top) const {
    int const width = int(ToDevice(left + icon.width) - ToDevice(left));
    int const height = int(ToDevice(top + icon.height) - ToDevice(top));
    RenderedImage image = IconRenderer(family, theme).Render(icon, width, height);
    RenderedImage::Surface const surface = image.MakeSurface();
    cairo_set_source_surface(context, surface.get(), ToDevice(left), ToDevice(top));
    cairo_paint(context);
    // The image dies with this call, and the context would keep pointing to it.
    cairo_set_source_rgb(context, 0, 0, 0);
}

void ContactSheet::DrawText(cairo_t *context, std::string const &text, double left, double baseline,
                            double size, char const *colour) const {
    if (!context)
        return;
    cairo_select_font_face(context, "Roboto", CAIRO_FONT_SLANT_NORMAL, CAIRO_FONT_WEIGHT_NORMAL);
    cairo_set_font_size(context, size * scale);
    SetColour(context, colour);
    cairo_move_to(context, ToDevice(left), ToDevice(baseline));
    cairo_show_text(context, text.c_str());
}

void ContactSheet::SetColour(cairo_t *context, char const *colour) const {
    Theme::Colour const *const found = theme.NamedColour(colour);
    if (!found)
        throw ArtworkError("theme " + theme.Name() + ": the colour " + colour + " is missing");
    cairo_set_source_rgb(context, found->red / 255.0, found->green / 255.0, found->blue / 255.0);
}

double ContactSheet::ToDevice(double logical) const { return std::floor(logical * scale + 0.5); }
