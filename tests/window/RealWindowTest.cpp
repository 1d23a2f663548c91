#include "desktop/drawing/PixelMove.h"
#include "tests/window/WindowTest.h"
#include <csignal>
#include <cstdlib>
#include <stdexcept>
#include <sys/resource.h>
#include <unistd.h>

namespace {
class RealWindow : public WindowTest {};
class Picture : public WindowTest {};
class PictureThatMoves : public WindowTest {}; // on a screen of all colours
class Wait : public WindowTest {};
class Clipboard : public WindowTest {};
class Scale : public WindowTest {};
class NoDisplay : public testing::Test {};

// Sets a variable of the environment for a while.
class Environment {
public:
    Environment(char const *name_, char const *value)
        : name(name_)
        , before(Get()) {
        setenv(name, value, 1);
    }
    ~Environment() { setenv(name, before.c_str(), 1); }
    Environment(Environment const &) = delete;
    Environment &operator=(Environment const &) = delete;

private:
    std::string Get() const {
        char const *value = std::getenv(name);
        return value != nullptr ? value : "";
    }
    char const *name;
    std::string before;
};
} // namespace

static long Switches() {
    rusage usage;
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_nvcsw;
}

TEST_F(NoDisplay, IsAnErrorThatSaysSo) {
    Environment none("DISPLAY", ":4711");
    try {
        SdlWindowSystem system;
        FAIL() << "a window system without a display";
    } catch (std::runtime_error const &error) {
        EXPECT_EQ(std::string(error.what()).find("no display"), 0U) << error.what();
    }
}

TEST_F(NoDisplay, IsAnErrorWhateverDriverTheEnvironmentNames) {
    Environment driver("SDL_VIDEODRIVER", "dummy"), none("DISPLAY", ":4711");
    EXPECT_THROW(SdlWindowSystem(), std::runtime_error);
}

TEST_F(RealWindow, IsHiddenUntilItIsShown) {
    Window window = System().CreateWindow(At(200, 150, 300, 200));
    for (InputEvent const &event : Drain())
        EXPECT_NE(event.kind, InputEvent::kExposed);
    ShowActive(*window);
    EXPECT_EQ(window->Width(), 300);
    EXPECT_EQ(window->Height(), 200);
}

TEST_F(RealWindow, StaysInItsPlaceWhenHiddenAndShownAgain) {
    Window window = Open(At(200, 150, 300, 200));
    window->Hide();
    Drain();
    window->SetPlace(250, 180);
    ShowActive(*window);
    EXPECT_EQ(window->ScreenPlace().h, 250);
    EXPECT_EQ(window->ScreenPlace().v, 180);
}

TEST_F(RealWindow, ItsTitleIsSeen) {
    Window window = Open(At(200, 150, 300, 200));
    window->SetTitle("Mixer \xC3\xA9");
    EXPECT_NE(RunBeside("xwininfo -root -tree -int").find("Mixer \xC3\xA9"), std::string::npos);
}

TEST_F(RealWindow, AnswersASizeThatItWasGiven) {
    Window window = Open(At(200, 150, 300, 200));
    window->SetContentSize(320, 240);
    InputEvent resized = Await(InputEvent::kResized);
    EXPECT_EQ(resized.window, window.get());
    EXPECT_EQ(resized.width, 320);
    EXPECT_EQ(resized.height, 240);
    EXPECT_EQ(window->Width(), 320);
    Drain();
    window->SetContentSize(320, 240);
    EXPECT_TRUE(Drain(InputEvent::kResized).empty());
}

TEST_F(RealWindow, ReportsTheUsersSizeOnce) {
    WindowSpec spec = At(200, 150, 300, 200);
    spec.resizable = true;
    Window window = Open(spec);
    Do("getactivewindow windowsize 350 260");
    std::vector<InputEvent> resizes = Drain(InputEvent::kResized);
    ASSERT_EQ(resizes.size(), 1U);
    EXPECT_EQ(resizes[0].width, 350);
    EXPECT_EQ(resizes[0].height, 260);
}

