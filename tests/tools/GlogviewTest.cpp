// glogview from outside: exit status, messages and files.
#include "desktop/drawing/Surface.h"
#include "tests/printing/PdfReading.h"
#include "tests/tools/RunProgram.h"
#include <filesystem>
#include <gtest/gtest.h>
#include <memory>

namespace {

std::string const kDialog =
    "<Glog title=\"Metronome\" width=\"160\" height=\"100\"><Items><Item type=\"OvalButton\" "
    "id=\"3\"><BoundsRect top=\"20\" left=\"20\" bottom=\"39\" right=\"120\"/>"
    "<TextNum>2</TextNum></Item></Items></Glog>";

// A list of two columns.
std::string DialogWithRows(int count) {
    std::string rows;
    for (int i = 0; i < count; ++i) {
        std::string const number = std::to_string(i);
        rows += "<Row><Cell>Take " + number + "</Cell><Cell>length " + number + "</Cell></Row>";
    }
    return "<Glog width=\"300\" height=\"200\"><Items><Item type=\"List\" id=\"1\"><BoundsRect "
           "top=\"10\" left=\"10\" bottom=\"110\" right=\"250\"/><LineHeight>16</LineHeight>"
           "<Columns><Column><Width>120</Width></Column><Column><Width>100</Width></Column></Columns><Rows>" +
           rows + "</Rows></Item></Items></Glog>";
}

bool Holds(std::string const &text, std::string const &part) { return text.find(part) != std::string::npos; }

class Glogview : public testing::Test {
protected:
    Glogview() { directory.Write("good.xml", kDialog); }
    ProgramResult Run(std::string const &arguments) { return RunProgram(directory, "glogview", arguments); }
    std::unique_ptr<Surface> Picture(std::string const &name) {
        std::string error;
        std::unique_ptr<Surface> picture = Surface::ReadPng(directory.Path() + "/" + name, error);
        EXPECT_TRUE(picture) << error;
        return picture;
    }
    std::uint32_t Corner(std::string const &name) {
        std::unique_ptr<Surface> const picture = Picture(name);
        return picture ? picture->Row(0)[0] : 0;
    }

