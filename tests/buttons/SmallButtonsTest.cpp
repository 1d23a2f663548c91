// The small stock buttons: next and previous, the triangle, the track selector.
#include "buttons/NextPrevButton.h"
#include "buttons/TrackSelectorButtonPane.h"
#include "buttons/TwistDownButton.h"
#include "desktop/layout/LayoutEngine.h"
#include "host/CIdleChore.h"
#include "host/Icons.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"

namespace {

short const kSmallFamily = 1007;

class Chooser : public NextPrevButton {
public:
    explicit Chooser(glogRec *owner)
        : NextPrevButton(owner) {
        Rect box = {20, 10, 41, 26}; // the row in the middle is 30
        SetBox(&box);
    }
    using NextPrevButton::DrawGuts;
    void NextPrevClicked(int which) override { clicks.push_back(which); }
    std::vector<int> clicks;
};

class NextPrev : public PaneTest {
protected:
    NextPrev()
        : button(new Chooser(glog)) {}

    // The icons that are drawn while the script is played, and after it.
    Lines DrawnDuring(std::string const &script) {
        desktop.TakeDrawing();
        desktop.Play(script);
        UpdateGlog(glog);
        return Only("Draw1Icon", desktop.TakeDrawing());
    }
    Lines Icons(std::vector<short> const &icons) {
        return Traced(*button, [&icons] {
            for (short icon : icons)
                Draw1Icon(kSmallFamily, icon, 10, 20);
        });
    }

    Chooser *button;
};

class TwistDown : public PaneTest {
protected:
    TwistDown()
        : button(TwistDownButton::NewTwistDownButton(glog)) {}

    Lines Icon(short icon) {
        return Traced(*button, [icon] { Draw1Icon(kSmallFamily, icon, 0, 0); });
    }
    TwistDownButton *button;
};

class Listener : public TrackSelectorButtonPane_Listener {
public:
    void TrackSelectorButtonReleased() override {
        ++releases;
        if (onRelease)
            onRelease();
    }
    int releases = 0;
    std::function<void()> onRelease;
};

class TrackSelector : public PaneTest {
protected:
    TrackSelector()
        : button(new TrackSelectorButtonPane(glog)) {
        Rect box = {20, 10, 36, 25};
        button->SetBox(&box);
    }
    TrackSelectorButtonPane *button;
};

} // namespace

TEST_F(NextPrev, AddsItsOperationAfterThoseOfAPane) {
    class Added : public GlogPane {
    public:
        virtual void First() {}
        void DrawGuts(OSRgn *) override {}
    };
    EXPECT_EQ(PlaceOf(&NextPrevButton::NextPrevClicked), PlaceOf(&Added::First));
}

TEST_F(NextPrev, RestsWithIcon68UnderNumberZero) {
    EXPECT_EQ(button->GetID(), 0);
    EXPECT_EQ(Traced(*button, [this] { button->DrawGuts(nullptr); }), Icons({68}));
}

TEST_F(NextPrev, AReleaseOverTheUpperHalfTellsOne) {
    Show();
    EXPECT_EQ(ResultOfClick("click 12 29"), -1);
    EXPECT_EQ(button->clicks, (std::vector<int>{1}));
}

TEST_F(NextPrev, AReleaseOverTheLowerHalfTellsTwo) {
    Show();
    EXPECT_EQ(ResultOfClick("click 12 31"), -1);
    EXPECT_EQ(button->clicks, (std::vector<int>{2}));
}

TEST_F(NextPrev, TheRowInTheMiddleBelongsToNeitherHalf) {
    Show();
    EXPECT_EQ(ResultOfClick("click 12 30"), -1);
    EXPECT_EQ(button->clicks, (std::vector<int>{0}));
}

TEST_F(NextPrev, AReleaseOutsideTellsZero) {
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nmove 100 100\nrelease"), -1);
    EXPECT_EQ(button->clicks, (std::vector<int>{0}));
}

TEST_F(NextPrev, ADragFromHalfToHalfTellsWhereItEnded) {
    Show();
    ResultOfClick("press 12 22\nwait 0.1\nmove 12 38\nwait 0.1\nrelease");
    EXPECT_EQ(button->clicks, (std::vector<int>{2}));
}

TEST_F(NextPrev, ShowsTheHalfUnderTheMouseAsPressed) {
    Show();
    EXPECT_EQ(DrawnDuring("press 12 22\nwait 0.1\nmove 12 38\nwait 0.1\nmove 100 100\nwait 0.1\nmove 12 "
                          "22\nwait 0.1\nrelease"),
              Icons({69, 70, 68, 69, 68}));
}

