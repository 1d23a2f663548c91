// Shows the panes, page by page, in a window.
#include "desktop/Desktop.h"
#include "desktop/SimulatedDesktop.h"
#include "tools/LineOutput.h"
#include "tools/TextFile.h"
#include "tools/gallery/CommandLine.h"
#include "tools/gallery/Gallery.h"
#include "tools/gallery/Pictures.h"
#include <iostream>
#include <memory>
#include <stdexcept>

namespace {

int const kFailed = 1;
char const kPictureDirectory[] = "out/gallery";

int Show(Desktop &desktop, CommandLine const &line, PageFiles const &files) {
    std::unique_ptr<LineOutput> messages;
    if (!line.messages.empty()) {
        messages = std::make_unique<LineOutput>(line.messages);
        desktop.WatchMessages([&](std::string const &text) { messages->WriteLine(text); });
    }
    Gallery gallery(desktop, files, line.desktop.scale);
    if (!line.page.empty())
        gallery.ShowPage(files.Find(line.page));
    return desktop.Run();
}

int RunScript(CommandLine const &line, PageFiles const &files) {
    SimulatedDesktop desktop(line.desktop);
    desktop.Script(TextFile::Read(line.script), line.script);
    return Show(desktop, line, files);
}

// Null, with the reason on standard error, when there is no display.
std::unique_ptr<Desktop> OpenDesktop(CommandLine const &line) {
    try {
        return std::make_unique<Desktop>(line.desktop);
    } catch (std::runtime_error const &error) {
        std::cerr << "gallery: " << error.what() << "; writing pictures of all pages to " << kPictureDirectory
                  << '\n';
        return nullptr;
    }
}

int Run(CommandLine const &line) {
    PageFiles const files(line.pages);
    if (!line.script.empty())
        return RunScript(line, files);
    if (!line.pictures.empty())
        return Pictures::WriteAll(files, line.desktop.language, line.pictures), 0;
    if (std::unique_ptr<Desktop> const desktop = OpenDesktop(line))
        return Show(*desktop, line, files);
    return Pictures::WriteAll(files, line.desktop.language, kPictureDirectory), 0;
}

} // namespace

int main(int argc, char **argv) {
    CommandLine line;
    int status = 0;
    if (!line.Parse(argc, argv, status))
        return status;
    try {
        return Run(line);
    } catch (std::exception const &error) {
        std::cerr << "gallery: " << error.what() << '\n';
        return kFailed;
    }
}
