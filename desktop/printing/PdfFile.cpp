#include "desktop/printing/PdfFile.h"
#include <cairo-pdf.h>
#include <stdexcept>

namespace {

cairo_status_t WriteTo(void *file, unsigned char const *bytes, unsigned int count) {
    return static_cast<OutputFile *>(file)->Write(bytes, count) ? CAIRO_STATUS_SUCCESS
                                                                : CAIRO_STATUS_WRITE_ERROR;
}

} // namespace

PdfFile::PdfFile(std::string const &path, int width, int height, int margin, double pixelsPerPoint,
                 std::string const &title)
    : file(path)
    , surface(cairo_pdf_surface_create_for_stream(WriteTo, &file, width, height)) {
    if (!title.empty())
        cairo_pdf_surface_set_metadata(surface, CAIRO_PDF_METADATA_TITLE, title.c_str());
    cairo_surface_set_device_offset(surface, margin, margin);
    cairo_surface_set_device_scale(surface, 1 / pixelsPerPoint, 1 / pixelsPerPoint);
}

PdfFile::~PdfFile() {
    cairo_surface_finish(surface); // contexts that outlive this object must not write any more
    cairo_surface_destroy(surface);
}

void PdfFile::EndPage() { cairo_surface_show_page(surface); }

void PdfFile::Finish() {
    cairo_surface_finish(surface);
    cairo_status_t const status = cairo_surface_status(surface);
    // The file knows better why it could not be written.
    if (status != CAIRO_STATUS_SUCCESS && status != CAIRO_STATUS_WRITE_ERROR)
        throw std::runtime_error(std::string("cannot print: ") + cairo_status_to_string(status));
    file.Finish();
}
