// A window of a window system.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "host/Geometry.h"
#include <cstddef>
#include <memory>
#include <string>

class PlatformWindow;
class Surface;
struct PixelMove;

struct WindowSpec {
    std::string title;             // UTF-8
    int width = 320, height = 200; // logical pixels of content
    bool resizable = false;
    bool popup = false;  // no frame, above others, does not take the activation (menus, tool tips)
    bool placed = false; // `h` and `v` count; otherwise the system chooses the place
    int h = 0, v = 0;    // screen position of the content in logical pixels
    PlatformWindow *owner = nullptr; // of a pop-up
};

// Made hidden by WindowSystem::CreateWindow; destroying it closes it. Sizes and positions are logical pixels.
class PlatformWindow {
public:
    virtual ~PlatformWindow() {}
    virtual void Show() = 0;
    virtual void Hide() = 0;
    virtual void Raise() = 0;
    virtual void SetTitle(std::string const &utf8) = 0;
    virtual void SetPlace(int h, int v) = 0;
    virtual void SetContentSize(int width, int height) = 0; // answered by kResized when it came about
    // 0 is no limit.
    virtual void SetSizeLimits(int minWidth, int minHeight, int maxWidth, int maxHeight) = 0;
    virtual int Width() const = 0;
    virtual int Height() const = 0;
    virtual Point ScreenPlace() const = 0; // of the content's top left
    virtual double Scale() const = 0;
    // Copies the rectangles of the surface to the screen. They may reach beyond the surface; what does is not
    // copied. The screen may change only after the call has returned, but the surface is not read any more.
    virtual void Present(Surface const &, DeviceRect const *, std::size_t count) = 0;
    // Whether Move may do what it is asked for.
    virtual bool CanMove() const { return false; }
    // Moves what the screen shows as the pixels of the surface that was presented have been moved. False
    // where that cannot be done: then the box is to be presented.
    virtual bool Move(PixelMove const &) { return false; }
    // Returns when the screen shows all that was presented.
    virtual void Finish() {}
    // Lets an input method work at the place (content coordinates), or stops it.
    virtual void StartTextInput(Rect const &caret) = 0;
    virtual void StopTextInput() = 0;
};
