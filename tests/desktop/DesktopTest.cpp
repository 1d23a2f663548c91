#include "desktop/AssertionHandler.h"
#include "desktop/drawing/Surface.h"
#include "desktop/observe/JsonLine.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/resources/Resources.h"
#include "desktop/windows/HelpTagWindow.h"
#include "host/AssertionFailed.h"
#include "host/CallbackAPI.h"
#include "host/CommandSpecifier.h"
#include "host/NamedColors.h"
#include "host/Services.h"
#include "host/TarnError.h"
#include "host/TarnImage.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"
#include <cstdlib>
#include <fstream>
#include <sstream>

namespace {

class DesktopTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, {10, 20, 40, 80}, calls);
    HelpTagWindow &HelpTags() { return DesktopRep::Of(desktop).loop->HelpTags(); }
    ~DesktopTest() override {
        if (Desktop::Current())
            desktop.SetTheme("light");
    }
};

TEST_F(DesktopTest, OnlyOneDesktopCanBeOpen) {
    EXPECT_EQ(Desktop::Current(), &desktop);
    EXPECT_THROW(SimulatedDesktop another, std::logic_error);
    EXPECT_EQ(Desktop::Current(), &desktop);
}

TEST(DesktopOptionsTest, WrongOptionsAreRefusedWithTheReason) {
    EXPECT_THROW(SimulatedDesktop(DesktopOptions().Scale(9)), std::invalid_argument);
    EXPECT_THROW(SimulatedDesktop(DesktopOptions().Scale(0.1)), std::invalid_argument);
    EXPECT_THROW(SimulatedDesktop(DesktopOptions().Theme("sepia")), std::runtime_error);
    EXPECT_THROW(SimulatedDesktop(DesktopOptions().Artwork("/nowhere")), std::runtime_error);
    EXPECT_EQ(Desktop::Current(), nullptr);
    SimulatedDesktop fine;
}

TEST(DesktopOptionsTest, AWindowWithoutDisplayIsAClearError) {
    // The window system must say so itself, whatever the machine that runs the test has.
    std::string const display = std::getenv("DISPLAY") ? std::getenv("DISPLAY") : "";
    unsetenv("DISPLAY");
    try {
        Desktop real;
        FAIL() << "a real desktop opened without a display";
    } catch (std::runtime_error const &error) {
        EXPECT_NE(std::string(error.what()).find("display"), std::string::npos) << error.what();
    }
    if (!display.empty())
        setenv("DISPLAY", display.c_str(), 1);
}

TEST_F(DesktopTest, AThemeChangeRedrawsEverythingInTheNewColoursAndIsTold) {
    class Listener : public ThemeChangeNotificationProvider_Listener {
    public:
        void ThemeChanged() override { ++changes; }
        int changes = 0;
    } listener;
    listener.DependUpon(&ThemeChangeNotificationProvider::Instance());
    Show();
    RGBColor const light = kWindowBackgroundColor;
    desktop.SetTheme("dark");
    EXPECT_LT(kWindowBackgroundColor.green, light.green);
    EXPECT_EQ(listener.changes, 1);
    EXPECT_EQ(desktop.Theme(), "dark");
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{0, 0, 200, 320}}));
    EXPECT_EQ(desktop.Picture(glog)->Row(5)[5] >> 8 & 0xFF,
              static_cast<unsigned>(kWindowBackgroundColor.green >> 8));
}

TEST_F(DesktopTest, AnUnknownThemeChangesNothing) {
    EXPECT_THROW(desktop.SetTheme("sepia"), std::invalid_argument);
    EXPECT_EQ(desktop.Theme(), "light");
}

TEST_F(DesktopTest, ScalesMakeTheSurfaceLargerAndNotTheGlog) {
    Show();
    for (double scale : {1.0, 1.25, 1.5, 2.0}) {
        desktop.SetScale(scale);
        UpdateGlog(glog);
        EXPECT_EQ(desktop.Picture(glog)->Width(), static_cast<int>(320 * scale));
        EXPECT_EQ(desktop.Picture(glog)->Height(), static_cast<int>(200 * scale));
        EXPECT_EQ(GetGlogWidth(glog), 320);
    }
    EXPECT_THROW(desktop.SetScale(0), std::invalid_argument);
}

