#include "tests/window/WindowTest.h"

namespace {
class Mouse : public WindowTest {};
class Popup : public WindowTest {};
} // namespace

TEST_F(Mouse, AClickIsAPressAndAReleaseAtItsPlace) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click 1");
    InputEvent press = Await(InputEvent::kMouseDown), release = Await(InputEvent::kMouseUp);
    EXPECT_EQ(press.window, window.get());
    EXPECT_EQ(press.h, 40);
    EXPECT_EQ(press.v, 30);
    EXPECT_EQ(press.button, 1);
    EXPECT_EQ(press.clicks, 1);
    EXPECT_EQ(press.modifiers, 0);
    EXPECT_EQ(release.window, window.get());
    EXPECT_EQ(release.h, 40);
    EXPECT_EQ(release.v, 30);
    EXPECT_EQ(release.button, 1);
    EXPECT_GE(release.time, press.time);
}

TEST_F(Mouse, TheOtherButtonsAreSecondaryAndMiddle) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click 3");
    EXPECT_EQ(Await(InputEvent::kMouseDown).button, 2);
    EXPECT_EQ(Await(InputEvent::kMouseUp).button, 2);
    Do("click 2");
    EXPECT_EQ(Await(InputEvent::kMouseDown).button, 3);
    EXPECT_EQ(Await(InputEvent::kMouseUp).button, 3);
}

TEST_F(Mouse, ButtonsBeyondThreeAreNotReported) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click 8");
    for (InputEvent const &event : Drain())
        EXPECT_EQ(event.kind, InputEvent::kMouseMove);
}

TEST_F(Mouse, TwoQuickClicksAtOnePlaceAreADoubleClick) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click --repeat 2 --delay 20 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 1);
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 2);
    EXPECT_EQ(Await(InputEvent::kMouseUp).clicks, 2);
}

TEST_F(Mouse, TwoQuickClicksApartAreSingle) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click 1 mousemove_relative 12 0 click 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 1);
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 1);
}

TEST_F(Mouse, ThePlaceOfADoubleClickIsJudgedInLogicalPixels) {
    OpenSystem(2.0);
    Window window = Open(At(100, 80, 200, 150));
    PointAt(*window, 40, 30);
    Do("click 1 mousemove_relative 8 0 click 1 mousemove_relative 10 0 click 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 1);
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 2);
    EXPECT_EQ(Await(InputEvent::kMouseDown).clicks, 1);
}

TEST_F(Mouse, AClickInAnotherWindowStartsToCountAnew) {
    Window left = Open(At(100, 150, 200, 200)), right = Open(At(400, 150, 200, 200));
    PointAt(*left, 40, 30);
    Do("click 1 mousemove_relative 300 0 click --repeat 2 --delay 20 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).window, left.get());
    InputEvent second = Await(InputEvent::kMouseDown), third = Await(InputEvent::kMouseDown);
    EXPECT_EQ(second.window, right.get());
    EXPECT_EQ(second.clicks, 1);
    EXPECT_EQ(third.clicks, 2);
}

TEST_F(Mouse, ADragGoesOnOutsideTheWindow) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1 mousemove 280 240");
    Await(InputEvent::kMouseDown);
    InputEvent outside = Await(InputEvent::kMouseMove);
    EXPECT_EQ(outside.window, window.get());
    EXPECT_EQ(outside.h, -20);
    EXPECT_EQ(outside.v, -10);
    EXPECT_TRUE(System().IsMouseDown());
    Do("mousemove 600 500 mouseup 1");
    InputEvent release = Await(InputEvent::kMouseUp);
    EXPECT_EQ(release.window, window.get());
    EXPECT_EQ(release.h, 300);
    EXPECT_EQ(release.v, 250);
    EXPECT_FALSE(System().IsMouseDown());
}