    TemporaryDirectory directory;
};

TEST_F(Glogview, WritesAPicture) {
    ProgramResult const result = Run("good.xml --png a.png");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(result.output, "");
    std::unique_ptr<Surface> const picture = Picture("a.png");
    ASSERT_TRUE(picture);
    EXPECT_EQ(picture->Width(), 160);
    EXPECT_EQ(picture->Height(), 100);
}

TEST_F(Glogview, WritesThePictureAtTheScale) {
    EXPECT_EQ(Run("good.xml --png a.png --scale 1.5").status, 0);
    std::unique_ptr<Surface> const picture = Picture("a.png");
    ASSERT_TRUE(picture);
    EXPECT_EQ(picture->Width(), 240);
    EXPECT_EQ(picture->Height(), 150);
}

TEST_F(Glogview, WritesThePictureInTheTheme) {
    EXPECT_EQ(Run("good.xml --png a.png --theme light").status, 0);
    EXPECT_EQ(Run("good.xml --png b.png --theme dark").status, 0);
    EXPECT_EQ(Run("good.xml --png c.png").status, 0);
    EXPECT_NE(Corner("a.png"), Corner("b.png"));
    EXPECT_EQ(Corner("a.png"), Corner("c.png"));
}

TEST_F(Glogview, WritesThePictureAfterTheScript) {
    directory.Write("script", "resize 200 120\n");
    EXPECT_EQ(Run("good.xml --script script --png a.png").status, 0);
    std::unique_ptr<Surface> const picture = Picture("a.png");
    ASSERT_TRUE(picture);
    EXPECT_EQ(picture->Width(), 200);
}

TEST_F(Glogview, TellsMessagesOfTheScriptOnStandardOutput) {
    directory.Write("script", "click 40 30\n");
    ProgramResult const result = Run("good.xml --script script --messages -");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(
        Holds(result.output, "\"pane\":\"OvalButtonPane\",\"id\":3,\"message\":\"GlogButtonPressed\"}\n"))
        << result.output;
    EXPECT_TRUE(Holds(result.output, "\"message\":\"HandleClick\",\"result\":1}\n")) << result.output;
}

TEST_F(Glogview, TellsTheCommandsOfIconButtons) {
    directory.Write("icons.xml", "<Glog width=\"99\" height=\"50\"><Items><Item type=\"IconButton\" id=\"4\">"
                                 "<BoundsRect top=\"10\" left=\"10\" bottom=\"26\" right=\"30\"/>"
                                 "<FamilyID>kTransportIcons</FamilyID><NumStates>1</NumStates>"
                                 "<NumDownStates>1</NumDownStates><CmdClassID>15</CmdClassID>"
                                 "<CmdID>11</CmdID><OptCmdClassID>16</OptCmdClassID><OptCmdID>12</OptCmdID>"
                                 "</Item></Items></Glog>");
    directory.Write("script", "click 20 18\nclick 20 18 option\n");
    ProgramResult const result = Run("icons.xml --script script --messages -");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(Holds(result.output, "\"message\":\"ExecuteCommand\",\"class\":15,\"command\":11}\n"))
        << result.output;
    EXPECT_TRUE(Holds(result.output, "\"message\":\"ExecuteCommand\",\"class\":16,\"command\":12}\n"))
        << result.output;
}

TEST_F(Glogview, WritesMessagesToAFile) {
    directory.Write("script", "click 40 30\n");
    EXPECT_EQ(Run("good.xml --script script --messages m.json").status, 0);
    EXPECT_TRUE(Holds(TextFile::Read(directory.Path() + "/m.json"), "GlogButtonPressed"));
}

TEST_F(Glogview, TracesDrawing) {
    ProgramResult const result = Run("good.xml --png a.png --trace -");
    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(Holds(result.output, "{\"op\":\"Draw1Icon\",\"family\":1841,\"icon\":0,\"h\":20,\"v\":20}\n"))
        << result.output;
}

TEST_F(Glogview, DumpsTheTreeAfterTheScript) {
    directory.Write("script", "resize 200 120\n");
    ProgramResult const result = Run("good.xml --script script --dump -");
    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(Holds(result.output, "{\"glog\":\"Metronome\",\"width\":200,\"height\":120"))
        << result.output;
    EXPECT_TRUE(Holds(result.output, "\"text\":\"Cancel\"")) << result.output;
}

TEST_F(Glogview, SpeaksTheLanguage) {
    EXPECT_TRUE(Holds(Run("good.xml --png a.png --dump - --language de").output, "\"text\":\"Abbrechen\""));
}

TEST_F(Glogview, TakesBinaryRecords) {
    std::string const records(
        "GLOGREC1\x40\x00\x30\x00\x01\x00\x0C\x00\x12\x00\x08\x00\x08\x00\x30\x00\x01\x00\x00\x00", 28);
    directory.Write("old.glog", records);
    ProgramResult const result = Run("old.glog --png a.png --dump -");
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_TRUE(Holds(result.output, "\"text\":\"OK\"")) << result.output;
}

TEST_F(Glogview, EndsWithOneForABadDialog) {
    directory.Write("bad.xml",
                    "<Glog width=\"9\" height=\"9\"><Items><Item type=\"OvalButon\"/></Items></Glog>");
    ProgramResult const result = Run("bad.xml --png a.png");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors,
              "glogview: bad.xml:1:35: item (OvalButon): there is no item type \"OvalButon\"; did you mean "
              "OvalButton?\n");
    EXPECT_FALSE(std::filesystem::exists(directory.Path() + "/a.png"));
}

TEST_F(Glogview, RefusesALanguageThatHasNoTexts) {
    ProgramResult const result = Run("good.xml --png a.png --language xx");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "glogview: there are no texts in the language xx\n");
}

TEST_F(Glogview, EndsWithOneForAMissingDialog) {
    ProgramResult const result = Run("none.xml --png a.png");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "glogview: none.xml: the file cannot be opened: No such file or directory\n");
}