TEST_F(RealWindow, KeepsWithinItsSizeLimits) {
    WindowSpec spec = At(200, 150, 300, 200);
    spec.resizable = true;
    Window window = Open(spec);
    window->SetSizeLimits(250, 180, 400, 0);
    Drain();
    Do("getactivewindow windowsize 100 100");
    Await(InputEvent::kResized);
    Drain();
    EXPECT_EQ(window->Width(), 250);
    EXPECT_EQ(window->Height(), 180);
    Do("getactivewindow windowsize 600 600");
    Await(InputEvent::kResized);
    Drain();
    EXPECT_EQ(window->Width(), 400);
    EXPECT_EQ(window->Height(), 600);
}

TEST_F(RealWindow, SizeLimitsLeaveItWhereItIs) {
    WindowSpec spec = At(200, 150, 300, 200);
    spec.resizable = true;
    Window window = Open(spec);
    window->SetSizeLimits(250, 180, 400, 400);
    Drain();
    EXPECT_EQ(window->ScreenPlace().h, 200);
    EXPECT_EQ(window->ScreenPlace().v, 150);
    EXPECT_EQ(window->Width(), 300);
    EXPECT_EQ(window->Height(), 200);
}

TEST_F(RealWindow, AMoveByTheUserIsReported) {
    Window window = Open(At(200, 150, 300, 200));
    Do("getactivewindow windowmove 260 190");
    EXPECT_EQ(Await(InputEvent::kMoved).window, window.get());
    Point before = window->ScreenPlace();
    window->SetPlace(before.h + 5, before.v - 7);
    Drain();
    EXPECT_EQ(window->ScreenPlace().h, before.h + 5);
    EXPECT_EQ(window->ScreenPlace().v, before.v - 7);
}

TEST_F(RealWindow, ClosingIsARequestAndNothingElse) {
    Window window = Open(At(200, 150, 300, 200));
    Do("key alt+F4"); // of the window manager
    EXPECT_EQ(Await(InputEvent::kCloseRequested).window, window.get());
    EXPECT_TRUE(Drain(InputEvent::kQuit).empty());
}

TEST_F(RealWindow, TheLastWindowThatGoesDoesNotEndTheSession) {
    Window window = Open(At(200, 150, 300, 200));
    window.reset();
    EXPECT_TRUE(Drain(InputEvent::kQuit).empty());
}

TEST_F(RealWindow, TheActivationGoesFromOneToTheOther) {
    Window first = Open(At(100, 150, 200, 200)), second = Open(At(400, 150, 200, 200));
    PointAt(*first, 20, 20);
    Do("click 1");
    EXPECT_EQ(Await(InputEvent::kDeactivated).window, second.get());
    EXPECT_EQ(Await(InputEvent::kActivated).window, first.get());
    Drain();
    second->Raise();
    EXPECT_EQ(Await(InputEvent::kDeactivated).window, first.get());
    EXPECT_EQ(Await(InputEvent::kActivated).window, second.get());
}

TEST_F(RealWindow, TheScreenBoundsAreTheDisplays) {
    Rect bounds = System().ScreenBounds();
    EXPECT_EQ(bounds.left, 0);
    EXPECT_EQ(bounds.top, 0);
    EXPECT_EQ(bounds.right, 1024);
    EXPECT_EQ(bounds.bottom, 768);
}

TEST_F(RealWindow, AnEventForOneThatWasJustClosedDoesNotEndTheProgram) {
    Window window = Open(At(200, 150, 300, 200));
    Screen().SendToAWindowThatIsGone();
    window->SetTitle("still here");
}

TEST_F(RealWindow, AQuestionWhereOneLiesThatWasJustClosedDoesNotEndTheProgram) {
    Window window = Open(At(200, 150, 300, 200));
    Screen().LookForAWindowThatIsGone();
    window->SetTitle("still here");
}

TEST_F(RealWindow, TheTerminationSignalQuits) {
    Window window = Open(At(200, 150, 300, 200));
    std::system(("(sleep 0.3; kill -TERM " + std::to_string(getpid()) + ") &").c_str());
    EXPECT_EQ(Await(InputEvent::kQuit).window, nullptr);
}