TEST_F(Mouse, ADragThatLeapsOutAfterARestIsFollowed) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1");
    Drain();
    Do("mousemove 600 500");
    EXPECT_EQ(Await(InputEvent::kMouseMove).h, 300);
    Drain();
    Do("mousemove 620 510");
    InputEvent outside = Await(InputEvent::kMouseMove);
    EXPECT_EQ(outside.h, 320);
    EXPECT_EQ(outside.v, 260);
    Do("mouseup 1");
    EXPECT_EQ(Await(InputEvent::kMouseUp).h, 320);
    EXPECT_FALSE(System().IsMouseDown());
}

TEST_F(Mouse, ADragMayComeBackAndGoOutAgain) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1 mousemove 280 240");
    Drain();
    Do("mousemove 320 270");
    EXPECT_EQ(Await(InputEvent::kMouseMove).h, 20);
    Do("mousemove 600 500");
    EXPECT_EQ(Await(InputEvent::kMouseMove).h, 300);
    Do("mouseup 1");
    EXPECT_EQ(Await(InputEvent::kMouseUp).h, 300);
}

TEST_F(Mouse, ADragOverAnotherWindowBelongsToTheWindowOfThePress) {
    Window left = Open(At(100, 150, 200, 200)), right = Open(At(400, 150, 200, 200));
    PointAt(*left, 40, 30);
    Do("mousedown 1 mousemove 450 200 mouseup 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).window, left.get());
    InputEvent release = Await(InputEvent::kMouseUp);
    EXPECT_EQ(release.window, left.get());
    EXPECT_EQ(release.h, 350);
    EXPECT_EQ(release.v, 50);
}

TEST_F(Mouse, ADragThatBeginsInAnInactiveWindowGoesOnOutsideOfIt) {
    Window inactive = Open(At(400, 150, 200, 200)), active = Open(At(100, 150, 200, 200));
    PointAt(*inactive, 40, 30);
    Do("mousedown 1");
    Drain(); // the press and the activation, in an order that the window manager chooses
    EXPECT_TRUE(System().IsMouseDown());
    Do("mousemove 700 500");
    InputEvent outside = Await(InputEvent::kMouseMove);
    EXPECT_EQ(outside.window, inactive.get());
    EXPECT_EQ(outside.h, 300);
    EXPECT_EQ(outside.v, 350);
    Do("mousemove 720 510 mouseup 1");
    InputEvent release = Await(InputEvent::kMouseUp);
    EXPECT_EQ(release.window, inactive.get());
    EXPECT_EQ(release.h, 320);
    EXPECT_EQ(release.v, 360);
}

TEST_F(Mouse, WithTwoButtonsHeldTheDragEndsWithTheLast) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1 mousedown 3 mouseup 1 mousemove 600 500 mouseup 3");
    EXPECT_EQ(Await(InputEvent::kMouseUp).button, 1);
    InputEvent release = Await(InputEvent::kMouseUp);
    EXPECT_EQ(release.button, 2);
    EXPECT_EQ(release.window, window.get());
    EXPECT_EQ(release.h, 300);
}

TEST_F(Mouse, ARunOfMovesIsTakenAsItsLast) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 10, 10);
    Drain();
    Do("mousemove_relative 1 0 mousemove_relative 1 0 mousemove_relative 1 0 mousemove_relative 1 0");
    std::vector<InputEvent> moves = Drain(InputEvent::kMouseMove);
    ASSERT_EQ(moves.size(), 1U);
    EXPECT_EQ(moves[0].h, 14);
}

TEST_F(Mouse, MovesBeforeAndAfterAPressStayApart) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 10, 10);
    Drain();
    Do("mousemove_relative 1 0 mousedown 1 mousemove_relative 1 0 mouseup 1");
    std::vector<InputEvent> events = Drain();
    ASSERT_EQ(events.size(), 4U);
    EXPECT_EQ(events[0].kind, InputEvent::kMouseMove);
    EXPECT_EQ(events[0].h, 11);
    EXPECT_EQ(events[1].kind, InputEvent::kMouseDown);
    EXPECT_EQ(events[1].h, 11);
    EXPECT_EQ(events[2].kind, InputEvent::kMouseMove);
    EXPECT_EQ(events[2].h, 12);
    EXPECT_EQ(events[3].kind, InputEvent::kMouseUp);
}

