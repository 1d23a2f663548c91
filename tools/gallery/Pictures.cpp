#include "tools/gallery/Pictures.h"
#include "desktop/SimulatedDesktop.h"
#include "tools/gallery/Gallery.h"
#include <filesystem>
#include <iostream>

namespace {

void WritePages(PageFiles const &files, std::filesystem::path const &directory, char const *theme,
                int scale) {
    SimulatedDesktop desktop(DesktopOptions().Theme(theme).Scale(scale));
    Gallery gallery(desktop, files, scale);
    for (std::size_t i = 0; i < files.Pages().size(); ++i) {
        gallery.ShowPage(i);
        std::string const name = files.Pages()[i].name + '-' + theme + '-' + std::to_string(scale) + "x.png";
        std::string const path = (directory / name).string();
        desktop.Snapshot(gallery.Window(), path);
        std::cout << path << '\n';
    }
}

} // namespace

void Pictures::WriteAll(PageFiles const &files, std::string const &directory) {
    std::filesystem::create_directories(directory);
    for (char const *theme : {"light", "dark"}) {
        for (int scale : {1, 2})
            WritePages(files, directory, theme, scale);
    }
}
