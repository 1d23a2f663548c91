// The gallery from outside.
#include "desktop/drawing/Surface.h"
#include "tests/tools/RunProgram.h"
#include <gtest/gtest.h>
#include <memory>

namespace {

bool Holds(std::string const &text, std::string const &part) { return text.find(part) != std::string::npos; }

class GalleryProgram : public testing::Test {
protected:
    ProgramResult Run(std::string const &arguments) { return RunProgram(directory, "gallery", arguments); }
    int Width(std::string const &picture) {
        std::string error;
        std::unique_ptr<Surface> const surface = Surface::ReadPng(directory.Path() + "/" + picture, error);
        EXPECT_TRUE(surface) << error;
        return surface ? surface->Width() : 0;
    }
    TemporaryDirectory directory;
};

TEST_F(GalleryProgram, WritesEveryPageInBothThemesAndTwoScales) {
    ProgramResult const result = Run("--png-dir pictures");
    EXPECT_EQ(result.status, 0) << result.errors;
    for (char const *page : {"push-buttons", "labels", "layout", "help-tags", "check-boxes", "box-select",
                             "icon-buttons", "small-buttons", "scroll-bars", "scroll-pane", "grid", "lists",
                             "select-panes", "text-fields", "search"}) {
        for (char const *theme : {"light", "dark"}) {
            std::string const start = std::string("pictures/") + page + '-' + theme;
            EXPECT_TRUE(Holds(result.output, start + "-1x.png\n"));
            EXPECT_EQ(Width(start + "-2x.png"), 2 * Width(start + "-1x.png"));
        }
    }
}

TEST_F(GalleryProgram, WritesPicturesWithoutADisplay) {
    ProgramResult const result = Run("");
    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(Holds(result.errors, "display") && Holds(result.errors, "out/gallery")) << result.errors;
    EXPECT_GT(Width("out/gallery/push-buttons-light-1x.png"), 0);
}

TEST_F(GalleryProgram, ReportsWhatWasPressed) {
    directory.Write("script", "click 320 131\nwait 1\ndump a.json\n");
    ProgramResult const result = Run("--script script --messages -");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(
        Holds(result.output, "\"pane\":\"OvalButtonPane\",\"id\":1,\"message\":\"GlogButtonPressed\"}"))
        << result.output;
    EXPECT_TRUE(
        Holds(TextFile::Read(directory.Path() + "/a.json"), "OK, item 1, was pressed and answered 1"));
}

TEST_F(GalleryProgram, TogglesFrameButtonsThatArePressed) {
    directory.Write("script", "click 300 253\nwait 1\ndump on.json\nclick 300 253\nwait 1\ndump off.json\n");
    EXPECT_EQ(Run("--script script").status, 0);
    std::string const on = TextFile::Read(directory.Path() + "/on.json");
    std::string const off = TextFile::Read(directory.Path() + "/off.json");
    auto const states = [](std::string const &dump) {
        int count = 0;
        for (std::size_t at = dump.find("\"state\":1"); at != std::string::npos;
             at = dump.find("\"state\":1", at + 1))
            ++count;
        return count;
    };
    EXPECT_EQ(states(on), states(off) + 1);
}

TEST_F(GalleryProgram, TurnsPagesAndChangesThemeAndScale) {
    directory.Write("script",
                    "click 60 88\nwait 1\nsnapshot labels.png\nclick 135 574\nwait 1\nsnapshot dark.png\n"
                    "click 150 628\nwait 1\nsnapshot large.png\ndump a.json\n");
    ProgramResult const result = Run("--script script");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(Holds(TextFile::Read(directory.Path() + "/a.json"), "Font 0, dialog text"));
    EXPECT_EQ(Width("large.png"), 2 * Width("labels.png"));
    std::string error;
    std::uint32_t const light = Surface::ReadPng(directory.Path() + "/labels.png", error)->Row(0)[0];
    std::uint32_t const dark = Surface::ReadPng(directory.Path() + "/dark.png", error)->Row(0)[0];
    EXPECT_NE(light, dark);
}

TEST_F(GalleryProgram, BecomesLargerByItsCorner) {
    directory.Write("script", "press 890 650\nmove 990 680\nrelease\nwait 1\nsnapshot a.png\n");
    EXPECT_EQ(Run("--scale 1 --script script").status, 0);
    EXPECT_EQ(Width("a.png"), 896 + 100);
}

TEST_F(GalleryProgram, BeginsWithThePageThatIsAskedFor) {
    directory.Write("script", "dump a.json\n");
    EXPECT_EQ(Run("--page layout --script script").status, 0);
    EXPECT_TRUE(Holds(TextFile::Read(directory.Path() + "/a.json"), "Groups within groups"));
}

// Numbers that panes show while they are used.
TEST_F(GalleryProgram, WritesNumbersAsTheLanguageDoes) {
    directory.Write("script", "wait 1\ndump zoom.json\n");
    EXPECT_EQ(Run("--page zoom-and-progress --language de --script script").errors, "");
    EXPECT_TRUE(Holds(TextFile::Read(directory.Path() + "/zoom.json"), "0,90 s bis 1,50 s"));
    directory.Write("script", "press @1+137+150\nmove @1+177+210\nrelease\nwait 1\ndump place.json\n");
    EXPECT_EQ(Run("--page panner --language de --script script").errors, "");
    EXPECT_TRUE(
        Holds(TextFile::Read(directory.Path() + "/place.json"), "\"x 0,30   y \u22121,00   z \u22120,10\""))
        << TextFile::Read(directory.Path() + "/place.json");
}

TEST_F(GalleryProgram, EndsWithOneForAnUnknownPage) {
    directory.Write("script", "");
    ProgramResult const result = Run("--page lay --script script");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors,
              "gallery: there is no page \"lay\"; there are push-buttons, labels, layout, help-tags, "
              "check-boxes, box-select, icon-buttons, small-buttons, scroll-bars, "
              "scroll-pane, grid, lists, select-panes, text-fields, static-text, search, pop-up-menus, "
              "durations, tabs, "
              "modal-dialog, panner, envelope, pictures, zoom-and-progress\n");
}

TEST_F(GalleryProgram, EndsWithOneWhereThereAreNoPages) {
    ProgramResult const result = Run("--pages nowhere --png-dir pictures");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "gallery: nowhere: there are no pages of a gallery here\n");
}

TEST_F(GalleryProgram, EndsWithOneForAPageThatIsWrong) {
    directory.Write("g/gallery.xml",
                    "<Glog width=\"9\" height=\"9\"><Items><Item type=\"Group\" id=\"9000\"/>"
                    "<Item type=\"Group\" id=\"9001\"/></Items></Glog>");
    directory.Write("g/pages/1-bad.xml", "<Glog");
    ProgramResult const result = Run("--pages g --png-dir pictures");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.errors, "1-bad.xml:1:")) << result.errors;
}

TEST_F(GalleryProgram, EndsWithTwoForABadCommandLine) {
    for (char const *arguments :
         {"page", "--theme blue", "--scale 0", "--script s --png-dir p", "--nonsense"})
        EXPECT_EQ(Run(arguments).status, 2) << arguments;
}

} // namespace