TEST_F(Mouse, TheStateIsThatOfTheLastEventTaken) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 10, 10);
    Do("mousedown 1 mousemove_relative 30 0 mouseup 1");
    Await(InputEvent::kMouseDown);
    EXPECT_TRUE(System().IsMouseDown());
    EXPECT_EQ(System().MousePlace(*window).h, 10);
    Await(InputEvent::kMouseMove);
    EXPECT_TRUE(System().IsMouseDown());
    EXPECT_EQ(System().MousePlace(*window).h, 40);
    Await(InputEvent::kMouseUp);
    EXPECT_FALSE(System().IsMouseDown());
}

TEST_F(Mouse, OnlyThePrimaryButtonIsTheMouseButton) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 10, 10);
    Do("mousedown 3");
    Await(InputEvent::kMouseDown);
    EXPECT_FALSE(System().IsMouseDown());
    Do("mouseup 3");
    Await(InputEvent::kMouseUp);
}

TEST_F(Mouse, ThePlaceInAnotherWindowIsKnown) {
    Window left = Open(At(100, 150, 200, 200)), right = Open(At(400, 150, 200, 200));
    PointAt(*left, 40, 30);
    Drain();
    EXPECT_EQ(System().MousePlace(*left).h, 40);
    EXPECT_EQ(System().MousePlace(*right).h, 40 - 300);
    EXPECT_EQ(System().MousePlace(*right).v, 30);
}

TEST_F(Mouse, LeavingTheWindowIsReportedOnce) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Drain();
    Do("mousemove 100 100 mousemove 120 100");
    std::vector<InputEvent> events = Drain(InputEvent::kMouseLeave);
    ASSERT_EQ(events.size(), 1U);
    EXPECT_EQ(events[0].window, window.get());
    EXPECT_LT(events[0].h, 0);
    EXPECT_LT(events[0].v, 0);
}

TEST_F(Mouse, ADragOutOfTheWindowLeavesItWithTheRelease) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1 mousemove 100 100");
    EXPECT_TRUE(Drain(InputEvent::kMouseLeave).empty());
    Do("mouseup 1");
    std::vector<InputEvent> events = Drain();
    ASSERT_EQ(events.size(), 2U);
    EXPECT_EQ(events[0].kind, InputEvent::kMouseUp);
    EXPECT_EQ(events[1].kind, InputEvent::kMouseLeave);
}

TEST_F(Mouse, TheWheelIsPositiveTowardTheTopAndTheLeft) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("click 4");
    InputEvent up = Await(InputEvent::kWheel);
    EXPECT_EQ(up.window, window.get());
    EXPECT_EQ(up.h, 40);
    EXPECT_EQ(up.v, 30);
    EXPECT_EQ(up.wheelV, 1.0);
    EXPECT_EQ(up.wheelH, 0.0);
    Do("click 5");
    EXPECT_EQ(Await(InputEvent::kWheel).wheelV, -1.0);
    Do("click 6");
    EXPECT_EQ(Await(InputEvent::kWheel).wheelH, 1.0);
    Do("click 7");
    InputEvent right = Await(InputEvent::kWheel);
    EXPECT_EQ(right.wheelH, -1.0);
    EXPECT_EQ(right.wheelV, 0.0);
}

TEST_F(Mouse, ModifiersComeWithClicks) {
    Window window = Open(At(200, 150, 300, 200));
    PointAt(*window, 40, 30);
    Do("keydown shift keydown ctrl click 1 keyup ctrl click 1 keyup shift click 1");
    EXPECT_EQ(Await(InputEvent::kMouseDown).modifiers, Modifiers::kShift | Modifiers::kCommand);
    EXPECT_EQ(Await(InputEvent::kMouseDown).modifiers, Modifiers::kShift);
    EXPECT_EQ(Await(InputEvent::kMouseDown).modifiers, 0);
}

