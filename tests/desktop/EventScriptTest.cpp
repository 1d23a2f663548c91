#include "desktop/windows/EventScript.h"
#include "desktop/SimulatedDesktop.h"
#include "host/glogRec.h"
#include <gtest/gtest.h>

namespace {

ScriptStep One(std::string const &line) {
    std::vector<ScriptStep> const steps = EventScript::Parse(line, "test");
    EXPECT_EQ(steps.size(), 1u) << line;
    return steps.empty() ? ScriptStep() : steps[0];
}

std::string ErrorOf(std::string const &script) {
    try {
        EventScript::Parse(script, "demo");
    } catch (ScriptError const &error) {
        return error.what();
    }
    return "no error";
}

TEST(EventScript, PlacesAreHorizontalThenVerticalAndModifiersFollow) {
    ScriptStep const step = One("press 120 -40 shift command option control");
    EXPECT_EQ(step.kind, ScriptStep::kPress);
    EXPECT_EQ(step.h, 120);
    EXPECT_EQ(step.v, -40);
    EXPECT_EQ(step.modifiers, 0x0100 | 0x0200 | 0x0800 | 0x1000);
}

TEST(EventScript, EveryStepOfTheLanguageIsRead) {
    struct Case {
        char const *line;
        ScriptStep::Kind kind;
    };
    for (Case const &c :
         {Case{"move 1 2", ScriptStep::kMove}, Case{"release", ScriptStep::kRelease},
          Case{"click 1 2", ScriptStep::kClick}, Case{"doubleclick 1 2", ScriptStep::kDoubleClick},
          Case{"rightclick 1 2", ScriptStep::kRightClick}, Case{"wheel 1 2 0 -1", ScriptStep::kWheel},
          Case{"key Return", ScriptStep::kKey}, Case{"type \"a\"", ScriptStep::kType},
          Case{"compose \"a\" 1", ScriptStep::kCompose}, Case{"wait 0.5", ScriptStep::kWait},
          Case{"resize 640 480", ScriptStep::kResize}, Case{"activate off", ScriptStep::kActivate},
          Case{"menu 3", ScriptStep::kMenu}, Case{"print a.pdf", ScriptStep::kPrint},
          Case{"snapshot a.png", ScriptStep::kSnapshot}, Case{"dump a.json", ScriptStep::kDump}})
        EXPECT_EQ(One(c.line).kind, c.kind) << c.line;
}

TEST(EventScript, CommentsEmptyLinesAndCarriageReturnsAreSkipped) {
    EXPECT_TRUE(EventScript::Parse("# nothing\n\n   \t\n", "test").empty());
    EXPECT_EQ(EventScript::Parse("click 1 2 # here\r\nrelease\r\n", "test").size(), 2u);
}

TEST(EventScript, TextsMayHoldSpacesEscapesAndAnyCharacter) {
    EXPECT_EQ(One("type \"héllo # w\\\"x\\\\\"").text, "héllo # w\"x\\");
}

TEST(EventScript, MenusNameAnItemOrTheWayToAnItemOfASubmenu) {
    EXPECT_EQ(One("menu 0").path, std::vector<int>{0});
    EXPECT_EQ(One("menu 3").path, std::vector<int>{3});
    EXPECT_EQ(One("menu 4/2").path, (std::vector<int>{4, 2}));
    EXPECT_EQ(One("menu 4/2/32767").path, (std::vector<int>{4, 2, 32767}));
}

TEST(EventScript, MenusNameNoItemZeroOfASubmenuAndNoneBeyondThoseThatThereCanBe) {
    for (char const *step : {"menu 4/0", "menu 0/4", "menu 4/", "menu /4", "menu -1", "menu 32768", "menu x",
                             "menu 1x", "menu 4//2", "menu +3", "menu"})
        EXPECT_THROW(One(step), ScriptError) << step;
}

TEST(EventScript, PlacesMayCountFromAnItem) {
    ScriptStep const corner = One("press @12+40+8 shift");
    EXPECT_EQ(corner.item, 12);
    EXPECT_EQ(corner.h, 40);
    EXPECT_EQ(corner.v, 8);
    EXPECT_FALSE(corner.inMiddle);
    EXPECT_EQ(corner.modifiers, Modifiers::kShift);
    ScriptStep const wheel = One("wheel @3 0 -1");
    EXPECT_EQ(wheel.item, 3);
    EXPECT_TRUE(wheel.inMiddle);
    EXPECT_EQ(wheel.wheelV, -1);
    for (char const *step :
         {"click @", "click @0", "click @32768", "click @x", "click @3+", "click @3+1", "click @3+1+",
          "click @3+1+2x", "click @3-1-2", "click @3+1+-2", "click @3+1+2+3"})
        EXPECT_THROW(One(step), ScriptError) << step;
}

TEST(EventScript, NumbersAreReadAsTheyAreWritten) {
    EXPECT_EQ(One("wait 0.5").seconds, 0.5);
    EXPECT_EQ(One("wait +1.5").seconds, 1.5);
    EXPECT_EQ(One("wait 5e-1").seconds, 0.5);
    EXPECT_EQ(One("press -3 +4").v, 4);
    for (char const *step : {"wait 0,5", "wait inf", "wait 1.5x", "wait +-1", "wait ++1"})
        EXPECT_THROW(One(step), ScriptError) << step;
}

TEST(EventScript, KeysHaveNamesOrAreTheCharacterThatTheyType) {
    EXPECT_EQ(EventScript::KeyByName("Return"), 13);
    EXPECT_EQ(EventScript::KeyByName("Enter"), 3);
    EXPECT_EQ(EventScript::KeyByName("Escape"), 27);
    EXPECT_EQ(EventScript::KeyByName("a"), 'a');
    EXPECT_EQ(EventScript::KeyByName("A"), 'a');
    EXPECT_EQ(EventScript::KeyByName("F12"), KeyCodes::kF1 + 11);
    EXPECT_EQ(EventScript::KeyByName("F13"), 0);
    EXPECT_EQ(EventScript::KeyByName("Fx"), 0);
    EXPECT_EQ(EventScript::KeyByName(""), 0);
}

TEST(EventScript, ErrorsNameTheLineAndWhatWasExpected) {
    EXPECT_EQ(ErrorOf("click 1 2\nclack 3 4"),
              "demo:2: there is no step \"clack\"; possible: press, move, release, click, doubleclick, "
              "rightclick, wheel, key, type, compose, wait, resize, activate, menu, print, snapshot, dump");
    EXPECT_EQ(ErrorOf("press 1"), "demo:1: expected a vertical place at the end of the line");
    EXPECT_EQ(ErrorOf("press 1 x"), "demo:1: expected a vertical place, found \"x\"");
    EXPECT_EQ(ErrorOf("press 1.5 2"), "demo:1: expected a horizontal place, a whole number");
    EXPECT_EQ(ErrorOf("press 1 99999999999"), "demo:1: expected a vertical place, found \"99999999999\"");
    EXPECT_EQ(ErrorOf("press nan 2"), "demo:1: expected a horizontal place, found \"nan\"");
    EXPECT_EQ(ErrorOf("click 1 2 hyper"),
              "demo:1: expected shift, command, option or control, found \"hyper\"");
    EXPECT_EQ(ErrorOf("key Hyper"),
              "demo:1: there is no key \"Hyper\"; possible: a character, Return, Enter, Escape, Tab, Space, "
              "Backspace, Delete, Left, Right, Up, Down, Home, End, PageUp, PageDown, Help, F1 to F12");
    EXPECT_EQ(ErrorOf("type héllo"), "demo:1: expected a text in double quotes");
    EXPECT_EQ(ErrorOf("type \"abc"), "demo:1: the text has no closing double quote");
    EXPECT_EQ(ErrorOf("wait -1"), "demo:1: expected a number of seconds, found \"-1\"");
    EXPECT_EQ(ErrorOf("wait 1 2"), "demo:1: there is more on the line than \"wait\" takes");
    EXPECT_EQ(ErrorOf("resize 0 10"), "demo:1: expected a width of 1 to 16000, found \"0\"");
    EXPECT_EQ(ErrorOf("activate maybe"), "demo:1: expected on or off, found \"maybe\"");
    EXPECT_EQ(ErrorOf("menu 4/"), "demo:1: expected an item number such as 3, or 4/2 for item 2 of the "
                                  "submenu of item 4, found \"4/\"");
    EXPECT_EQ(ErrorOf("menu -1"), "demo:1: expected an item number such as 3, or 4/2 for item 2 of the "
                                  "submenu of item 4, found \"-1\"");
}

TEST(EventScript, AWrongScriptAppendsNoneOfItsSteps) {
    SimulatedDesktop desktop;
    EXPECT_THROW(desktop.Script("wait 5\nnonsense"), ScriptError);
    glogRec *glog = desktop.NewGlog(GlogOptions());
    ShowGlog(glog, kShowGlog);
    desktop.Run();
    EXPECT_EQ(desktop.Now(), 0);
}

} // namespace