TEST_F(RealWindow, ASignalFromBeforeALongPauseDoesNotWaitForItsEnd) {
    Window window = Open(At(200, 150, 300, 200));
    Drain();
    std::raise(SIGTERM);
    EXPECT_EQ(Await(InputEvent::kQuit).window, nullptr);
}

TEST_F(Picture, IsWhatTheSurfaceHolds) {
    Window window = Open(At(200, 150, 64, 48));
    Surface surface(64, 48);
    for (int y = 0; y < surface.Height(); ++y)
        for (int x = 0; x < surface.Width(); ++x)
            surface.Row(y)[x] = 0xFF000000U | static_cast<std::uint32_t>(x * 4 << 16 | y * 5 << 8 | (x ^ y));
    DeviceRect all = {0, 0, 64, 48};
    window->Present(surface, &all, 1);
    for (int y = 0; y < surface.Height(); y += 3)
        for (int x = 0; x < surface.Width(); x += 7)
            ExpectPixel(*window, x, y, surface.Row(y)[x] & 0xFFFFFFU);
}

TEST_F(Picture, OnlyThePresentedRectanglesChange) {
    Window window = Open(At(200, 150, 100, 80));
    Fill(*window, 0x102030);
    Surface surface(100, 80);
    std::fill(surface.Pixels(), surface.Row(80), 0xFFF0E0D0U);
    DeviceRect rects[] = {{10, 10, 20, 20}, {50, 30, 51, 31}};
    window->Present(surface, rects, 2);
    ExpectPixel(*window, 10, 10, 0xF0E0D0);
    ExpectPixel(*window, 19, 19, 0xF0E0D0);
    ExpectPixel(*window, 50, 30, 0xF0E0D0);
    ExpectPixel(*window, 9, 10, 0x102030);
    ExpectPixel(*window, 20, 19, 0x102030);
    ExpectPixel(*window, 51, 30, 0x102030);
}

TEST_F(Picture, RectanglesBeyondTheSurfaceAreCut) {
    Window window = Open(At(200, 150, 100, 80));
    Surface surface(100, 80);
    std::fill(surface.Pixels(), surface.Row(80), 0xFF336699U);
    DeviceRect rects[] = {{-500, -500, -10, -10}, {100, 0, 200, 80},       {90, 70, 5000, 5000},
                          {-20, -20, 5, 5},       {40, 40, 40, 60},        {60, 60, 50, 50},
                          {0, 80, 100, 90},       {5000, 5000, 6000, 6000}};
    window->Present(surface, rects, sizeof(rects) / sizeof(rects[0]));
    ExpectPixel(*window, 0, 0, 0x336699);
    ExpectPixel(*window, 4, 4, 0x336699);
    ExpectPixel(*window, 99, 79, 0x336699);
    Drain(); // an error of the X server would have ended the program
}

TEST_F(Picture, ASurfaceOfAnotherSizeThanTheWindowIsCut) {
    Window window = Open(At(200, 150, 100, 80));
    Fill(*window, 0x101010);
    Surface larger(150, 150), smaller(30, 30);
    std::fill(larger.Pixels(), larger.Row(150), 0xFF00A000U);
    std::fill(smaller.Pixels(), smaller.Row(30), 0xFFC00000U);
    DeviceRect everything = {0, 0, 1000, 1000};
    window->Present(larger, &everything, 1);
    window->Present(smaller, &everything, 1);
    ExpectPixel(*window, 29, 29, 0xC00000);
    ExpectPixel(*window, 30, 30, 0x00A000);
    ExpectPixel(*window, 99, 79, 0x00A000);
}

TEST_F(Picture, OnlyWhatIsPresentedIsShown) {
    Window window = Open(At(200, 150, 100, 80));
    Fill(*window, 0x102030);
    Surface surface(100, 80);
    std::fill(surface.Pixels(), surface.Row(80), 0xFFF0E0D0U);
    ExpectPixel(*window, 15, 15, 0x102030);
    DeviceRect rect = {10, 10, 20, 20};
    window->Present(surface, &rect, 1);
    ExpectPixel(*window, 19, 19, 0xF0E0D0);
    ExpectPixel(*window, 20, 19, 0x102030);
}

