// How pages and buttons look, in both themes and at two scales.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/GoldenPicture.h"
#include "tools/gallery/GalleryItems.h"
#include <gtest/gtest.h>
#include <memory>
#include <tuple>

namespace {

struct Look {
    std::string theme;
    int scale;
    std::string Name() const { return theme + '-' + std::to_string(scale) + 'x'; }
};
Look const kLooks[] = {{"light", 1}, {"light", 2}, {"dark", 1}, {"dark", 2}};

void PrintTo(Look const &look, std::ostream *out) { *out << look.Name(); }

DesktopOptions OptionsFor(Look const &look) { return DesktopOptions().Theme(look.theme).Scale(look.scale); }

typedef std::tuple<PageFile, Look> PageLook;

class GoldenPage : public testing::TestWithParam<PageLook> {};

TEST_P(GoldenPage, LooksAsItDid) {
    auto const &[page, look] = GetParam();
    SimulatedDesktop desktop(OptionsFor(look));
    GalleryItems::Add();
    GalleryFiles().AddResources();
    glogRec *const glog = LoadGlog(page.path);
    ShowGlog(glog, kShowGlog);
    EXPECT_TRUE(GoldenPicture::Matches(*Glog::From(glog).Pixels(), page.name + '-' + look.Name()));
}

INSTANTIATE_TEST_SUITE_P(Gallery, GoldenPage,
                         testing::Combine(testing::ValuesIn(GalleryFiles().Pages()),
                                          testing::ValuesIn(kLooks)),
                         [](testing::TestParamInfo<PageLook> const &info) {
                             return AsTestName(std::get<0>(info.param).name + '-' +
                                               std::get<1>(info.param).Name());
                         });

// What a page at rest does not show, as a script has it: DIALOG-states.xml after these steps.
struct Press {
    char const *dialog;
    char const *name;
    char const *script;
    std::string Name() const { return std::string(dialog) + '-' + name; }
};
Press const kPresses[] = {
    {"push-button", "rest", ""},
    {"push-button", "oval-pressed", "press 40 24\n"},
    {"push-button", "stud-pressed", "press 40 56\n"},
    {"push-button", "frame-pressed", "press 20 88\n"},
    {"push-button", "oval-slid-off", "press 40 24\nmove 230 100\n"},
    {"push-button", "disabled-refused", "press 160 24\n"},
    {"choice", "rest", ""},
    {"choice", "check-on-pressed", "press 22 22\n"},
    {"choice", "check-off-pressed", "press 50 46\n"}, // on its label
    {"choice", "radio-on-pressed", "press 142 22\n"},
    {"choice", "radio-off-pressed", "press 142 46\n"},
    {"choice", "radio-chosen", "click 160 46\n"},
    {"choice", "option-click", "click 22 46 option\n"},
    {"choice", "command-click", "click 22 22 command\n"},
    {"box", "rest", ""},
    {"box", "others-chosen", "click 140 26\nclick 110 78\n"},
    {"box", "all-chosen", "click 30 52\nclick 180 52\nclick 200 78\nclick 270 78\n"},
    {"icon", "rest", ""},
    {"icon", "button-pressed", "press 28 48\n"},
    {"icon", "on-pressed", "press 68 48\n"},
    {"icon", "slid-off", "press 28 48\nmove 28 100\n"},
    {"icon", "next-state", "click 28 48\n"},
    {"icon", "badge-pressed", "press 22 72\n"},
    {"icon", "held-down", "press 28 96\n"},
    {"small-button", "rest", ""},
    {"small-button", "upper-pressed", "press 47 20\n"},
    {"small-button", "lower-pressed", "press 47 20\nmove 47 34\n"},
    {"small-button", "stepped-down", "click 47 34\n"},
    {"small-button", "open", "click 78 26\n"},
    {"small-button", "selector-pressed", "press 110 26\n"},
    {"small-button", "selector-on", "click 110 26\n"},
    {"scroll-bar", "rest", ""},
    {"scroll-bar", "arrow-held", "press 24 152\n"},
    {"scroll-bar", "thumb-dragged", "press 120 24\nmove 140 24\n"},
    {"scroll-bar", "behind", "activate off\n"},
    {"scroll-pane", "thumb-dragged", "press 60 180\nmove 110 180\n"},
    {"scroll-pane", "middle", "wheel 150 90 -92 -50\n"},
    {"scroll-pane", "clicked-where-scrolled", "wheel 150 90 -10 -6\nclick 102 41\n"},
    {"grid", "thumb-dragged", "press 380 34\nmove 380 100\n"},
    {"grid", "middle", "wheel 200 100 -60 -500\n"},
    {"grid", "deleted", "click 210 74\nwait 1\nclick 92 218\n"},
    {"grid", "moved", "click 210 74\nwait 1\nclick 192 218\n"},
    {"grid", "revealed", "click 210 74\nwait 1\nwheel 200 100 0 -500\nwait 1\nclick 244 218\n"},
    {"grid", "stuck-to-end", "wheel 200 100 -1000 0\nclick 206 246\nwait 1\nclick 52 246\n"},
    {"list", "rest", ""},
    {"list", "selected", "press 100 61\nmove 100 101\nrelease\nclick 400 61\nclick 400 101 command\n"},
    {"list", "behind", "press 100 61\nmove 100 101\nrelease\nclick 400 61\nactivate off\n"},
    {"list", "middle", "wheel 100 100 0 -1000\nwait 1\nclick 100 101\n"},
    {"list", "row-dragged", "press 30 61\nmove 60 108\n"},
    {"list", "row-moved", "press 30 61\nmove 60 108\nrelease\n"},
    {"list", "column-resized", "press 180 22\nmove 140 22\nrelease\n"},
    {"list", "cell-pressed", "press 576 61\n"},
    {"list", "one-selected", "click 18 214\nclick 100 61\nclick 100 101\n"},
    {"tab", "rest", ""},
    {"tab", "held", "press 100 24\n"},
    {"tab", "chosen", "click 150 24\n"},
    {"tab", "chosen-from-menu", "click 90 56\nmenu 2\n"},
    {"select", "rest", ""},
    {"select", "selected", "click 30 48\nclick 200 30\n"},
    {"select", "behind", "click 30 48\nclick 200 30\nactivate off\nclick 1 110\n"},
    {"search", "rest", ""},
    {"search", "typed", "click 60 22\ntype \"pi\"\nwait 0.6\n"},
    {"search", "narrow-typed",
     "click 300 22\ntype \"Wx\"\nwait 0.6\nclick 60 50\ntype \"Wide Whistle\"\nwait 0.6\n"},
    {"search", "cancel-pressed", "click 60 22\ntype \"pi\"\npress 252 22\n"},
    {"search", "canceled", "click 60 22\ntype \"pi\"\nclick 252 22\n"},
    {"search", "chosen", "click 60 22\ntype \"gr\"\nkey Down\nkey Down\n"},
    {"search", "selected", "click 60 22\ntype \"Warm\"\nkey a command\n"},
    {"search", "behind", "click 60 22\ntype \"cr\"\nkey Down\nactivate off\n"},
    {"text", "rest", ""},
    {"text", "word-selected", "doubleclick 30 24\n"},
    {"text", "all-selected", "click 60 24\nwait 1\nkey Tab\n"},
    {"text", "lines-selected", "press 180 26\nmove 290 40\n"},
    {"text", "mixed-selected", "press 210 82\nmove 188 82\n"},
    {"text", "behind", "press 180 26\nmove 290 40\nrelease\nactivate off\n"},
    {"text", "insertion-point", "click 200 26\nwait 0.6\n"},
    {"text", "typed", "click 60 88\ntype \"Take 12\"\nwait 0.6\n"},
    {"text", "too-long", "click 60 88\ntype \"A name that is longer than its field\"\nwait 0.6\n"},
    {"text", "too-long-at-the-right",
     "click 60 56\nkey a command\ntype \"A name that is longer than its field\"\nkey Home\nwait 0.6\n"},
    {"text", "too-long-and-left",
     "click 60 56\nkey a command\ntype \"A name that is longer than its field\"\nclick 60 124\nkey a "
     "command\ntype \"00:03:27:11.4052 and so on, and on\"\nkey Return\n"},
    {"text", "composed", "click 60 88\ntype \"ab\"\ncompose \"\u00E9\u00E8\u00EA\" 2\nwait 0.6\n"},
    {"text", "large-selected", "doubleclick 170 124\n"},
    {"text", "bare-edited", "doubleclick 30 160\n"},
    {"row", "rest", ""},
    {"row", "scrolled", "wheel 400 60 -3 -2\nwait 0.5\n"},
    {"graphic", "rest", ""},
    {"graphic", "ball-dragged", "press 139 72\nmove 190 80\n"},
    {"graphic", "zoom-pressed", "press 286 242\n"},
};

void PrintTo(Press const &press, std::ostream *out) { *out << press.Name(); }

typedef std::tuple<Press, Look> PressLook;

class GoldenPress : public testing::TestWithParam<PressLook> {};

TEST_P(GoldenPress, LooksAsItDid) {
    auto const &[press, look] = GetParam();
    TemporaryDirectory directory;
    std::string const picture = directory.Path() + "/picture.png";
    SimulatedDesktop desktop(OptionsFor(look));
    GalleryItems::Add();
    GalleryFiles().AddResources();
    ShowGlog(LoadGlog(TreeDirectory() + "/tests/screens/" + press.dialog + "-states.xml"), kShowGlog);
    desktop.Play(std::string(press.script) + "wait 0.5\nsnapshot " + picture);
    std::string error;
    std::unique_ptr<Surface> const actual = Surface::ReadPng(picture, error);
    ASSERT_TRUE(actual) << error;
    EXPECT_TRUE(GoldenPicture::Matches(*actual, press.Name() + '-' + look.Name()));
}

INSTANTIATE_TEST_SUITE_P(Buttons, GoldenPress,
                         testing::Combine(testing::ValuesIn(kPresses), testing::ValuesIn(kLooks)),
                         [](testing::TestParamInfo<PressLook> const &info) {
                             return AsTestName(std::get<0>(info.param).Name() + '-' +
                                               std::get<1>(info.param).Name());
                         });

TEST(GoldenPicture, FailsForAPictureThatIsNotThere) {
    EXPECT_FALSE(GoldenPicture::Compared(Surface(4, 4), "no-such-picture"));
}

TEST(GoldenPicture, FailsForOneOtherPixelAndForAnotherSize) {
    std::string error;
    std::unique_ptr<Surface> const kept =
        Surface::ReadPng(TreeDirectory() + "/tests/screens/golden/push-button-rest-light-1x.png", error);
    ASSERT_TRUE(kept) << error;
    EXPECT_FALSE(
        GoldenPicture::Compared(Surface(kept->Width(), kept->Height() + 1), "push-button-rest-light-1x"));
    kept->Row(3)[5] ^= 1;
    testing::AssertionResult const result = GoldenPicture::Compared(*kept, "push-button-rest-light-1x");
    EXPECT_FALSE(result);
    EXPECT_NE(std::string(result.message()).find("1 pixels of push-button-rest-light-1x differ"),
              std::string::npos)
        << result.message();
}

} // namespace
