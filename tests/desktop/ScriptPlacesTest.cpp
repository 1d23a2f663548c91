// Places of scripts that count from an item.
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

class ScriptPlacesTest : public PaneTest {
protected:
    ScriptPlacesTest() {
        pane->SetID(7);
        container->Add(pane, -1);
    }

    std::string ErrorOf(std::string const &script) {
        try {
            desktop.Play(script);
        } catch (ScriptError const &error) {
            return error.what();
        }
        return "no error";
    }

    Calls &calls = FreshCalls();
    ProbeContainer *container = new ProbeContainer(glog, {20, 30, 120, 230});
    ProbePane *pane = new ProbePane(glog, {10, 10, 30, 60}, calls);
};

TEST_F(ScriptPlacesTest, AnItemByItselfIsItsMiddle) {
    Show();
    desktop.Play("click @7");
    EXPECT_EQ(Count(calls, "pane: click 35 20"), 1);
}

TEST_F(ScriptPlacesTest, OffsetsCountFromTheTopLeftCornerOfTheItem) {
    Show();
    desktop.Play("press @7+1+2\nrelease");
    EXPECT_EQ(Count(calls, "pane: click 11 12"), 1);
}

TEST_F(ScriptPlacesTest, AnItemIsLookedForWhenTheStepIsTaken) {
    Show();
    container->scroll = {5, 0};
    Rect moved = {40, 50, 60, 100};
    pane->SetBox(&moved);
    desktop.Play("click @7+1+2");
    EXPECT_EQ(Count(calls, "pane: click 51 42"), 1);
}

TEST_F(ScriptPlacesTest, AnItemThatIsNotThereIsAnError) {
    Show();
    EXPECT_EQ(ErrorOf("wait 1\nclick @8"), "script:2: there is no item 8 in the window");
    EXPECT_EQ(ErrorOf("click @1"), "script:1: there is no item 1 in the window") << "places are no numbers";
}

TEST_F(ScriptPlacesTest, AnItemThatIsHiddenIsAnError) {
    Show();
    pane->Hide();
    EXPECT_EQ(ErrorOf("click @7"), "script:1: item 7 is hidden");
    pane->Show();
    container->Hide();
    EXPECT_EQ(ErrorOf("click @7"), "script:1: item 7 is hidden");
}

TEST_F(ScriptPlacesTest, APlaceThatDoesNotShowIsAnError) {
    Show();
    EXPECT_EQ(ErrorOf("click @7+50+2"), "script:1: this place of item 7 does not show in the window");
    EXPECT_EQ(ErrorOf("click @7+32000+32000"), "script:1: this place of item 7 does not show in the window");
    container->scroll = {100, 0};
    EXPECT_EQ(ErrorOf("click @7"), "script:1: this place of item 7 does not show in the window");
}

TEST_F(ScriptPlacesTest, APressOutsideOfTheWindowIsAnError) {
    Show();
    for (std::string const step : {"press", "click", "doubleclick", "rightclick"}) {
        EXPECT_EQ(ErrorOf(step + " 320 10"),
                  "script:1: 320 10 lies outside of the window, which is 320 by 200");
        EXPECT_EQ(ErrorOf(step + " 10 -1"),
                  "script:1: 10 -1 lies outside of the window, which is 320 by 200");
    }
    EXPECT_EQ(ErrorOf("wheel 10 200 0 1"),
              "script:1: 10 200 lies outside of the window, which is 320 by 200");
    EXPECT_EQ(ErrorOf("click 319 199"), "no error");
}

TEST_F(ScriptPlacesTest, TheMouseMayMoveOutOfTheWindow) {
    Show();
    EXPECT_EQ(ErrorOf("move 400 10\npress 10 10\nmove -5 300\nrelease"), "no error");
}

} // namespace
