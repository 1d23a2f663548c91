// The pictures on the pages of the panes are those of the examples beside them.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/screens/GoldenPicture.h"
#include "tools/TextFile.h"
#include <algorithm>
#include <filesystem>
#include <gtest/gtest.h>
#include <memory>
#include <tuple>

namespace {

namespace fs = std::filesystem;

double const kScale = 2; // sharp on the displays of today

fs::path Dialogs() { return fs::path(GLOG_TEST_SOURCE_DIR) / "../docs/panes/dialogs"; }

std::vector<std::string> Names() {
    std::vector<std::string> names;
    for (fs::directory_entry const &entry : fs::directory_iterator(Dialogs())) {
        if (entry.path().extension() == ".xml")
            names.push_back(entry.path().stem().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

// The steps before the picture, which the last one of them takes.
std::string ScriptFor(std::string const &name) {
    fs::path const path = Dialogs() / (name + ".script");
    return fs::exists(path) ? TextFile::Read(path.string()) : "wait 0.5\nsnapshot " + name + ".png\n";
}

class PanePicture : public testing::TestWithParam<std::tuple<std::string, std::string>> {};

} // namespace

TEST_P(PanePicture, IsThatOfItsExample) {
    auto const &[name, theme] = GetParam();
    std::string const directory = GLOG_TEST_OUTPUT_DIR "/panes-" + theme;
    fs::create_directories(directory);
    fs::current_path(directory); // the script writes there
    SimulatedDesktop desktop(DesktopOptions().Theme(theme).Scale(kScale));
    // Menus are drawn over the window, where the picture has them whole.
    static_cast<SimulatedWindowSystem &>(desktop.Windows()).SetPlacesPopups(false);
    ShowGlog(LoadGlog((Dialogs() / (name + ".xml")).string()), kShowGlog);
    desktop.Play(ScriptFor(name));
    std::string error;
    std::unique_ptr<Surface> const actual = Surface::ReadPng(name + ".png", error);
    ASSERT_TRUE(actual) << error;
    EXPECT_TRUE(GoldenPicture::MatchesFile(*actual, "docs/panes/images/" + name + '-' + theme + ".png"));
}

INSTANTIATE_TEST_SUITE_P(Panes, PanePicture,
                         testing::Combine(testing::ValuesIn(Names()), testing::Values("light", "dark")),
                         [](testing::TestParamInfo<PanePicture::ParamType> const &info) {
                             return std::get<0>(info.param) + '_' + std::get<1>(info.param);
                         });