TEST_F(Glogview, EndsWithOneForABadScript) {
    directory.Write("script", "click 40 30\nclick here\n");
    ProgramResult const result = Run("good.xml --script script");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.errors, "glogview: script:2: ")) << result.errors;
    EXPECT_TRUE(Holds(Run("good.xml --script none").errors,
                      "none: the file cannot be read: No such file or directory"));
}

TEST_F(Glogview, EndsWithOneForAScriptThatCannotGoOn) {
    directory.Write("script", "snapshot no/such/folder.png\n");
    ProgramResult const result = Run("good.xml --script script");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.errors, "script:1: ")) << result.errors;
}

TEST_F(Glogview, PrintsByAScript) {
    directory.Write("list.xml", DialogWithRows(70)); // 60 fit on a page
    directory.Write("script", "wait 1\nprint list.pdf\n");
    ProgramResult const result = Run("list.xml --script script");
    EXPECT_EQ(result.status, 0) << result.errors;
    std::string const file = directory.Path() + "/list.pdf";
    ASSERT_EQ(PdfReading::Pages(file), 2);
    std::string const first = PdfReading::Text(file, 1), second = PdfReading::Text(file, 2);
    EXPECT_TRUE(Holds(first, "Page 1\n")) << first;
    EXPECT_TRUE(Holds(first, "Take 0 ") && Holds(first, "length 0\n")) << first;
    EXPECT_TRUE(Holds(first, "Take 59 ") && Holds(first, "length 59\n")) << first;
    EXPECT_FALSE(Holds(first, "Take 60")) << first;
    EXPECT_TRUE(Holds(second, "Page 2\n")) << second;
    EXPECT_FALSE(Holds(second, "Take 59")) << second;
    EXPECT_TRUE(Holds(second, "Take 60 ") && Holds(second, "length 69\n")) << second;
}

TEST_F(Glogview, EndsWithOneWhereNothingPrints) {
    directory.Write("script", "print none.pdf\n");
    ProgramResult const result = Run("good.xml --script script");
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors, "glogview: script:1: nothing in the window prints\n");
    EXPECT_FALSE(std::filesystem::exists(directory.Path() + "/none.pdf"));
}

TEST_F(Glogview, EndsWithOneForAPrintThatCannotBeWritten) {
    directory.Write("list.xml", DialogWithRows(3));
    directory.Write("script", "print no/such/list.pdf\n");
    ProgramResult const result = Run("list.xml --script script");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.errors, "script:1: ")) << result.errors;
}

TEST_F(Glogview, EndsWithOneWhenAFileCannotBeWritten) {
    EXPECT_EQ(Run("good.xml --png no/such/a.png").status, 1);
    EXPECT_EQ(Run("good.xml --png a.png --dump no/such/a.json").status, 1);
    EXPECT_EQ(Run("good.xml --png a.png --messages no/such/a.json").status, 1);
    EXPECT_EQ(Run("good.xml --png a.png --trace no/such/a.json").status, 1);
}

TEST_F(Glogview, EndsWithOneWithoutADisplay) {
    ProgramResult const result = Run("good.xml");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.errors, "glogview: ") && Holds(result.errors, "display")) << result.errors;
}

TEST_F(Glogview, EndsWithTwoForABadCommandLine) {
    for (char const *arguments : {"", "good.xml more.xml", "good.xml --theme blue", "good.xml --scale 9",
                                  "good.xml --scale big", "good.xml --pgn a", "good.xml --png",
                                  "good.xml --watch --png a.png", "good.xml --language english"}) {
        ProgramResult const result = Run(arguments);
        EXPECT_EQ(result.status, 2) << arguments;
        EXPECT_NE(result.errors, "") << arguments;
    }
}

TEST_F(Glogview, Helps) {
    ProgramResult const result = Run("--help");
    EXPECT_EQ(result.status, 0);
    EXPECT_TRUE(Holds(result.output, "--script")) << result.output;
}

} // namespace