TEST_F(DesktopTest, ClicksLandOnTheSamePaneAtEveryScale) {
    pane->clickResult = 1;
    Show();
    desktop.SetScale(2);
    EXPECT_EQ(ResultOfClick("click 79 39"), 1);
    EXPECT_EQ(ResultOfClick("click 80 39"), kNoClick);
}

TEST_F(DesktopTest, RunEndsWhenTheLastGlogIsGone) {
    Show();
    pane->onClick = [&](EventRecordAdapter *) { DisposeGlog(glog); };
    desktop.Script("click 25 15\nclick 25 15\nwait 100");
    EXPECT_EQ(desktop.Run(), 0);
    EXPECT_EQ(desktop.Now(), 0);
    EXPECT_FALSE(desktop.ProcessEvents(0));
}

TEST_F(DesktopTest, QuitEndsRunWithItsStatus) {
    Show();
    pane->onClick = [&](EventRecordAdapter *) { desktop.Quit(7); };
    desktop.Script("click 25 15\nwait 100");
    EXPECT_EQ(desktop.Run(), 7);
    EXPECT_EQ(desktop.Now(), 0);
}

TEST_F(DesktopTest, ProcessEventsReturnsAfterItsTime) {
    Show();
    EXPECT_TRUE(desktop.ProcessEvents(0.5));
    EXPECT_EQ(desktop.Now(), 0.5);
}

TEST_F(DesktopTest, TheTreeIsDumpedAsJson) {
    Show();
    pane->SetID(4);
    std::string const dump = desktop.DumpTree(glog);
    EXPECT_NE(dump.find("\"id\":4,\"box\":[10,20,40,80],\"visible\":true"), std::string::npos) << dump;
    EXPECT_NE(dump.find("\"width\":320,\"height\":200"), std::string::npos) << dump;
}

TEST_F(DesktopTest, ADumpStepWritesTheTree) {
    Show();
    std::string const file = testing::TempDir() + "glog-dump.json";
    desktop.Play("dump " + file);
    std::ifstream in(file);
    std::stringstream text;
    text << in.rdbuf();
    EXPECT_EQ(text.str(), desktop.DumpTree(glog));
}

TEST_F(DesktopTest, SnapshotsThatCannotBeWrittenAreErrorsThatNameTheLine) {
    Show();
    EXPECT_THROW(desktop.Snapshot(glog, "/nowhere/a.png"), std::runtime_error);
    try {
        desktop.Play("\nsnapshot /nowhere/a.png");
        FAIL();
    } catch (ScriptError const &error) {
        EXPECT_NE(std::string(error.what()).find("script:2"), std::string::npos) << error.what();
    }
}

TEST_F(DesktopTest, AMenuStepWithoutAMenuIsAnError) {
    Show();
    EXPECT_THROW(desktop.Play("menu 3"), ScriptError);
    EXPECT_THROW(desktop.Play("print a.pdf"), ScriptError);
}

// Tool tips

TEST_F(DesktopTest, AHelpTagAppearsWhenThePointerHasRestedForItsDelay) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    desktop.Play("move 30 20\nwait 0.4");
    EXPECT_FALSE(HelpTags().IsShown());
    desktop.Play("wait 0.2");
    EXPECT_TRUE(HelpTags().IsShown());
    Rect const place = HelpTags().ScreenPlace();
    EXPECT_GT(place.right - place.left, 20);
    desktop.Play("move 200 150");
    EXPECT_FALSE(HelpTags().IsShown());
}

TEST_F(DesktopTest, AnyClickKeyOrWheelTurnTakesTheHelpTagAway) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    for (char const *step : {"click 30 20", "key a", "wheel 30 20 0 1", "activate off"}) {
        desktop.Play("activate on\nmove 200 150\nmove 30 20\nwait 1");
        EXPECT_TRUE(HelpTags().IsShown()) << step;
        desktop.Play(step);
        EXPECT_FALSE(HelpTags().IsShown()) << step;
    }
}

TEST_F(DesktopTest, MovingWithinThePartDoesNotRestartItsDelay) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    desktop.Play("move 30 20\nwait 0.3\nmove 31 20\nwait 0.3");
    EXPECT_TRUE(HelpTags().IsShown());
}

