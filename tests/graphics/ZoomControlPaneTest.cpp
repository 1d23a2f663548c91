#include "graphics/ZoomControlPane.h"
#include "buttons/GIconButtonPane.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <memory>

namespace {

typedef std::vector<std::string> Calls;

class TestClient : public ZoomControlPane::Client {
public:
    void Zoom(bool zoomIn, bool optionKey) override {
        calls.push_back(std::string(zoomIn ? "in" : "out") + (optionKey ? " option" : ""));
        times.push_back(TarnSystemTime::GetCurrentEventTime());
        if (then)
            then();
    }
    bool CanZoom(bool zoomIn) override {
        if (onAsked)
            onAsked();
        return zoomIn ? canZoomIn : canZoomOut;
    }
    void SaveZoomStateHook() override { calls.push_back("save"); }

    Calls calls;
    std::vector<double> times;
    bool canZoomIn = true, canZoomOut = true;
    std::function<void()> then, onAsked;
};

class ZoomControlPaneTest : public PaneTest {
protected:
    ZoomControlPane *Made(ZoomControlPane::Orientation orientation = ZoomControlPane::kHorizontal) {
        pane = new ZoomControlPane(glog, &client, orientation);
        pane->Offset({20, 40});
        return pane;
    }
    GIconButtonPane &Button(short index) { return dynamic_cast<GIconButtonPane &>(*pane->Get(index)); }
    GIconButtonPane &ZoomOut() { return Button(0); } // level panes have it at the left
    GIconButtonPane &ZoomIn() { return Button(1); }
    LocalizedStrings::HelpTag const *TagOf(GlogPane &button) {
        LocalizedStrings::HelpTag const *tag = nullptr;
        Rect place;
        OS::Help::Placement placement = OS::Help::Placement(0);
        double delay = 0;
        button.GetHelpTagForPoint({5, 5}, tag, place, placement, delay);
        return tag;
    }
    static LocalizedStrings::HelpTag const *Tag(char const *key) {
        return LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", key);
    }
    // Which icons of family 1000 are drawn, from the left or the top.
    std::vector<int> Icons() {
        desktop.TakeDrawing();
        pane->Inval();
        UpdateGlog(glog);
        std::vector<int> icons;
        std::string const mark = "\"family\":1000,\"icon\":";
        for (std::string const &line : Only("Draw1Icon", desktop.TakeDrawing()))
            icons.push_back(std::stoi(line.substr(line.find(mark) + mark.size())));
        return icons;
    }
    Calls Played(std::string const &script) {
        client.calls.clear();
        client.times.clear();
        desktop.Play(script);
        return client.calls;
    }

    TestClient client;
    ZoomControlPane *pane = nullptr;
};

// In a window at 40, 20: the button that zooms out from 40, the one that zooms in from 55.
std::string const kOut = "46 26", kIn = "62 26";

} // namespace

// Buttons

TEST_F(ZoomControlPaneTest, LevelButtonsStandSideBySide) {
    Made();
    Show();
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 40, 35, 70}));
    EXPECT_EQ(Icons(), (std::vector<int>{55, 58}));
    EXPECT_EQ(TagOf(ZoomOut()), Tag("kHZoomOut"));
    EXPECT_EQ(ZoomOut().GetDrawRectangle(), (Rect{0, 0, 15, 15}));
    EXPECT_EQ(ZoomIn().GetDrawRectangle(), (Rect{0, 15, 15, 30}));
}

TEST_F(ZoomControlPaneTest, UprightButtonsStandAboveEachOther) {
    Made(ZoomControlPane::kVertical);
    Show();
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 40, 50, 55}));
    EXPECT_EQ(Icons(), (std::vector<int>{4, 1})) << "the one that zooms in is above";
    EXPECT_EQ(TagOf(Button(0)), Tag("kVZoomIn"));
}

TEST_F(ZoomControlPaneTest, AnyOtherOrientationIsUpright) {
    Made(static_cast<ZoomControlPane::Orientation>(7));
    Show();
    EXPECT_EQ(Icons(), (std::vector<int>{4, 1}));
}

TEST_F(ZoomControlPaneTest, ButtonsWithoutAFurtherStepAreDisabled) {
    client.canZoomOut = false;
    Made();
    Show();
    EXPECT_FALSE(ZoomOut().IsEnabled());
    EXPECT_TRUE(ZoomIn().IsEnabled());
    EXPECT_EQ(Icons(), (std::vector<int>{56, 58}));
    EXPECT_EQ(Played("click " + kOut), Calls());
}

TEST_F(ZoomControlPaneTest, TheClientTellsWhenItsAnswersChange) {
    Made();
    Show();
    client.canZoomIn = false;
    EXPECT_TRUE(ZoomIn().IsEnabled());
    client.UpdateControlPane();
    EXPECT_FALSE(ZoomIn().IsEnabled());
    EXPECT_TRUE(ZoomOut().IsEnabled());
    client.canZoomIn = true;
    client.canZoomOut = false;
    pane->UpdateControls();
    EXPECT_TRUE(ZoomIn().IsEnabled());
    EXPECT_FALSE(ZoomOut().IsEnabled());
}

TEST_F(ZoomControlPaneTest, AClientCanZoomUnlessItSaysOtherwise) {
    class Plain : public ZoomControlPane::Client {
    public:
        void Zoom(bool, bool) override {}
    } plain;
    EXPECT_TRUE(plain.CanZoom(true));
    EXPECT_TRUE(plain.CanZoom(false));
    plain.SaveZoomStateHook();
    plain.UpdateControlPane(); // without a pane
}

