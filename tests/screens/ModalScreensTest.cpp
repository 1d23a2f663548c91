// How modal dialogs look over what the program shows, in both themes and at two scales.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/GoldenPicture.h"
#include "tools/gallery/Gallery.h"
#include <gtest/gtest.h>
#include <tuple>

namespace {

struct Look {
    char const *theme;
    int scale;
    std::string Name() const { return theme + ('-' + std::to_string(scale)) + 'x'; }
};
Look const kLooks[] = {{"light", 1}, {"light", 2}, {"dark", 1}, {"dark", 2}};

// The dialog of the gallery after these steps, and the keys that end it and what is open over it.
struct OpenDialog {
    char const *name;
    char const *script;
    char const *end;
};
OpenDialog const kDialogs[] = {
    {"asked", "", "key Escape\n"},
    {"refused", "key Return\nwait 0.5\n", "key Escape\n"},
    {"inner", "click 60 146\nwait 0.5\n", "key Escape\nwait 0.5\nkey Escape\n"},
};

void PrintTo(OpenDialog const &dialog, std::ostream *out) { *out << dialog.name; }
void PrintTo(Look const &look, std::ostream *out) { *out << look.Name(); }

typedef std::tuple<OpenDialog, Look> DialogLook;

class GoldenDialog : public testing::TestWithParam<DialogLook> {};

char const kAskButton[] = "click 264 133\nwait 0.5\n"; // on the page, in the gallery's window

} // namespace

TEST_P(GoldenDialog, LooksAsItDid) {
    auto const &[dialog, look] = GetParam();
    TemporaryDirectory directory;
    std::string const picture = directory.Path() + "/picture.png";
    SimulatedDesktop desktop(DesktopOptions().Theme(look.theme).Scale(look.scale));
    Gallery gallery(desktop, GalleryFiles(), look.scale);
    gallery.ShowPage(GalleryFiles().Find("modal-dialog"));
    desktop.Play(std::string(kAskButton) + dialog.script + "snapshot " + picture + '\n' + dialog.end);
    std::string error;
    std::unique_ptr<Surface> const actual = Surface::ReadPng(picture, error);
    ASSERT_TRUE(actual) << error;
    EXPECT_TRUE(GoldenPicture::Matches(*actual, std::string("modal-") + dialog.name + '-' + look.Name()));
}

INSTANTIATE_TEST_SUITE_P(Dialogs, GoldenDialog,
                         testing::Combine(testing::ValuesIn(kDialogs), testing::ValuesIn(kLooks)),
                         [](testing::TestParamInfo<DialogLook> const &info) {
                             return AsTestName(std::string(std::get<0>(info.param).name) + '-' +
                                               std::get<1>(info.param).Name());
                         });