TEST_F(NextPrev, AMovementWithinTheHalfRepaintsNothing) {
    Show();
    EXPECT_EQ(DrawnDuring("press 12 22\nwait 0.1\nmove 13 23\nwait 0.1\nrelease"), Icons({69, 68}));
}

TEST_F(NextPrev, MayBeDeletedWhileItIsTracked) {
    class Deleting : public CIdleChore {
    public:
        explicit Deleting(Chooser *button_)
            : CIdleChore(6, kInitialDelay)
            , button(button_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            delete button;
        }
        Chooser *button;
    } const deleting(button);
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nwait 0.3\nmove 12 38\nrelease"), -1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(NextPrev, MayBeDeletedWhenItIsClicked) {
    class Mayfly : public NextPrevButton {
    public:
        explicit Mayfly(glogRec *owner)
            : NextPrevButton(owner) {
            Rect box = {80, 10, 101, 26};
            SetBox(&box);
        }
        void NextPrevClicked(int) override { delete this; }
    };
    new Mayfly(glog);
    Show();
    EXPECT_EQ(ResultOfClick("click 12 82"), -1);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(NextPrev, StaysUnattachedWithoutAGlog) {
    Chooser lonely(nullptr);
    EXPECT_EQ(lonely.GetGlog(), nullptr);
}

TEST_F(TwistDown, StartsClosedAtTheOriginWithThirteenPixelsASide) {
    EXPECT_FALSE(button->IsOpen());
    EXPECT_EQ(BoxOf(*button), (Rect{0, 0, 13, 13}));
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)), Icon(17));
}

TEST_F(TwistDown, IsNotMadeWithoutAGlog) { EXPECT_EQ(TwistDownButton::NewTwistDownButton(nullptr), nullptr); }

TEST_F(TwistDown, AClickOpensAndTheNextOneCloses) {
    Show();
    EXPECT_EQ(ResultOfClick("click 5 5"), 1);
    EXPECT_TRUE(button->IsOpen());
    EXPECT_EQ(Only("Draw1Icon", DrawingOf(*button)), Icon(51));
    EXPECT_EQ(ResultOfClick("click 5 5"), 1);
    EXPECT_FALSE(button->IsOpen());
}

TEST_F(TwistDown, SlidingOffLeavesIt) {
    Show();
    EXPECT_EQ(ResultOfClick("press 5 5\nwait 0.3\nmove 100 100\nwait 0.1\nrelease"), -1);
    EXPECT_FALSE(button->IsOpen());
}

TEST_F(TwistDown, SlidingOffAndBackFlipsItOnce) {
    Show();
    EXPECT_EQ(ResultOfClick("press 5 5\nwait 0.3\nmove 100 100\nwait 0.1\nmove 5 5\nwait 0.1\nrelease"), 1);
    EXPECT_TRUE(button->IsOpen());
}

TEST_F(TwistDown, DisabledItDoesNotFlip) {
    button->Disable();
    Show();
    EXPECT_EQ(ResultOfClick("click 5 5"), 0);
    EXPECT_FALSE(button->IsOpen());
}

TEST_F(TwistDown, AReleaseThatIsNotTrackedFlipsIt) {
    btnRelease(button);
    EXPECT_TRUE(button->IsOpen());
    EXPECT_EQ(button->Flash(0), 1);
    EXPECT_FALSE(button->IsOpen());
}

TEST_F(TwistDown, AListenerMayDeleteIt) {
    class Deleting : public GlogButtonPaneListener {
    public:
        void GlogButtonPressed(GlogButtonPane *source) override { delete source; }
    } deleting;
    deleting.DependUpon(button);
    Show();
    EXPECT_EQ(ResultOfClick("click 5 5"), 1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(TwistDown, IsOpenWhenItsListenersAreTold) {
    class Watcher : public GlogButtonPaneListener {
    public:
        void GlogButtonPressed(GlogButtonPane *source) override {
            wasOpen = static_cast<TwistDownButton *>(source)->IsOpen();
        }
        bool wasOpen = false;
    } watcher;
    watcher.DependUpon(button);
    Show();
    desktop.Play("click 5 5");
    EXPECT_TRUE(watcher.wasOpen);
}

TEST_F(TwistDown, LeavesTheColoursAsTheyWere) {
    RGBColor const odd = {1000, 2000, 3000};
    Lines const drawn = Traced(*button, [&] {
        VelaDrawing::RGBForeColor(odd);
        (button->*&Opened<TwistDownButton>::DrawGuts)(nullptr);
        SaveColorRec after;
        GetColors(&after);
        EXPECT_EQ(after.fore.red, odd.red);
        EXPECT_EQ(after.fore.blue, odd.blue);
    });
    EXPECT_EQ(Only("Draw1Icon", drawn).size(), 1u);
}

TEST_F(TrackSelector, ShowsIcons61And62OfFamily1000) {
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] { Draw1Icon(1000, 61, 10, 20); }));
    button->SetState(1);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] { Draw1Icon(1000, 62, 10, 20); }));
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] { Draw1Icon(1000, 63, 10, 20); }));
}