TEST_F(ZoomControlPaneTest, TheClientsOperationsStandInTheirOrder) {
    ExpectInOrder(kAfterDestructor, &ZoomControlPane::Client::Zoom, &ZoomControlPane::Client::CanZoom,
                  &ZoomControlPane::Client::SaveZoomStateHook);
}

// Presses

TEST_F(ZoomControlPaneTest, AClickZoomsOnceAtTheRelease) {
    Made();
    Show();
    EXPECT_EQ(Played("press " + kIn + "\nwait 0.3\nrelease"), (Calls{"save", "in"}));
    EXPECT_EQ(client.times.size(), 1u);
    EXPECT_EQ(Played("click " + kOut), (Calls{"save", "out"}));
    EXPECT_EQ(Icons(), (std::vector<int>{55, 58})) << "it is up again";
}

TEST_F(ZoomControlPaneTest, AClickGivesMinusOne) {
    Made();
    Show();
    EXPECT_EQ(ResultOfClick("click " + kIn), -1);
}

TEST_F(ZoomControlPaneTest, AHeldButtonWaitsAThirdOfASecondAndThenZoomsTenTimesASecond) {
    Made();
    Show();
    double const pressed = desktop.Now();
    EXPECT_EQ(Played("press " + kIn + "\nwait 0.75\nrelease"), (Calls{"save", "in", "in", "in", "in"}));
    ASSERT_EQ(client.times.size(), 4u);
    for (std::size_t i = 0; i < client.times.size(); ++i)
        EXPECT_NEAR(client.times[i] - pressed, 0.4 + 0.1 * static_cast<double>(i), 0.001);
}

TEST_F(ZoomControlPaneTest, EachPressSavesItsStateAnew) {
    Made();
    Show();
    Played("press " + kIn + "\nwait 0.45\nrelease");
    EXPECT_EQ(Played("press " + kIn + "\nwait 0.45\nrelease"), (Calls{"save", "in"}));
}

TEST_F(ZoomControlPaneTest, WithOptionItNeverRepeatsAndTheClientIsTold) {
    Made();
    Show();
    EXPECT_EQ(Played("press " + kIn + " option\nwait 2\nrelease"), (Calls{"save", "in option"}));
}

TEST_F(ZoomControlPaneTest, WithCommandItNeverRepeats) {
    Made();
    Show();
    EXPECT_EQ(Played("press " + kOut + " command\nwait 2\nrelease"), (Calls{"save", "out"}));
}

TEST_F(ZoomControlPaneTest, WithShiftItRepeats) {
    Made();
    Show();
    EXPECT_EQ(Played("press " + kIn + " shift\nwait 0.45\nrelease"), (Calls{"save", "in"}));
    EXPECT_NEAR(client.times.at(0), desktop.Now() - 0.05, 0.001);
}

TEST_F(ZoomControlPaneTest, ReleasedBesideTheButtonNothingIsZoomed) {
    Made();
    Show();
    EXPECT_EQ(Played("press " + kIn + "\nmove 200 150\nrelease"), Calls());
}

// What may happen meanwhile

TEST_F(ZoomControlPaneTest, ThePaneMayBeDeletedByAZoom) {
    Made();
    Show();
    PaneWatch const watch(pane);
    client.then = [&] { delete pane; };
    Played("click " + kIn);
    EXPECT_FALSE(watch.PaneExists());
    client.UpdateControlPane(); // has none any more
}

TEST_F(ZoomControlPaneTest, ThePaneMayBeDeletedWhileItsButtonIsHeld) {
    Made();
    Show();
    PaneWatch const watch(pane);
    client.then = [&] { delete pane; };
    EXPECT_EQ(Played("press " + kIn + "\nwait 2\nrelease"), (Calls{"save", "in"}));
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ZoomControlPaneTest, ThePaneMayBeDeletedWhenTheClientIsAsked) {
    Made();
    Show();
    PaneWatch const watch(pane);
    int asked = 0;
    client.onAsked = [&] {
        ++asked;
        delete pane;
    };
    client.UpdateControlPane();
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(asked, 1) << "not about the button that has gone";
    client.onAsked = nullptr;
    client.UpdateControlPane();
}

TEST_F(ZoomControlPaneTest, AClientThatHasGoneIsNotAsked) {
    std::unique_ptr<TestClient> brief(new TestClient);
    pane = new ZoomControlPane(glog, brief.get(), ZoomControlPane::kHorizontal);
    pane->Offset({20, 40});
    Show();
    brief.reset();
    EXPECT_FALSE(ZoomIn().IsEnabled());
    pane->UpdateControls();
    EXPECT_EQ(ResultOfClick("click " + kIn), -1);
}

TEST_F(ZoomControlPaneTest, AClientHasOnePane) {
    ZoomControlPane *const first = Made();
    ZoomControlPane *const second = Made();
    delete first;
    client.canZoomIn = false;
    client.UpdateControlPane();
    pane = second;
    EXPECT_FALSE(ZoomIn().IsEnabled());
}

TEST_F(ZoomControlPaneTest, WithoutAGlogThereAreNoButtons) {
    ZoomControlPane loose(nullptr, &client, ZoomControlPane::kHorizontal);
    EXPECT_EQ(loose.NumSubpanes(), 0);
    loose.UpdateControls();
}