TEST_F(Picture, TheSurfaceMayChangeAsSoonAsItIsPresented) {
    Window window = Open(At(200, 150, 100, 80));
    Surface surface(100, 80);
    DeviceRect all = {0, 0, 100, 80};
    for (std::uint32_t shade = 0; shade < 0x40; ++shade) {
        std::fill(surface.Pixels(), surface.Row(80), 0xFF000000U | (shade << 16));
        window->Present(surface, &all, 1);
        std::fill(surface.Pixels(), surface.Row(80), 0xFF0000FFU);
        ASSERT_EQ(Screen().PixelAt(299, 229) >> 19, shade >> 3);
        ASSERT_EQ(Screen().PixelAt(299, 229) & 0xFFU, 0U);
    }
}

TEST_F(Picture, WhatIsPresentedAgainAfterItWasLostIsShownAgain) {
    Window below = Open(At(200, 150, 200, 150));
    Surface surface(200, 150);
    std::fill(surface.Pixels(), surface.Row(150), 0xFF336699U);
    DeviceRect all = {0, 0, 200, 150};
    below->Present(surface, &all, 1);
    Window above = Open(At(250, 180, 200, 150));
    Fill(*above, 0xC00000);
    above.reset();
    ASSERT_EQ(Await(InputEvent::kExposed).window, below.get());
    below->Present(surface, &all, 1);
    ExpectPixel(*below, 199, 149, 0x336699);
}

// Every row has a colour of its own.
std::uint32_t ColourOfRow(int y) { return static_cast<std::uint32_t>(y) * 0x010101U; }

void FillRows(Surface &surface, int from) {
    for (int y = 0; y < surface.Height(); ++y)
        std::fill(surface.Row(y), surface.Row(y) + surface.Width(), 0xFF000000U | ColourOfRow(y + from));
}

TEST_F(PictureThatMoves, NeedsNoPixels) {
    Window window = Open(At(200, 150, 100, 80));
    Drain();
    Surface surface(100, 80);
    FillRows(surface, 0);
    DeviceRect all = {0, 0, 100, 80}, uncovered = {0, 70, 100, 80};
    window->Present(surface, &all, 1);
    ASSERT_TRUE(window->Move({{0, 0, 100, 70}, 0, -10}));
    FillRows(surface, 10);
    window->Present(surface, &uncovered, 1);
    ExpectPixel(*window, 50, 0, ColourOfRow(10));
    ExpectPixel(*window, 50, 69, ColourOfRow(79));
    ExpectPixel(*window, 50, 79, ColourOfRow(89));
    EXPECT_TRUE(Drain(InputEvent::kExposed).empty());
}

TEST_F(PictureThatMoves, TwiceIsShownAgainWhereItIsPresented) {
    Window window = Open(At(200, 150, 100, 80));
    Surface surface(100, 80);
    FillRows(surface, 0);
    DeviceRect all = {0, 0, 100, 80};
    window->Present(surface, &all, 1);
    ASSERT_TRUE(window->Move({{0, 0, 100, 70}, 0, -10}));
    ASSERT_TRUE(window->Move({{0, 10, 100, 80}, 0, 10}));
    ExpectPixel(*window, 50, 10, ColourOfRow(10));
    ExpectPixel(*window, 50, 0, ColourOfRow(10)); // nothing moved into it
    window->Present(surface, &all, 1);
    ExpectPixel(*window, 50, 0, ColourOfRow(0));
}

TEST_F(PictureThatMoves, FromBehindAnotherWindowIsAskedFor) {
    Window below = Open(At(200, 150, 200, 150));
    Surface surface(200, 150);
    FillRows(surface, 0);
    DeviceRect all = {0, 0, 200, 150};
    below->Present(surface, &all, 1);
    Window above = Open(At(250, 200, 200, 150));
    Fill(*above, 0xC00000);
    Drain();
    ASSERT_TRUE(below->Move({{0, 0, 200, 90}, 0, -60}));
    EXPECT_EQ(Await(InputEvent::kExposed).window, below.get());
    FillRows(surface, 60);
    below->Present(surface, &all, 1);
    ExpectPixel(*below, 150, 10, ColourOfRow(70));
}

