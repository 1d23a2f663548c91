#pragma once
#include "artwork/compiler/IconFamily.h"
#include "artwork/compiler/Theme.h"
#include <cairo.h>
#include <filesystem>
#include <vector>

// One picture of all icons on the window's background, each with its number, and some buttons put together
// from their pieces: to see at a glance whether the artwork is in order.
class ContactSheet {
public:
    // The families must outlive the sheet.
    ContactSheet(std::vector<IconFamily> const &, Theme const &, double scale);
    // Throws ArtworkError when the file cannot be written or a colour that the sheet needs is missing.
    void Write(std::filesystem::path const &png);

private:
    struct Size {
        double width, height;
    };

    // Draws everything, or with a null context only measures.
    Size Draw(cairo_t *context) const;
    Size DrawFamily(cairo_t *context, IconFamily const &, double top) const;
    Size DrawAssembledButtons(cairo_t *context, double top) const;
    void DrawAssembledButton(cairo_t *context, int family, int firstIndex, double left, double top, int width,
                             std::string const &label, char const *textColour) const;
    // A row of stock frames, each with the next note glyph as its mark.
    Size DrawFramedNotes(cairo_t *context, double top) const;
    IconFamily const *FindFamily(int number) const; // null when there is none
    void DrawIcon(cairo_t *context, IconFamily const &, IconFamily::Icon const &, double left,
                  double top) const;
    void DrawText(cairo_t *context, std::string const &text, double left, double baseline, double size,
                  char const *colour) const;
    void SetColour(cairo_t *context, char const *colour) const;
    double ToDevice(double logical) const;

    std::vector<IconFamily> const &families;
    Theme const &theme;
    double scale;
};
