// A PDF file of pages of one size.
#pragma once
#include "desktop/printing/OutputFile.h"
#include <string>

typedef struct _cairo_surface cairo_surface_t; // NOLINT(bugprone-reserved-identifier): Cairo's own name

// A page's own coordinates are pixels of so many to a logical one, which is a point, 1/72 inch; they count
// from the top left of what is printed on, inside of the paper's margins.
class PdfFile {
public:
    // The paper and its margins in points. Throws std::runtime_error when the file could not be written.
    PdfFile(std::string const &path, int width, int height, int margin, double pixelsPerPoint,
            std::string const &title);
    ~PdfFile(); // without Finish, no file is left and an older one is untouched
    PdfFile(PdfFile const &) = delete;
    PdfFile &operator=(PdfFile const &) = delete;

    // Where the present page is drawn.
    cairo_surface_t *Page() const { return surface; }
    // The present page is done, and the next one is empty.
    void EndPage();
    // Writes what is left; throws std::runtime_error with the reason when it could not be written.
    void Finish();

private:
    OutputFile file;
    cairo_surface_t *surface;
};
