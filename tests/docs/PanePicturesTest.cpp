// The pictures on the pages of the panes are those of the examples beside them.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/resources/XmlFile.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/screens/GoldenPicture.h"
#include "tools/TextFile.h"
#include <algorithm>
#include <filesystem>
#include <gtest/gtest.h>
#include <memory>
#include <stdexcept>
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

// The rectangle that the page names, of a picture at 2x.
std::unique_ptr<Surface> PartOf(Surface const &whole, XmlNode const &page) {
    auto const pixels = [&](char const *name) {
        return static_cast<int>(kScale) * std::stoi(*page.Attribute(name));
    };
    int const left = pixels("left"), top = pixels("top"), width = pixels("width"), height = pixels("height");
    auto part = std::make_unique<Surface>(width, height);
    if (left + width > whole.Width() || top + height > whole.Height())
        throw std::out_of_range("the part lies outside of the picture");
    for (int y = 0; y < height; ++y)
        std::copy_n(whole.Row(top + y) + left, width, part->Row(y));
    return part;
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

// What no dialog can make is shown by a part of a golden picture.
TEST(PanePictures, OfOtherPanesArePartsOfGoldenPictures) {
    std::string const top = GLOG_TEST_SOURCE_DIR "/../";
    XmlFile const pages = XmlFile::Read(top + "docs/panes/pages.xml");
    int parts = 0;
    for (XmlNode const &page : pages.Root().children) {
        std::string const *const golden = page.Attribute("golden");
        if (!golden)
            continue;
        for (std::string const theme : {"light", "dark"}) {
            std::string error;
            std::unique_ptr<Surface> const whole =
                Surface::ReadPng(top + "tests/screens/golden/" + *golden + '-' + theme + "-2x.png", error);
            ASSERT_TRUE(whole) << error;
            EXPECT_TRUE(GoldenPicture::MatchesFile(*PartOf(*whole, page), "docs/panes/images/" +
                                                                              *page.Attribute("class") + '-' +
                                                                              theme + ".png"));
            ++parts;
        }
    }
    EXPECT_GT(parts, 0);
}

INSTANTIATE_TEST_SUITE_P(Panes, PanePicture,
                         testing::Combine(testing::ValuesIn(Names()), testing::Values("light", "dark")),
                         [](testing::TestParamInfo<PanePicture::ParamType> const &info) {
                             return std::get<0>(info.param) + '_' + std::get<1>(info.param);
                         });
