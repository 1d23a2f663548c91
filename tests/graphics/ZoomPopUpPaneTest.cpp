#include "graphics/ZoomPopUpPane.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "dialogs/ItemRegistry.h"
#include "graphics/ZoomPopUpControl.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/PaneWatch.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

// Writes down what the pane asks of it.
struct ZoomLog {
    std::vector<std::string> calls;
    std::vector<float> fractions;
    int deleted = 0;
    std::function<void()> onPrepare, onStep, onSet, onIdle;
};

class TestClient : public ZoomPopUpPaneClient {
public:
    explicit TestClient(ZoomLog &log_)
        : log(log_) {}
    ~TestClient() override { ++log.deleted; }
    void PrepareToZoom() override {
        log.calls.push_back("prepare");
        if (log.onPrepare)
            log.onPrepare();
    }
    float GetZoomFraction() override { return fraction; }
    void SetZoomFraction(float wanted) override {
        log.calls.push_back("set");
        log.fractions.push_back(wanted);
        fraction = steps > 0 ? std::round(wanted * steps) / steps : wanted;
        if (log.onSet)
            log.onSet();
    }
    void ZoomStep(bool up) override {
        log.calls.push_back(up ? "up" : "down");
        if (log.onStep)
            log.onStep();
    }
    void ZoomIdle() override {
        log.calls.push_back("idle");
        if (log.onIdle)
            log.onIdle();
    }
    float fraction = 0.0f;
    float steps = 0.0f; // 0: takes every fraction
    ZoomLog &log;
};

class ZoomPopUpPaneTest : public PaneTest {
protected:
    ZoomPopUpPaneTest()
        : client(new TestClient(log))
        , pane(new ZoomPopUpPane(glog, client)) {
        pane->Offset({100, 150});
        ItemRegistry::Instance(); // the slider's window is a dialog
    }

    // The slider's window while it is up, else null.
    Glog *Popup() const {
        for (Glog *other : DesktopRep::Of(const_cast<SimulatedDesktop &>(desktop)).Glogs())
            if (other != glog && other->IsVisible())
                return other;
        return nullptr;
    }
    int Count(std::string const &call) const {
        return static_cast<int>(std::count(log.calls.begin(), log.calls.end(), call));
    }
    ZoomLog log;
    TestClient *client;
    ZoomPopUpPane *pane;
};

} // namespace

// The button

TEST_F(ZoomPopUpPaneTest, IsAButtonOfTwelvePixels) {
    ZoomPopUpPane *const other = new ZoomPopUpPane(glog, new TestClient(log));
    EXPECT_EQ(BoxOf(*other), (Rect{0, 0, 12, 12}));
    EXPECT_EQ(other->GetID(), 0);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Traced(*pane, [] { Draw1Icon(1007, 46, 150, 100); }));
}