TEST_F(DesktopTest, AHelpTagGoesWithItsPane) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    desktop.Play("move 30 20\nwait 1");
    EXPECT_TRUE(HelpTags().IsShown());
    delete pane;
    EXPECT_FALSE(HelpTags().IsShown());
}

// Failures and hooks

struct Broken : std::runtime_error {
    using std::runtime_error::runtime_error;
};

TEST_F(DesktopTest, ABrokenAssertionGoesToTheHandlerWithItsText) {
    SetAssertionHandler([](char const *text) { throw Broken(text); });
    boost::shared_ptr<int> null;
    try {
        *null = 1;
        ADD_FAILURE();
    } catch (Broken const &error) {
        EXPECT_NE(std::string(error.what()).find("px != 0"), std::string::npos);
    }
    EXPECT_THROW(boost::assertion_failed_msg("x", "why", "f", "file", 3), Broken);
    SetAssertionHandler(nullptr);
}

TEST_F(DesktopTest, WithoutAHandlerABrokenAssertionIsReportedAndAborts) {
    SetAssertionHandler(nullptr);
    EXPECT_DEATH(boost::assertion_failed("px != 0", "f", "file.h", 12), "px != 0 in f, file.h:12");
}

TEST_F(DesktopTest, MemoryFailureIsThrownAsTheHostsError) { EXPECT_THROW(FailMemFullError(), TarnError); }

TEST_F(DesktopTest, ApplicationsThatSupplyNoHooksGetSome) {
    ASSERT_NE(VelaFoundationCallbackAPI::gInstance, nullptr);
    VelaFoundationCallbackAPI::gInstance->TrackingStep();
    EventRecordAdapter key;
    key.message = 27;
    EXPECT_TRUE(VelaFoundationCallbackAPI::gInstance->IsCancelKey(&key, true));
    key.message = 13;
    EXPECT_FALSE(VelaFoundationCallbackAPI::gInstance->IsCancelKey(&key, true));
    desktop.TakeMessages();
    CommandSpecifier command(15, 11);
    InternalCallbackAPI::gInstance->ExecuteCommand(&command);
    EXPECT_EQ(desktop.TakeMessages(),
              Lines{"{\"time\":0,\"message\":\"ExecuteCommand\",\"class\":15,\"command\":11}"});
}

TEST_F(DesktopTest, ADoubleClickIsKnownWhileItsSecondPressIsHandled) {
    std::vector<bool> doubles;
    pane->onClick = [&](EventRecordAdapter *) {
        doubles.push_back(VelaFoundationCallbackAPI::gInstance->IsDoubleClick());
    };
    Show();
    desktop.Play("doubleclick 30 20\nclick 30 20");
    EXPECT_EQ(doubles, (std::vector<bool>{false, true, false}));
}

TEST_F(DesktopTest, HelpResizeObjectDamagesWhatOneRectangleHasAndTheOtherHasNot) {
    Show();
    SetPortToGlog(glog);
    Rect before{0, 0, 10, 10}, after{0, 0, 10, 14};
    HelpResizeObject(&before, &after);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{0, 10, 10, 14}}));
}

// Lines of JSON

TEST(JsonLineTest, FieldsStandInTheOrderTheyAreAddedIn) {
    JsonLine line;
    line.Integer("a", -3)
        .Number("b", 0.1)
        .Flag("c", true)
        .Box("d", {1, 2, 3, 4})
        .Spot("e", {5, 6})
        .Raw("f", "[]");
    EXPECT_EQ(line.Finish(), "{\"a\":-3,\"b\":0.1,\"c\":true,\"d\":[1,2,3,4],\"e\":[5,6],\"f\":[]}");
    EXPECT_EQ(JsonLine().Finish(), "{}");
}

TEST(JsonLineTest, TextsAreEscaped) {
    JsonLine line;
    line.Text("t", std::string("a\"b\\c\n\t\r\x01é"));
    EXPECT_EQ(line.Finish(), "{\"t\":\"a\\\"b\\\\c\\n\\t\\r\\u0001é\"}");
}

TEST(JsonLineTest, NumbersReadBackTheSame) {
    JsonLine line;
    line.Number("a", 1.0 / 3).Number("b", 1e300).Number("c", 0.0 / 1 - 0.0);
    EXPECT_EQ(line.Finish(), "{\"a\":0.3333333333333333,\"b\":1e+300,\"c\":0}");
}

} // namespace
