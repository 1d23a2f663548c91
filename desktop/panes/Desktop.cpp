#include "desktop/Desktop.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "desktop/panes/ApplicationHooks.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/printing/PrintJob.h"
#include "desktop/resources/Resources.h"
#include "desktop/windows/SdlWindowSystem.h"
#include "host/TarnImage.h"
#include <stdexcept>

namespace {

Desktop *theDesktop = nullptr;

double const kSmallestScale = 0.5, kLargestScale = 4.0;

DesktopOptions const &Checked(DesktopOptions const &options) {
    if (theDesktop)
        throw std::logic_error("a desktop is open already");
    if (options.scale != 0 && !(options.scale >= kSmallestScale && options.scale <= kLargestScale))
        throw std::invalid_argument("the scale " + std::to_string(options.scale) +
                                    " is not between 0.5 and 4");
    return options;
}

template <class Print>
int PrintOf(Glog &glog, std::string const &path, PrintOptions const &options, Print print) {
    std::vector<std::string> const title = {glog.Options().title};
    PrintJob job(path, Paper::Named(options.paper), options.header.empty() ? title : options.header);
    print(job);
    job.Finish();
    return job.Pages();
}

void OpenResources(DesktopOptions const &options) {
    Resources &resources = Resources::Instance();
    resources.Open(options.artwork.empty() ? Resources::FindDirectory() : options.artwork);
    resources.SetTheme(options.theme);
    resources.SetLanguage(options.language);
}

} // namespace

Desktop::Desktop(DesktopOptions const &options)
    : Desktop(Checked(options), std::unique_ptr<WindowSystem>(new SdlWindowSystem(options.scale))) {}

Desktop::Desktop(DesktopOptions const &options, std::unique_ptr<WindowSystem> windows) {
    Checked(options);
    OpenResources(options);
    rep.reset(new DesktopRep(*this, options, std::move(windows)));
    theDesktop = this;
    ApplicationHooks::InstallWhereNoneAre();
}

Desktop::~Desktop() {
    rep->CloseGlogs(); // while panes can still reach the desktop
    rep.reset();
    ApplicationHooks::Remove();
    MessageTrace::SetSink(nullptr);
    DrawingTrace::SetSink(nullptr);
    theDesktop = nullptr;
}

Desktop *Desktop::Current() { return theDesktop; }

glogRec *Desktop::NewGlog(GlogOptions const &options) {
    rep->glogs.push_back(nullptr); // reserved first, so that a glog is never lost
    try {
        rep->glogs.back() = new Glog(*this, options);
    } catch (...) {
        rep->glogs.pop_back();
        throw;
    }
    return rep->glogs.back();
}

void Desktop::FinishGlog(glogRec *glog) { Glog::From(glog).StartPanes(); }

int Desktop::Run() {
    rep->loop->Restart();
    rep->loop->Run(-1);
    return rep->loop->Status();
}

bool Desktop::ProcessEvents(double seconds) { return rep->loop->Run(seconds < 0 ? 0 : seconds); }

void Desktop::Quit(int status) { rep->loop->Quit(status); }

void Desktop::SetTheme(std::string const &name) {
    try {
        Resources::Instance().SetTheme(name);
    } catch (ResourceError const &error) {
        throw std::invalid_argument(error.what());
    }
    rep->options.theme = name;
    ThemeChangeNotificationProvider::Instance().NotifyThemeChanged();
    rep->DamageAll();
    if (MenuTracker *const menu = MenuTracker::Open())
        menu->Repaint();
}

std::string const &Desktop::Theme() const { return rep->options.theme; }

void Desktop::SetScale(double factor) {
    if (!(factor >= kSmallestScale && factor <= kLargestScale))
        throw std::invalid_argument("the scale " + std::to_string(factor) + " is not between 0.5 and 4");
    rep->windows->ForceScale(factor);
    for (Glog *glog : rep->Glogs())
        glog->SetScale(DeviceScale(factor));
}

void Desktop::SetHitHandler(HitHandler handler) { rep->hitHandler = std::move(handler); }

void Desktop::WatchMessages(LineSink sink) { MessageTrace::SetSink(std::move(sink)); }

void Desktop::WatchDrawing(LineSink sink) { DrawingTrace::SetSink(std::move(sink)); }

std::string Desktop::DumpTree(glogRec *glog) const { return TreeDump::Json(Glog::From(glog)); }

void Desktop::Snapshot(glogRec *record, std::string const &pngPath) {
    std::string error;
    if (!Glog::From(record).WritePng(pngPath, error))
        throw std::runtime_error("cannot write the picture " + error);
}

int Desktop::Print(glogRec *glog, std::string const &pdfPath, PrintOptions const &options) {
    return PrintOf(Glog::From(glog), pdfPath, options,
                   [glog](PrintJob &job) { Glog::From(glog).Print(job); });
}

int Desktop::Print(GlogPane *pane, std::string const &pdfPath, PrintOptions const &options) {
    return PrintOf(Glog::From(pane->GetGlog()), pdfPath, options, [pane](PrintJob &job) {
        HostCall const call;
        PaneAccess::Print(*pane, job);
    });
}

WindowSystem &Desktop::Windows() { return *rep->windows; }
