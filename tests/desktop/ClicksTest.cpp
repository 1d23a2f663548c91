#include "desktop/windows/PlatformConventions.h"
#include "host/CallbackAPI.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

// Whether each click of a pane was the second of a double click, and whether it activated the window.
class ClicksTest : public PaneTest {
protected:
    typedef std::vector<bool> Answers;

    ClicksTest() {
        pane->onClick = [this](EventRecordAdapter *) {
            doubles.push_back(VelaFoundationCallbackAPI::gInstance->IsDoubleClick());
            activating.push_back(glog->DidActivateWithCurrentMouseDown());
        };
        Show();
    }
    ~ClicksTest() override {
        PlatformConventions::doubleClickSeconds = kUsualSeconds;
        PlatformConventions::doubleClickDistance = kUsualDistance;
    }

    Answers Doubles(std::string const &script) {
        doubles.clear();
        desktop.Play(script);
        return doubles;
    }
    Answers Activating(std::string const &script) {
        activating.clear();
        desktop.Play(script);
        return activating;
    }

    double const kUsualSeconds = PlatformConventions::doubleClickSeconds;
    int const kUsualDistance = PlatformConventions::doubleClickDistance;
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, {0, 0, 200, 320}, calls);
    Answers doubles, activating;
};

// Double clicks

TEST_F(ClicksTest, TwoPressesWithinHalfASecondAreADoubleClick) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\nwait 0.5\npress 30 20\nrelease"), (Answers{false, true}));
}

TEST_F(ClicksTest, TwoPressesWithMoreTimeBetweenThemAreSingle) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\nwait 0.51\npress 30 20\nrelease"), (Answers{false, false}));
}

TEST_F(ClicksTest, TheTimeIsASetting) {
    PlatformConventions::doubleClickSeconds = 0.2;
    EXPECT_EQ(Doubles("press 30 20\nrelease\nwait 0.3\npress 30 20\nrelease"), (Answers{false, false}));
}

TEST_F(ClicksTest, TheSecondMayBeFourPixelsAway) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\npress 34 16\nrelease"), (Answers{false, true}));
}

TEST_F(ClicksTest, FiveAreTooFarInEitherDirection) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\npress 35 20\nrelease"), (Answers{false, false}));
    EXPECT_EQ(Doubles("wait 1\npress 30 20\nrelease\npress 30 25\nrelease"), (Answers{false, false}));
}

TEST_F(ClicksTest, TheDistanceIsASetting) {
    PlatformConventions::doubleClickDistance = 10;
    EXPECT_EQ(Doubles("press 30 20\nrelease\npress 40 20\nrelease"), (Answers{false, true}));
}

TEST_F(ClicksTest, ThePlaceIsThatOfThePressNotOfTheRelease) {
    EXPECT_EQ(Doubles("press 30 20\nmove 90 90\nrelease\npress 30 20\nrelease"), (Answers{false, true}));
}

TEST_F(ClicksTest, AThirdPressIsNoDoubleClick) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\npress 30 20\nrelease\npress 30 20\nrelease"),
              (Answers{false, true, false}));
}

TEST_F(ClicksTest, AnotherButtonBetweenThemMakesThemSingle) {
    EXPECT_EQ(Doubles("press 30 20\nrelease\nrightclick 30 20\npress 30 20\nrelease"),
              (Answers{false, false}));
}

TEST_F(ClicksTest, AClickInAnotherWindowStartsToCountAnew) {
    desktop.Play("press 30 20\nrelease");
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(320, 200));
    ProbePane *const there = new ProbePane(other, {0, 0, 200, 320}, calls);
    Answers answers;
    there->onClick = [&](EventRecordAdapter *) {
        answers.push_back(VelaFoundationCallbackAPI::gInstance->IsDoubleClick());
    };
    ShowGlog(other, kShowGlog);
    desktop.Play("press 30 20\nrelease\npress 30 20\nrelease");
    EXPECT_EQ(answers, (Answers{false, true}));
}

TEST_F(ClicksTest, AClickOfAScriptIsSingleHoweverQuickItIs) {
    EXPECT_EQ(Doubles("click 30 20\nclick 30 20\nclick 30 20"), (Answers{false, false, false}));
}

TEST_F(ClicksTest, ADoubleClickOfAScriptIsOneEvenAfterAClick) {
    EXPECT_EQ(Doubles("click 30 20\ndoubleclick 30 20\ndoubleclick 30 20"),
              (Answers{false, false, true, false, true}));
}

TEST_F(ClicksTest, APressAfterAClickOfAScriptCountsOn) {
    EXPECT_EQ(Doubles("click 30 20\npress 30 20\nrelease"), (Answers{false, true}));
}

// The click that activates

TEST_F(ClicksTest, AClickThatComesWithTheActivationActivated) {
    EXPECT_EQ(Activating("activate off\nwait 1\nactivate on\nwait 0.1\nclick 30 20"), Answers{true});
}

TEST_F(ClicksTest, AClickLongAfterTheActivationDidNot) {
    EXPECT_EQ(Activating("activate off\nwait 1\nactivate on\nwait 0.3\nclick 30 20"), Answers{false});
}

TEST_F(ClicksTest, OnlyTheFirstClickAfterItActivated) {
    EXPECT_EQ(Activating("activate off\nactivate on\nclick 30 20\nclick 30 20"), (Answers{true, false}));
}

TEST_F(ClicksTest, AClickThatComesBeforeTheActivationActivatesToo) {
    EXPECT_EQ(Activating("activate off\nclick 30 20\nactivate on\nwait 1\nclick 30 20"),
              (Answers{true, false}));
}

TEST_F(ClicksTest, ShowingAWindowActivatesItWithoutAClick) {
    EXPECT_EQ(Activating("click 30 20"), Answers{false});
    ShowGlog(glog, kHideGlog);
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(Activating("click 30 20"), Answers{false});
}

TEST_F(ClicksTest, OutsideOfAClickNothingActivates) {
    desktop.Play("activate off\nactivate on\nclick 30 20");
    EXPECT_FALSE(glog->DidActivateWithCurrentMouseDown());
}

} // namespace
