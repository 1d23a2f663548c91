// Shows a dialog in a window, or drives and photographs it without a display.
#include "desktop/Desktop.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/resources/Resources.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tools/LineOutput.h"
#include "tools/TextFile.h"
#include "tools/glogview/CommandLine.h"
#include "tools/glogview/WatchedDialog.h"
#include <iostream>
#include <memory>
#include <stdexcept>

namespace {

int const kFailed = 1;
double const kWatchInterval = 0.25; // seconds

// Writes what happens on the desktop to the files that were named.
class Observers {
public:
    Observers(Desktop &desktop, CommandLine const &line) {
        if (Open(messages, line.messages))
            desktop.WatchMessages([this](std::string const &text) { messages->WriteLine(text); });
        if (Open(drawing, line.trace))
            desktop.WatchDrawing([this](std::string const &text) { drawing->WriteLine(text); });
    }

private:
    static bool Open(std::unique_ptr<LineOutput> &output, std::string const &path) {
        if (!path.empty())
            output = std::make_unique<LineOutput>(path);
        return output != nullptr;
    }

    std::unique_ptr<LineOutput> messages, drawing;
};

// Without texts everything would be in English, and a slip in the code go unnoticed.
void RequireTexts(std::string const &language) {
    if (Resources::Instance().Find("strings/" + language + ".xml").empty())
        throw std::runtime_error("there are no texts in the language " + language);
}

void WriteDump(Desktop const &desktop, glogRec *glog, CommandLine const &line) {
    if (!line.dump.empty())
        LineOutput(line.dump).Write(desktop.DumpTree(glog));
}

void RunSimulated(CommandLine const &line) {
    SimulatedDesktop desktop(line.desktop);
    RequireTexts(line.desktop.language);
    Observers const observers(desktop, line);
    glogRec *const glog = LoadGlog(line.dialog);
    if (!line.script.empty())
        desktop.Script(TextFile::Read(line.script), line.script);
    ShowGlog(glog, kShowGlog);
    desktop.Run();
    if (!line.png.empty())
        desktop.Snapshot(glog, line.png);
    WriteDump(desktop, glog, line);
}

int RunInWindow(CommandLine const &line) {
    Desktop desktop(line.desktop);
    RequireTexts(line.desktop.language);
    Observers const observers(desktop, line);
    WatchedDialog dialog(line.dialog);
    WriteDump(desktop, dialog.Shown(), line);
    if (!line.watch)
        return desktop.Run();
    while (desktop.ProcessEvents(kWatchInterval))
        dialog.Follow();
    return 0;
}

} // namespace

int main(int argc, char **argv) {
    CommandLine line;
    int status = 0;
    if (!line.Parse(argc, argv, status))
        return status;
    try {
        if (!line.IsSimulated())
            return RunInWindow(line);
        RunSimulated(line);
        return 0;
    } catch (std::exception const &error) {
        std::cerr << "glogview: " << error.what() << '\n';
        return kFailed;
    }
}