TEST_F(TrackSelector, ShowsIcon63WhileItIsHeldDown) {
    Show();
    desktop.TakeDrawing();
    desktop.Play("press 12 22\nwait 0.1\nrelease");
    Lines const drawn = Only("Draw1Icon", desktop.TakeDrawing());
    ASSERT_FALSE(drawn.empty());
    EXPECT_EQ(drawn[0], Traced(*button, [] { Draw1Icon(1000, 63, 10, 20); })[0]);
}

TEST_F(TrackSelector, EachClickFlipsItsStateAndTellsTheListeners) {
    Listener listener;
    listener.DependUpon(button);
    Show();
    EXPECT_EQ(ResultOfClick("click 12 22"), -1);
    EXPECT_EQ(button->GetState(), 1);
    EXPECT_EQ(ResultOfClick("click 12 22"), -1);
    EXPECT_EQ(button->GetState(), 0);
    EXPECT_EQ(listener.releases, 2);
}

TEST_F(TrackSelector, WithoutListenersItStillFlips) {
    Show();
    EXPECT_EQ(ResultOfClick("click 12 22"), -1);
    EXPECT_EQ(button->GetState(), 1);
}

TEST_F(TrackSelector, SlidingOffTellsNobody) {
    Listener listener;
    listener.DependUpon(button);
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nwait 0.1\nmove 100 100\nwait 0.1\nrelease"), -1);
    EXPECT_EQ(listener.releases, 0);
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(TrackSelector, ItsStateIsNewWhenItsListenersAreTold) {
    Listener listener;
    listener.DependUpon(button);
    short state = -1;
    listener.onRelease = [&] { state = button->GetState(); };
    Show();
    desktop.Play("click 12 22");
    EXPECT_EQ(state, 1);
}

TEST_F(TrackSelector, AListenerMayDeleteIt) {
    Listener listener;
    listener.DependUpon(button);
    listener.onRelease = [&] { delete button; };
    Show();
    EXPECT_EQ(ResultOfClick("click 12 22"), -1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(TrackSelector, AListenerMayRemoveItself) {
    Listener listener, other;
    listener.DependUpon(button);
    other.DependUpon(button);
    listener.onRelease = [&] { listener.CancelDependency(button); };
    Show();
    desktop.Play("click 12 22\nclick 12 22");
    EXPECT_EQ(listener.releases, 1);
    EXPECT_EQ(other.releases, 2);
}

TEST_F(TrackSelector, HasAHelpTagForAllOfIt) {
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect place = {0, 0, 0, 0};
    OS::Help::Placement placement = OS::Help::kPlacementForParts;
    double delay = 0;
    EXPECT_TRUE(button->GetHelpTagForPoint(Point{22, 12}, tag, place, placement, delay));
    EXPECT_EQ(tag,
              LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector"));
    EXPECT_NE(tag, nullptr);
}

TEST_F(TrackSelector, IsFifteenBySixteenPixelsByNature) {
    GlogLayoutItem::Rep const &rep = LayoutEngine::Rep(*button->GetLayoutRect());
    EXPECT_EQ(rep.width, 15);
    EXPECT_EQ(rep.height, 16);
}

TEST_F(TrackSelector, TellsOnceHoweverLongItIsHeld) {
    Listener listener;
    listener.DependUpon(button);
    Show();
    desktop.Play("press 12 22\nwait 0.55\nrelease");
    EXPECT_EQ(listener.releases, 1);
}

TEST_F(TrackSelector, StaysUnattachedWithoutAGlog) {
    TrackSelectorButtonPane lonely(nullptr);
    EXPECT_EQ(lonely.GetGlog(), nullptr);
}
