// How open menus look, in both themes and at two scales.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/GoldenPicture.h"
#include "tools/gallery/GalleryItems.h"
#include <gtest/gtest.h>
#include <tuple>

namespace {

struct Look {
    char const *theme;
    int scale;
    std::string Name() const { return theme + ('-' + std::to_string(scale)) + 'x'; }
};
Look const kLooks[] = {{"light", 1}, {"light", 2}, {"dark", 1}, {"dark", 2}};

// menu-states.xml with a menu open, after these steps.
struct OpenMenu {
    char const *name;
    char const *script;
};
OpenMenu const kMenus[] = {
    {"current", "click 90 80\nwait 0.5\n"},
    {"submenu", "click 90 80\nwait 0.5\nmove 90 131\nwait 0.5\nmove 210 150\nwait 0.1\n"},
    {"scrolled", "click 60 120\nwait 0.5\nwheel 60 120 0 -4\nmove 60 140\n"},
    {"durations", "click 240 108\nwait 0.5\n"},
    {"dotted", "click 240 108\nwait 0.5\nkey End\nkey Up\nkey Right\nkey Down\n"},
    {"colors", "click 290 70\nwait 0.5\nmove 290 110\n"},
};

void PrintTo(OpenMenu const &menu, std::ostream *out) { *out << menu.name; }
void PrintTo(Look const &look, std::ostream *out) { *out << look.Name(); }

typedef std::tuple<OpenMenu, Look> MenuLook;

class GoldenMenu : public testing::TestWithParam<MenuLook> {};

} // namespace

// The menus are drawn over the window, where the picture has them whole; their pixels are those of their own
// windows.
TEST_P(GoldenMenu, LooksAsItDid) {
    auto const &[menu, look] = GetParam();
    TemporaryDirectory directory;
    std::string const picture = directory.Path() + "/picture.png";
    SimulatedDesktop desktop(DesktopOptions().Theme(look.theme).Scale(look.scale));
    static_cast<SimulatedWindowSystem &>(desktop.Windows()).SetPlacesPopups(false);
    GalleryItems::Add();
    GalleryFiles().AddResources();
    ShowGlog(LoadGlog(TreeDirectory() + "/tests/screens/menu-states.xml"), kShowGlog);
    desktop.Play(std::string(menu.script) + "snapshot " + picture + "\nkey Escape\n");
    std::string error;
    std::unique_ptr<Surface> const actual = Surface::ReadPng(picture, error);
    ASSERT_TRUE(actual) << error;
    EXPECT_TRUE(GoldenPicture::Matches(*actual, std::string("menu-") + menu.name + '-' + look.Name()));
}

INSTANTIATE_TEST_SUITE_P(Menus, GoldenMenu,
                         testing::Combine(testing::ValuesIn(kMenus), testing::ValuesIn(kLooks)),
                         [](testing::TestParamInfo<MenuLook> const &info) {
                             return AsTestName(std::string(std::get<0>(info.param).name) + '-' +
                                               std::get<1>(info.param).Name());
                         });

// A menu of its own windows looks the same as one that is drawn over its window, where there is room for
// both.
TEST(MenuWindows, ShowWhatIsDrawnOverAWindow) {
    std::vector<std::vector<std::uint32_t>> pictures;
    for (bool places : {true, false}) {
        TemporaryDirectory directory;
        std::string const picture = directory.Path() + "/picture.png";
        SimulatedDesktop desktop;
        static_cast<SimulatedWindowSystem &>(desktop.Windows()).SetPlacesPopups(places);
        GalleryItems::Add();
        GalleryFiles().AddResources();
        ShowGlog(LoadGlog(TreeDirectory() + "/tests/screens/menu-states.xml"), kShowGlog);
        desktop.Play("click 90 80\nwait 0.5\nmove 90 131\nwait 0.5\nsnapshot " + picture + "\nmenu 0\n");
        std::string error;
        std::unique_ptr<Surface> const actual = Surface::ReadPng(picture, error);
        ASSERT_TRUE(actual) << error;
        pictures.emplace_back(actual->Pixels(), actual->Row(actual->Height()));
    }
    EXPECT_EQ(pictures[0], pictures[1]);
}