TEST_F(PictureThatMoves, HasToBeWhollyOnTheScreen) {
    Window window = System().CreateWindow(At(200, 150, 100, 80));
    PixelMove const move = {{0, 0, 100, 70}, 0, -10};
    EXPECT_FALSE(window->Move(move));
    Surface surface(100, 80), larger(120, 80);
    DeviceRect all = {0, 0, 120, 80}, part = {0, 0, 50, 80};
    window->Present(surface, &all, 1);
    EXPECT_FALSE(window->Move(move)) << "hidden";
    ShowActive(*window);
    Drain();
    window->Present(surface, &part, 1);
    EXPECT_FALSE(window->Move(move)) << "lost, and presented in part";
    window->Present(surface, &all, 1);
    EXPECT_TRUE(window->Move(move));
    window->Present(larger, &all, 1);
    EXPECT_FALSE(window->Move(move)) << "larger than the window";
}

TEST_F(Picture, AFewPixelsComeAfterTheManyBeforeThem) {
    Window window = Open(At(200, 150, 200, 150));
    Surface surface(200, 150);
    DeviceRect all = {0, 0, 200, 150}, few = {20, 10, 30, 20};
    for (std::uint32_t colour : {0x336699U, 0xC08040U}) {
        std::fill(surface.Pixels(), surface.Row(150), 0xFF000000U | colour);
        window->Present(surface, &all, 1);
        for (int y = few.top; y < few.bottom; ++y)
            std::fill(surface.Row(y) + few.left, surface.Row(y) + few.right, 0xFFF0E0D0U);
        window->Present(surface, &few, 1);
        ExpectPixel(*window, 20, 10, 0xF0E0D0);
        ExpectPixel(*window, 29, 19, 0xF0E0D0);
        ExpectPixel(*window, 19, 10, colour);
        ExpectPixel(*window, 30, 19, colour);
    }
}

TEST_F(Picture, MovesOnAScreenOfAllColoursOnly) {
    Window window = Open(At(200, 150, 100, 80));
    Fill(*window, 0x336699);
    EXPECT_EQ(window->Move({{0, 0, 100, 70}, 0, -10}), Screen().ColourBits() == 8);
}

TEST_F(Picture, ASurfaceOfTheOldSizeIsStillShownAfterAResize) {
    Window window = Open(At(200, 150, 100, 80));
    Surface surface(100, 80), larger(120, 90);
    DeviceRect all = {0, 0, 120, 90};
    window->SetContentSize(120, 90);
    Await(InputEvent::kResized);
    std::fill(surface.Pixels(), surface.Row(80), 0xFF00A000U);
    window->Present(surface, &all, 1);
    ExpectPixel(*window, 99, 79, 0x00A000);
    std::fill(larger.Pixels(), larger.Row(90), 0xFF336699U);
    window->Present(larger, &all, 1);
    ExpectPixel(*window, 119, 89, 0x336699);
}

TEST_F(Picture, ASurfaceLargerThanTheWindowIsShownWhereTheWindowIs) {
    Window window = Open(At(200, 150, 100, 80));
    Surface surface(300, 200);
    std::fill(surface.Pixels(), surface.Row(200), 0xFF336699U);
    DeviceRect const rects[] = {{0, 0, 300, 200}, {150, 100, 300, 200}};
    window->Present(surface, rects, 2);
    ExpectPixel(*window, 99, 79, 0x336699);
}

TEST_F(Picture, NothingToPresentIsNothing) {
    Window window = Open(At(200, 150, 100, 80));
    Fill(*window, 0x405060);
    Surface surface(100, 80);
    window->Present(surface, nullptr, 0);
    ExpectPixel(*window, 50, 40, 0x405060);
}

