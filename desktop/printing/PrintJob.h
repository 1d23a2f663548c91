// Printing of panes, one job at a time.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/printing/Paper.h"
#include "desktop/printing/PdfFile.h"
#include "host/PageFormat.h"
#include "host/UString.h"
#include <memory>
#include <string>
#include <vector>

class GlogPane;
class PaneWatch;

// From the first pane to the finished file. While it lives, PageFormat::GetCurrentFormat is its format, and
// the pane that prints draws on the page instead of in its window.
class PrintJob {
public:
    // The header's texts are UTF-8, as many as there are. Throws std::logic_error while there is another job.
    PrintJob(std::string const &path, Paper const &, std::vector<std::string> const &header);
    ~PrintJob();
    PrintJob(PrintJob const &) = delete;
    PrintJob &operator=(PrintJob const &) = delete;
    static PrintJob *Running() { return running; } // null without one

    // Prints all pages of the pane, if it has any. Throws what the pane throws, and std::runtime_error when
    // the file cannot be made or the pane does not come to an end.
    void Print(GlogPane &);
    // Puts the file in its place, if any page was printed; throws std::runtime_error.
    void Finish();
    int Pages() const { return pages; }

    PageFormat &Format() { return format; }
    // Makes the page current if the pane is the one that prints; false otherwise.
    bool PrepareFor(GlogPane const &);

private:
    bool Ask(GlogPane &, int kind, int page);
    bool PrintPage(GlogPane &);
    void EndAfterFailure(GlogPane &, PaneWatch const &);
    void OpenFile();

    static PrintJob *running;
    std::string path;
    Paper paper;
    std::vector<std::string> header;
    PageFormat format;
    std::unique_ptr<PdfFile> file; // made for the first page
    DrawingPort port;              // of the page
    GlogPane const *printing = nullptr;
    int pages = 0;
};
