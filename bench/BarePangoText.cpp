#include "bench/BarePangoText.h"
#include "desktop/type/FontLibrary.h"
#include "host/OSFont.h"

static FontSpec SpecOf(int font) {
    fontSaveRec const &record = *GetIndVelaFont(font);
    return FontSpec::Make(record.family.GetOrderedFontID(), record.face, record.size);
}

BarePangoText::BarePangoText(cairo_surface_t *surface, char const *text, int font, int wrapWidth)
    : context(cairo_create(surface))
    , layout(FontLibrary::Instance().NewLayout(SpecOf(font))) {
    if (wrapWidth > 0)
        pango_layout_set_width(layout, wrapWidth * PANGO_SCALE);
    pango_layout_set_text(layout, text, -1);
    cairo_set_source_rgb(context, 0, 0, 0);
}

BarePangoText::~BarePangoText() {
    g_object_unref(layout);
    cairo_destroy(context);
}

int BarePangoText::Width() const {
    int width = 0;
    pango_layout_get_pixel_size(layout, &width, nullptr);
    return width;
}

int BarePangoText::Height() const {
    int height = 0;
    pango_layout_get_pixel_size(layout, nullptr, &height);
    return height;
}