TEST_F(Picture, OfAWindowResizedIsPresentedInItsNewSize) {
    WindowSpec spec = At(200, 150, 100, 80);
    spec.resizable = true;
    Window window = Open(spec);
    Fill(*window, 0x804020);
    Do("getactivewindow windowsize 180 140");
    Await(InputEvent::kResized);
    Drain();
    Fill(*window, 0x208040);
    ExpectPixel(*window, 0, 0, 0x208040);
    ExpectPixel(*window, 179, 139, 0x208040);
}

TEST_F(Picture, IsAskedForWhenAnotherWindowWentFromAboveIt) {
    Window below = Open(At(200, 150, 200, 150)), above = Open(At(250, 180, 200, 150));
    above.reset();
    EXPECT_EQ(Await(InputEvent::kExposed).window, below.get());
}

TEST_F(Picture, OfAHiddenWindowIsNotPresented) {
    Window window = System().CreateWindow(At(200, 150, 100, 80));
    Fill(*window, 0x123456);
    window->Show();
    EXPECT_EQ(Await(InputEvent::kExposed).window, window.get());
}

TEST_F(Wait, WakesUpForNothingButEvents) {
    Window window = Open(At(200, 150, 300, 200));
    InputEvent event;
    long before = Switches();
    EXPECT_FALSE(System().WaitEvent(event, 2.0, WindowSystem::Waiter::kMainLoop, "a test"));
    EXPECT_LE(Switches() - before, 20);
}

TEST_F(Wait, WithoutAnyWindowWakesUpForNothingEither) {
    Drain();
    InputEvent event;
    long before = Switches();
    EXPECT_FALSE(System().WaitEvent(event, 2.0, WindowSystem::Waiter::kMainLoop, "a test"));
    EXPECT_LE(Switches() - before, 20);
}

TEST_F(Wait, IsNotDisturbedByTheMouseOverOtherWindows) {
    Window window = Open(At(200, 150, 300, 200));
    Do("mousemove 5 5");
    Drain();
    std::string steps; // as a mouse moves; to put the pointer to a place moves no mouse
    for (int i = 0; i < 100; ++i)
        steps += " mousemove_relative 1 0 sleep 0.005";
    InputEvent event;
    long before = Switches();
    ASSERT_EQ(std::system(("xdotool" + steps + " &").c_str()), 0);
    EXPECT_FALSE(System().WaitEvent(event, 3.0, WindowSystem::Waiter::kMainLoop, "a test"));
    EXPECT_LE(Switches() - before, 30);
    EXPECT_NE(RunBeside("xdotool getmouselocation").find("x:105 y:5 "), std::string::npos)
        << "it has moved all the way meanwhile";
}

TEST_F(Wait, WithTextInputOnWakesUpForNothingEither) {
    Window window = Open(At(200, 150, 300, 200));
    window->StartTextInput({0, 0, 20, 1});
    Drain();
    InputEvent event;
    long before = Switches();
    EXPECT_FALSE(System().WaitEvent(event, 2.0, WindowSystem::Waiter::kMainLoop, "a test"));
    EXPECT_LE(Switches() - before, 20);
}

TEST_F(Wait, LastsItsTimeAtLeast) {
    Window window = Open(At(200, 150, 300, 200));
    InputEvent event;
    double before = System().Now();
    EXPECT_FALSE(System().WaitEvent(event, 0.0605, WindowSystem::Waiter::kPause, "a test"));
    EXPECT_GE(System().Now() - before, 0.0605);
}

TEST_F(Wait, OfNoTimeTakesWhatThereIs) {
    Window window = Open(At(200, 150, 300, 200));
    InputEvent event;
    EXPECT_FALSE(System().WaitEvent(event, 0, WindowSystem::Waiter::kPause, "a test"));
    Do("key a");
    EXPECT_TRUE(System().WaitEvent(event, 0, WindowSystem::Waiter::kPause, "a test"));
    EXPECT_EQ(event.kind, InputEvent::kKeyDown);
}

TEST_F(Wait, WithoutEndIsEndedByAnEvent) {
    Window window = Open(At(200, 150, 300, 200));
    std::system("(sleep 0.3; xdotool key q) &");
    InputEvent event;
    EXPECT_TRUE(System().WaitEvent(event, -1, WindowSystem::Waiter::kMainLoop, "a test"));
    EXPECT_EQ(event.key, 'q');
}

