#include "desktop/printing/PrintJob.h"
#include "desktop/Desktop.h"
#include "desktop/panes/PortKeeper.h"
#include "desktop/resources/Utf.h"
#include "host/GlogPane.h"
#include "host/PaneWatch.h"
#include <algorithm>
#include <iterator>
#include <stdexcept>

namespace {

enum PrintKind { kStart = 2, kOnePage = 3, kEnd = 4 };

// Icons are printed as finely as there are any.
double const kPixelsPerPoint = 3.0;
// More are not a long list but a pane that never ends.
int const kMostPages = 100000;

} // namespace

PrintJob *PrintJob::running = nullptr;

PrintJob::PrintJob(std::string const &path_, Paper const &paper_, std::vector<std::string> const &header_)
    : path(path_)
    , paper(paper_)
    , header(header_)
    , format(paper_.Printable()) {
    if (running)
        throw std::logic_error("something is being printed already");
    Rect const page = format.GetPageRect();
    port.SetExtent(page.right, page.bottom);
    running = this;
}

PrintJob::~PrintJob() {
    port.SetPage(nullptr, DeviceScale());
    running = nullptr;
}

void PrintJob::Print(GlogPane &pane) {
    PortKeeper const keeper;
    PaneWatch const watch(&pane);
    struct Printing {
        explicit Printing(PrintJob &job_)
            : job(job_) {}
        ~Printing() { job.printing = nullptr; }
        PrintJob &job;
    } const current(*this);
    printing = &pane;
    try {
        bool more = Ask(pane, kStart, 1);
        while (more && watch.PaneExists())
            more = PrintPage(pane);
    } catch (...) {
        EndAfterFailure(pane, watch);
        throw;
    }
    if (watch.PaneExists())
        Ask(pane, kEnd, pages);
}

// A pane that was asked to start is told of the end, whatever happened in between; that is what is reported.
void PrintJob::EndAfterFailure(GlogPane &pane, PaneWatch const &watch) {
    try {
        if (watch.PaneExists())
            Ask(pane, kEnd, pages);
    } catch (...) {
    }
}

bool PrintJob::PrintPage(GlogPane &pane) {
    if (pages == kMostPages)
        throw std::runtime_error("cannot print more than " + std::to_string(kMostPages) + " pages");
    OpenFile();
    ++pages;
    PrepareFor(pane);
    port.State() = GraphicsState();
    bool const more = Ask(pane, kOnePage, pages);
    file->EndPage();
    return more;
}

void PrintJob::OpenFile() {
    if (file)
        return;
    std::string const title = header.empty() ? std::string() : Utf::ToUtf8(Utf::FromUtf8(header.front()));
    file.reset(new PdfFile(path, paper.width, paper.height, paper.margin, kPixelsPerPoint, title));
    port.SetPage(file->Page(), DeviceScale(kPixelsPerPoint));
}

bool PrintJob::Ask(GlogPane &pane, int kind, int page) {
    PrintMessageRec message;
    message.kind = kind;
    message.page = page;
    std::size_t const texts = std::min(header.size(), std::size(message.header));
    for (std::size_t i = 0; i < texts; ++i)
        message.header[i] = Utf::FromUtf8(header[i]);
    return pane.Print(&message);
}

void PrintJob::Finish() {
    if (file)
        file->Finish();
}

bool PrintJob::PrepareFor(GlogPane const &pane) {
    if (printing != &pane)
        return false;
    DrawingPort::MakeCurrent(&port);
    port.SetOrigin(0, 0);
    port.SetBoundary(OSRgn(port.Extent()));
    return true;
}

PageFormat *PageFormat::GetCurrentFormat(bool) {
    static PageFormat next(Paper::Named("A4").Printable());
    if (PrintJob *job = PrintJob::Running())
        return &job->Format();
    return Desktop::Current() ? &next : nullptr;
}
