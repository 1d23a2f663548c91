// What the tests of real windows share: a window system on the X server that DISPLAY names, and a hand on its
// mouse and keys.
#pragma once
#include "desktop/drawing/Surface.h"
#include "desktop/windows/SdlWindowSystem.h"
#include "tests/window/XScreen.h"
#include <gtest/gtest.h>
#include <memory>
#include <string>
#include <vector>

class WindowTest : public testing::Test {
protected:
    typedef std::unique_ptr<PlatformWindow> Window;

    // Opens a window system of the scale in place of the last.
    void OpenSystem(double scale);
    void SetUp() override { OpenSystem(1.0); }
    SdlWindowSystem &System() { return *system; }

    static WindowSpec At(int h, int v, int width, int height);
    // A window that is shown, active and in its place. Its pictures have been asked for.
    Window Open(WindowSpec const &);
    void ShowActive(PlatformWindow &);

    // Takes events until one of the kind has come, and returns it; fails the test and gives kNone when it
    // does not come.
    InputEvent Await(InputEvent::Kind);
    // All events that come until nothing has come for a moment.
    std::vector<InputEvent> Drain();
    // The same, only those of the kind.
    std::vector<InputEvent> Drain(InputEvent::Kind);

    // Gives the steps to xdotool, which has done them when this returns.
    static void Do(std::string const &steps);
    // Moves the pointer to the place in the window.
    void PointAt(PlatformWindow const &, int h, int v);
    // Runs a command of the shell to its end while events are handled, and returns what it prints.
    std::string RunBeside(std::string const &command);
    // Expects the clipboard to come to hold the text: another program may take it after its command is over.
    void AwaitClipboard(std::string const &utf8);

    // Fills the window with a surface of one colour (0xRRGGBB).
    void Fill(PlatformWindow &, std::uint32_t colour);
    // Expects the screen to come to show the colour at the place in device pixels from the content's top
    // left.
    void ExpectPixel(PlatformWindow const &, int x, int y, std::uint32_t colour);
    XScreen const &Screen() const { return screen; }

private:
    std::unique_ptr<SdlWindowSystem> system;
    XScreen screen;
};