TEST_F(Clipboard, GivesTextToOthers) {
    Window window = Open(At(200, 150, 300, 200));
    System().SetClipboardText("caf\xC3\xA9 \xE2\x99\xAA");
    EXPECT_EQ(System().GetClipboardText(), "caf\xC3\xA9 \xE2\x99\xAA");
    EXPECT_EQ(RunBeside("xclip -o -selection clipboard"), "caf\xC3\xA9 \xE2\x99\xAA");
}

TEST_F(Clipboard, TakesTextFromOthers) {
    Window window = Open(At(200, 150, 300, 200));
    RunBeside("printf 'na\xC3\xAFve' | xclip -i -selection clipboard >/dev/null 2>&1");
    AwaitClipboard("na\xC3\xAFve");
}

TEST_F(Clipboard, CanBeEmpty) {
    Window window = Open(At(200, 150, 300, 200));
    System().SetClipboardText("");
    EXPECT_EQ(System().GetClipboardText(), "");
}

TEST_F(Scale, MakesTheWindowLargerAndLeavesItsCoordinatesAlone) {
    OpenSystem(2.0);
    Window window = Open(At(100, 80, 150, 100));
    EXPECT_EQ(window->Width(), 150);
    EXPECT_EQ(window->Scale(), 2.0);
    Fill(*window, 0x7090B0);
    ExpectPixel(*window, 299, 199, 0x7090B0);
    PointAt(*window, 33, 44);
    Do("click 1");
    InputEvent press = Await(InputEvent::kMouseDown);
    EXPECT_EQ(press.h, 33);
    EXPECT_EQ(press.v, 44);
    EXPECT_EQ(System().ScreenBounds().right, 512);
}

TEST_F(Scale, OfFractionsGivesBackTheSizesItWasGiven) {
    OpenSystem(1.25);
    Window window = Open(At(80, 80, 103, 101));
    for (int width = 100; width < 108; ++width) {
        window->SetContentSize(width, 101);
        Drain();
        EXPECT_EQ(window->Width(), width);
        EXPECT_EQ(window->Height(), 101);
    }
}

TEST_F(Scale, ThatDoesNotDivideTheUsersSizeCoversAllOfIt) {
    OpenSystem(2.0);
    WindowSpec spec = At(100, 80, 150, 100);
    spec.resizable = true;
    Window window = Open(spec);
    Do("getactivewindow windowsize 321 241");
    InputEvent resized = Await(InputEvent::kResized);
    EXPECT_EQ(resized.width, 161);
    EXPECT_EQ(resized.height, 121);
    Fill(*window, 0xA0B0C0);
    ExpectPixel(*window, 320, 240, 0xA0B0C0);
}

TEST_F(Scale, ChangedAtRunTimeKeepsTheLogicalSize) {
    Window window = Open(At(100, 80, 150, 100));
    System().ForceScale(1.5);
    InputEvent changed = Await(InputEvent::kScaleChanged);
    EXPECT_EQ(changed.window, window.get());
    EXPECT_EQ(changed.scale, 1.5);
    EXPECT_EQ(window->Scale(), 1.5);
    EXPECT_TRUE(Drain(InputEvent::kResized).empty());
    EXPECT_EQ(window->Width(), 150);
    Fill(*window, 0x556677);
    ExpectPixel(*window, 224, 149, 0x556677);
    System().ForceScale(1.5);
    EXPECT_TRUE(Drain(InputEvent::kScaleChanged).empty());
}

TEST_F(Scale, IsByTheUsersSettingWhenNoneIsForced) {
    OpenSystem(0);
    EXPECT_EQ(System().CreateWindow(At(0, 0, 50, 50))->Scale(), 1.0);
    RunBeside("xprop -root -f RESOURCE_MANAGER 8s -set RESOURCE_MANAGER 'Xft.dpi:\t140\n'");
    OpenSystem(0);
    EXPECT_EQ(System().CreateWindow(At(0, 0, 50, 50))->Scale(), 1.5);
    RunBeside("xprop -root -remove RESOURCE_MANAGER");
}
