#include "tests/window/WindowTest.h"
#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <future>

// Far longer than anything takes: a machine under load must not fail a test.
static double const kPatience = 10.0;
static double const kMoment = 0.25;
static double const kStep = 0.02;

void WindowTest::OpenSystem(double scale) {
    system.reset(); // there is one at a time
    system = std::make_unique<SdlWindowSystem>(scale);
}

WindowSpec WindowTest::At(int h, int v, int width, int height) {
    WindowSpec spec;
    spec.title = "window under test";
    spec.placed = true;
    spec.h = h;
    spec.v = v;
    spec.width = width;
    spec.height = height;
    return spec;
}

WindowTest::Window WindowTest::Open(WindowSpec const &spec) {
    Window window = System().CreateWindow(spec);
    ShowActive(*window);
    EXPECT_EQ(window->ScreenPlace().h, spec.h);
    EXPECT_EQ(window->ScreenPlace().v, spec.v);
    return window;
}

void WindowTest::ShowActive(PlatformWindow &window) {
    window.Show();
    EXPECT_EQ(Await(InputEvent::kActivated).window, &window);
    Drain();
}

InputEvent WindowTest::Await(InputEvent::Kind kind) {
    InputEvent event;
    double const end = System().Now() + kPatience;
    while (System().WaitEvent(event, end - System().Now(), WindowSystem::Waiter::kPause, "a test"))
        if (event.kind == kind)
            return event;
    ADD_FAILURE() << "no event of kind " << kind;
    return InputEvent();
}

std::vector<InputEvent> WindowTest::Drain() {
    std::vector<InputEvent> events;
    InputEvent event;
    while (System().WaitEvent(event, kMoment, WindowSystem::Waiter::kPause, "a test"))
        events.push_back(event);
    return events;
}

std::vector<InputEvent> WindowTest::Drain(InputEvent::Kind kind) {
    std::vector<InputEvent> events = Drain();
    events.erase(std::remove_if(events.begin(), events.end(),
                                [kind](InputEvent const &event) { return event.kind != kind; }),
                 events.end());
    return events;
}

void WindowTest::Do(std::string const &steps) {
    ASSERT_EQ(std::system(("xdotool " + steps).c_str()), 0) << steps;
}

void WindowTest::PointAt(PlatformWindow const &window, int h, int v) {
    DeviceScale scale(window.Scale());
    Point place = window.ScreenPlace();
    Do("mousemove " + std::to_string(scale.Edge(place.h) + scale.Edge(h)) + " " +
       std::to_string(scale.Edge(place.v) + scale.Edge(v)));
}

static std::string Output(std::string const &command) {
    std::string output;
    FILE *pipe = popen(command.c_str(), "r");
    if (pipe == nullptr)
        return output;
    for (int c = std::fgetc(pipe); c != EOF; c = std::fgetc(pipe))
        output.push_back(static_cast<char>(c));
    pclose(pipe);
    return output;
}

std::string WindowTest::RunBeside(std::string const &command) {
    std::future<std::string> output = std::async(std::launch::async, Output, command);
    InputEvent event;
    while (output.wait_for(std::chrono::seconds(0)) != std::future_status::ready)
        System().WaitEvent(event, kStep, WindowSystem::Waiter::kPause, "a test");
    return output.get();
}

void WindowTest::AwaitClipboard(std::string const &utf8) {
    double const end = System().Now() + kPatience;
    InputEvent event;
    while (System().GetClipboardText() != utf8 && System().Now() < end)
        System().WaitEvent(event, kStep, WindowSystem::Waiter::kPause, "a test");
    EXPECT_EQ(System().GetClipboardText(), utf8);
}

void WindowTest::Fill(PlatformWindow &window, std::uint32_t colour) {
    DeviceScale scale(window.Scale());
    Surface surface(scale.Edge(window.Width()), scale.Edge(window.Height()));
    std::fill(surface.Pixels(), surface.Row(surface.Height()), 0xFF000000U | colour);
    DeviceRect all = {0, 0, surface.Width(), surface.Height()};
    window.Present(surface, &all, 1);
}

// A screen of few colours shows the nearest that it has.
static bool IsNear(std::uint32_t one, std::uint32_t other, int bits) {
    int const step = 1 << (8 - bits);
    for (int shift : {0, 8, 16})
        if (std::abs(static_cast<int>((one >> shift) & 0xFF) - static_cast<int>((other >> shift) & 0xFF)) >=
            step)
            return false;
    return true;
}

void WindowTest::ExpectPixel(PlatformWindow const &window, int x, int y, std::uint32_t colour) {
    DeviceScale scale(window.Scale());
    Point place = window.ScreenPlace();
    x += scale.Edge(place.h);
    y += scale.Edge(place.v);
    double const end = System().Now() + kPatience;
    std::uint32_t shown = screen.PixelAt(x, y);
    InputEvent event;
    while (!IsNear(shown, colour, screen.ColourBits()) && System().Now() < end) {
        System().WaitEvent(event, kStep, WindowSystem::Waiter::kPause, "a test");
        shown = screen.PixelAt(x, y);
    }
    EXPECT_TRUE(IsNear(shown, colour, screen.ColourBits()))
        << std::hex << "shown " << shown << ", expected " << colour << " at " << std::dec << x << " " << y;
}
