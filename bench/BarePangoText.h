// Text as the bare libraries draw it.
#pragma once
#include <cairo.h>
#include <pango/pangocairo.h>

// A laid-out text and a context to draw it in, both kept, so that drawing is one call. Shaped in the font
// that the desktop has for the entry of its font table, so that the pixels are the same.
class BarePangoText {
public:
    // Broken where the width in pixels ends; one line without it.
    BarePangoText(cairo_surface_t *, char const *text, int font, int wrapWidth = 0);
    ~BarePangoText();
    BarePangoText(BarePangoText const &) = delete;
    BarePangoText &operator=(BarePangoText const &) = delete;

    int Width() const;  // pixels
    int Height() const; // pixels
    void Draw(int left, int top) {
        cairo_move_to(context, left, top);
        pango_cairo_show_layout(context, layout);
    }

private:
    cairo_t *context;
    PangoLayout *layout;
};