TEST_F(Mouse, LosingTheActivationToNobodyReleasesTheButton) {
    Window window = Open(At(300, 250, 200, 100));
    PointAt(*window, 20, 20);
    Do("mousedown 1");
    Await(InputEvent::kMouseDown);
    // The window manager gives the focus to what was pressed, at a time of its own: it can take the focus
    // back once.
    for (int tries = 0; tries < 20 && System().IsMouseDown(); ++tries) {
        RunBeside("xdotool windowfocus $(xwininfo -root -int | awk '/Window id/ { print $4 }')");
        Drain();
    }
    EXPECT_FALSE(System().IsMouseDown());
    Do("mouseup 1");
    EXPECT_TRUE(Drain(InputEvent::kMouseUp).empty());
}

TEST_F(Mouse, EventsForAWindowThatIsGoneAreDropped) {
    Window kept = Open(At(100, 150, 200, 200)), gone = Open(At(400, 150, 200, 200));
    PointAt(*gone, 40, 30);
    Do("mousedown 1 key a");
    Await(InputEvent::kMouseDown);
    gone.reset();
    EXPECT_FALSE(System().IsMouseDown());
    Do("mouseup 1");
    for (InputEvent const &event : Drain())
        EXPECT_EQ(event.window, kept.get());
    EXPECT_FALSE(System().IsKeyPressed('a'));
}

TEST_F(Popup, ComesToItsPlaceAndLeavesTheActivationAlone) {
    Window owner = Open(At(100, 150, 200, 200));
    WindowSpec spec = At(333, 222, 120, 80);
    spec.popup = true;
    spec.owner = owner.get();
    Window popup = System().CreateWindow(spec);
    popup->Show();
    EXPECT_EQ(Await(InputEvent::kExposed).window, popup.get());
    EXPECT_EQ(popup->ScreenPlace().h, 333);
    EXPECT_EQ(popup->ScreenPlace().v, 222);
    Fill(*popup, 0x2040C0);
    ExpectPixel(*popup, 0, 0, 0x2040C0);
    ExpectPixel(*popup, 119, 79, 0x2040C0);
    for (InputEvent const &event : Drain()) {
        EXPECT_NE(event.kind, InputEvent::kActivated);
        EXPECT_NE(event.kind, InputEvent::kDeactivated);
    }
}

TEST_F(Popup, WithTheCaptureAClickAnywhereIsItsOwn) {
    Window owner = Open(At(100, 150, 200, 200));
    WindowSpec spec = At(400, 200, 120, 80);
    spec.popup = true;
    spec.owner = owner.get();
    Window popup = System().CreateWindow(spec);
    popup->Show();
    Drain();
    System().CaptureMouse(popup.get());
    Do("mousemove 410 220 click 1");
    InputEvent inside = Await(InputEvent::kMouseDown);
    EXPECT_EQ(inside.window, popup.get());
    EXPECT_EQ(inside.h, 10);
    EXPECT_EQ(inside.v, 20);
    Do("mousemove 120 180 click 1");
    InputEvent overOwner = Await(InputEvent::kMouseDown);
    EXPECT_EQ(overOwner.window, popup.get());
    EXPECT_EQ(overOwner.h, 120 - 400);
    Do("mousemove 900 700 click 1");
    InputEvent overNothing = Await(InputEvent::kMouseDown);
    EXPECT_EQ(overNothing.window, popup.get());
    EXPECT_EQ(overNothing.h, 500);
    EXPECT_EQ(overNothing.v, 500);
    System().CaptureMouse(nullptr);
    Drain();
    PointAt(*owner, 5, 5);
    EXPECT_EQ(Await(InputEvent::kMouseMove).window, owner.get());
}