TEST_F(ZoomPopUpPaneTest, HasAHelpTag) {
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect place;
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = 0;
    ASSERT_TRUE(pane->GetHelpTagForPoint({105, 155}, tag, place, placement, delay));
    EXPECT_EQ(tag, LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGlobalTags", "kZoomPopupPane"));
}

TEST_F(ZoomPopUpPaneTest, OwnsItsClient) {
    delete pane;
    EXPECT_EQ(log.deleted, 1);
}

TEST_F(ZoomPopUpPaneTest, WithoutAGlogItIsNotAttachedAndStillOwnsItsClient) {
    { ZoomPopUpPane const loose(nullptr, new TestClient(log)); }
    EXPECT_EQ(log.deleted, 1);
}

TEST_F(ZoomPopUpPaneTest, TheClientsOperationsStandInTheirOrder) {
    ExpectInOrder(kAfterDestructor, &ZoomPopUpPaneClient::PrepareToZoom,
                  &ZoomPopUpPaneClient::GetZoomFraction, &ZoomPopUpPaneClient::SetZoomFraction,
                  &ZoomPopUpPaneClient::ZoomStep, &ZoomPopUpPaneClient::ZoomIdle);
}

// The wheel

TEST_F(ZoomPopUpPaneTest, TheWheelStepsUpAndDown) {
    Show();
    desktop.Play("wheel 155 105 0 1\nwheel 155 105 0 -1");
    EXPECT_EQ(log.calls, (std::vector<std::string>{"prepare", "up", "prepare", "down"}));
}

TEST_F(ZoomPopUpPaneTest, LessThanANotchIsAStepDown) {
    Show();
    desktop.Play("wheel 155 105 0 0.9\nwheel 155 105 0 -0.9\nwheel 155 105 0 1.9");
    EXPECT_EQ(Count("down"), 2);
    EXPECT_EQ(Count("up"), 1);
}

TEST_F(ZoomPopUpPaneTest, ThePaneMayBeDeletedByTheWheel) {
    Show();
    PaneWatch const watch(pane);
    log.onStep = [&] { delete pane; };
    desktop.Play("wheel 155 105 0 1");
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(log.deleted, 1);
}

TEST_F(ZoomPopUpPaneTest, ThePaneMayBeDeletedBeforeAStep) {
    Show();
    log.onPrepare = [&] { delete pane; };
    desktop.Play("wheel 155 105 0 1");
    EXPECT_EQ(log.deleted, 1);
    EXPECT_EQ(log.calls, std::vector<std::string>{"prepare"}) << "the client went with it";
}

// The slider

TEST_F(ZoomPopUpPaneTest, TheSliderComesUpWithItsLevelUnderTheMouse) {
    Show();
    client->fraction = 0.5f; // 23 pixels along the track
    Rect screen = {0, 0, 0, 0};
    Point const window = Glog::From(glog).Window()->ScreenPlace();
    log.onSet = [&] {
        Point const place = Popup()->Window()->ScreenPlace();
        screen = {place.v, place.h, static_cast<short>(place.v + Popup()->Height()),
                  static_cast<short>(place.h + Popup()->Width())};
    };
    EXPECT_EQ(ResultOfClick("press 155 105\nwait 0.01\nrelease"), -1);
    short const left = static_cast<short>(window.h + 155 - 23 - 3),
                top = static_cast<short>(window.v + 100 - 17);
    EXPECT_EQ(screen, (Rect{top, left, static_cast<short>(top + 34), static_cast<short>(left + 55)}));
    ASSERT_EQ(log.fractions.size(), 1u);
    EXPECT_FLOAT_EQ(log.fractions[0], 23.0f / 47.0f) << "the pixel under the mouse";
    EXPECT_EQ(log.calls.front(), "prepare");
}

TEST_F(ZoomPopUpPaneTest, TheLevelUnderTheMouseIsCalculatedInDoublePrecision) {
    Show();
    client->fraction = 24.0f / 47.0f; // a little less than that: single precision would make it 24 again
    desktop.Play("press 155 105\nwait 0.01\nrelease");
    ASSERT_EQ(log.fractions.size(), 1u);
    EXPECT_FLOAT_EQ(log.fractions[0], 23.0f / 47.0f);
}

TEST_F(ZoomPopUpPaneTest, LevelsThatAreNoneBringTheSliderUpAllTheSame) {
    Show();
    for (float level :
         {std::numeric_limits<float>::quiet_NaN(), std::numeric_limits<float>::infinity(), -1e30f}) {
        log.fractions.clear();
        client->fraction = level;
        EXPECT_EQ(ResultOfClick("press 155 105\nmove 156 105"), -1);
        ASSERT_EQ(log.fractions.size(), 2u) << level;
        for (float given : log.fractions)
            EXPECT_TRUE(given >= 0.0f && given <= 1.0f) << given;
    }
}

TEST_F(ZoomPopUpPaneTest, TheSliderFollowsTheMouse) {
    Show();
    desktop.Play("press 155 105\nmove 165 300\nmove 202 105");
    ASSERT_EQ(log.fractions.size(), 3u);
    EXPECT_FLOAT_EQ(log.fractions[0], 0.0f);
    EXPECT_FLOAT_EQ(log.fractions[1], 10.0f / 47.0f) << "wherever it is up or down";
    EXPECT_FLOAT_EQ(log.fractions[2], 1.0f);
}

TEST_F(ZoomPopUpPaneTest, BeyondTheSlidersSidesAreItsEnds) {
    Show();
    client->fraction = 0.5f;
    desktop.Play("press 155 105\nmove 10 105\nmove 310 105\nmove 130 105\nmove 182 105");
    ASSERT_EQ(log.fractions.size(), 5u);
    EXPECT_EQ(log.fractions[1], 0.0f);
    EXPECT_EQ(log.fractions[2], 1.0f);
    EXPECT_EQ(log.fractions[3], 0.0f) << "within, left of the track";
    EXPECT_EQ(log.fractions[4], 1.0f);
}

TEST_F(ZoomPopUpPaneTest, TheSliderGoesAtTheRelease) {
    Show();
    bool wasUp = false;
    log.onSet = [&] { wasUp = Popup() != nullptr; };
    desktop.Play("press 155 105\nmove 165 105");
    EXPECT_TRUE(wasUp);
    EXPECT_EQ(Popup(), nullptr);
    EXPECT_EQ(DesktopRep::Of(desktop).Glogs().size(), 1u);
}

TEST_F(ZoomPopUpPaneTest, TheWindowStaysActiveWhileTheSliderIsUp) {
    Show();
    bool active = false;
    log.onSet = [&] { active = Glog::From(glog).IsActive() && !Popup()->IsActive(); };
    desktop.Play("press 155 105\nmove 165 105");
    EXPECT_TRUE(active);
    EXPECT_TRUE(Glog::From(glog).IsActive());
}

TEST_F(ZoomPopUpPaneTest, WhileTheMouseRestsTheClientIsLetDoSomething) {
    Show();
    desktop.Play("press 155 105\nwait 0.52\nrelease");
    EXPECT_EQ(Count("set"), 1) << "once, at the press";
    EXPECT_EQ(Count("idle"), 10) << "twenty times a second";
    log.calls.clear();
    desktop.Play("press 155 105\nmove 156 105\nmove 157 105");
    EXPECT_EQ(Count("idle"), 2) << "and after each movement";
}

TEST_F(ZoomPopUpPaneTest, TheThumbShowsTheLevelThatTheClientHasTaken) {
    Show();
    client->steps = 2.0f;
    std::vector<std::vector<Rect>> presented;
    log.onIdle = [&] { presented.push_back(desktop.TakePresented(Popup())); };
    Lines thumbs;
    desktop.TakeDrawing();
    desktop.Play("press 155 105\nmove 156 105\nmove 180 105\nmove 181 105");
    for (std::string const &line : Only("Draw1Icon", desktop.TakeDrawing()))
        if (line.find("\"family\":1777") != std::string::npos)
            thumbs.push_back(line);
    ASSERT_EQ(thumbs.size(), 2u) << "at first, and when another level was taken";
    EXPECT_NE(thumbs[0].find("\"icon\":15,\"h\":4,\"v\":3"), std::string::npos) << thumbs[0];
    EXPECT_NE(thumbs[1].find("\"icon\":7,"), std::string::npos) << thumbs[1];
    ASSERT_EQ(presented.size(), 3u);
    EXPECT_FALSE(presented[1].empty());
    EXPECT_TRUE(presented[2].empty()) << "another fraction is rounded to the same level";
}

TEST_F(ZoomPopUpPaneTest, LevelsBeyondTheEndsShowTheLastThumbs) {
    Show();
    glogRec *const window = desktop.NewGlog(GlogOptions().Size(55, 34));
    for (float level : {-3.0f, 7.0f}) {
        client->fraction = level;
        ZoomPopUpControl *const control = new ZoomPopUpControl(window, *pane, client);
        EXPECT_EQ(DrawingOf(*control), Traced(*control, [&] {
                      Draw1Icon(1776, 0, 0, 0);
                      Draw1Icon(1777, level < 0 ? 15 : 0, 4, 3);
                  }));
    }
}

// What may happen meanwhile

TEST_F(ZoomPopUpPaneTest, ThePaneMayBeDeletedAsItsSliderComesUp) {
    Show();
    PaneWatch const watch(pane);
    log.onPrepare = [&] {
        log.onPrepare = nullptr;
        delete pane;
    };
    EXPECT_EQ(ResultOfClick("press 155 105\nmove 165 105"), -1);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(log.calls, std::vector<std::string>{"prepare"});
    EXPECT_EQ(Popup(), nullptr);
}

TEST_F(ZoomPopUpPaneTest, ThePaneMayBeDeletedWhileItsSliderIsUp) {
    Show();
    PaneWatch const watch(pane);
    log.onSet = [&] {
        log.onSet = nullptr;
        delete pane;
    };
    EXPECT_EQ(ResultOfClick("press 155 105\nmove 165 105\nmove 170 105"), -1);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(log.deleted, 1);
    EXPECT_EQ(log.fractions.size(), 1u);
    EXPECT_EQ(Popup(), nullptr);
}

TEST_F(ZoomPopUpPaneTest, TheWindowMayCloseWhileTheSliderIsUp) {
    Show();
    log.onIdle = [&] { DisposeGlog(glog); };
    desktop.Play("press 155 105\nmove 165 105\nmove 170 105");
    EXPECT_EQ(log.deleted, 1);
    EXPECT_TRUE(DesktopRep::Of(desktop).Glogs().empty());
}
