#include "tools/gallery/Pictures.h"
#include "desktop/SimulatedDesktop.h"
#include "tools/gallery/Gallery.h"
#include <filesystem>
#include <iostream>

namespace {

void WritePages(PageFiles const &files, std::filesystem::path const &directory,
                DesktopOptions const &options) {
    SimulatedDesktop desktop(options);
    Gallery gallery(desktop, files, options.scale);
    for (std::size_t i = 0; i < files.Pages().size(); ++i) {
        gallery.ShowPage(i);
        std::string const name = files.Pages()[i].name + '-' + options.theme + '-' +
                                 std::to_string(static_cast<int>(options.scale)) + "x.png";
        std::string const path = (directory / name).string();
        desktop.Snapshot(gallery.Window(), path);
        std::cout << path << '\n';
    }
}

} // namespace

void Pictures::WriteAll(PageFiles const &files, std::string const &language, std::string const &directory) {
    std::filesystem::create_directories(directory);
    for (char const *theme : {"light", "dark"}) {
        for (int scale : {1, 2})
            WritePages(files, directory, DesktopOptions().Language(language).Theme(theme).Scale(scale));
    }
}
