// A window of an X server.
#pragma once
#include "desktop/windows/PlatformWindow.h"
#include <cstdint>
#include <memory>
#include <vector>

struct SDL_Window;
class SdlPicture;
class SdlWindowSystem;

// Larger than its logical size by its scale. The window system must outlive it.
class SdlWindow : public PlatformWindow {
public:
    // Throws std::runtime_error with SDL's reason.
    SdlWindow(SdlWindowSystem &, WindowSpec const &, DeviceScale);
    ~SdlWindow() override;
    SdlWindow(SdlWindow const &) = delete;
    SdlWindow &operator=(SdlWindow const &) = delete;

    std::uint32_t Id() const { return id; } // SDL's number for it
    int Display() const;                    // index of the display that shows most of it
    SDL_Window *Raw() const { return window; }

    // The content's top left on the screen in device pixels.
    int ScreenX() const;
    int ScreenY() const;
    // The content's logical pixel at a place of the screen in device pixels.
    int ContentH(int screenX) const { return scale.ToLogical(screenX - ScreenX()); }
    int ContentV(int screenY) const { return scale.ToLogical(screenY - ScreenY()); }
    bool IsAtEdge(int x, int y) const; // of the content, in device pixels from its top left
    bool Contains(int h, int v) const { return h >= 0 && v >= 0 && h < width && v < height; }

    // The window manager has shown the window, and its frame's size is known: brings the content, not the
    // frame, to the place that was asked for.
    void CorrectPlace();
    // Looks at the size that the window has come to; whether it is another one in logical pixels.
    bool TakeSize();
    // The server has lost pixels of the window.
    void Lost();
    // Keeps the logical size, and so asks for another one in device pixels.
    void SetScale(DeviceScale);

    // PlatformWindow
    void Show() override;
    void Hide() override;
    void Raise() override;
    void SetTitle(std::string const &utf8) override;
    void SetPlace(int h, int v) override;
    void SetContentSize(int width, int height) override;
    void SetSizeLimits(int minWidth, int minHeight, int maxWidth, int maxHeight) override;
    int Width() const override { return width; }
    int Height() const override { return height; }
    Point ScreenPlace() const override;
    double Scale() const override { return scale.Factor(); }
    void Present(Surface const &, DeviceRect const *, std::size_t count) override;
    bool Move(PixelMove const &) override;
    bool CanMove() const override { return picture != nullptr; }
    void Finish() override;
    void StartTextInput(Rect const &caret) override;
    void StopTextInput() override;

private:
    struct SizeLimits {
        int minWidth, minHeight, maxWidth, maxHeight; // logical pixels; 0 is no limit
        bool operator==(SizeLimits const &other) const {
            return minWidth == other.minWidth && minHeight == other.minHeight && maxWidth == other.maxWidth &&
                   maxHeight == other.maxHeight;
        }
    };
    void ApplySizeLimits();
    bool HasPictureFor(Surface const &);
    void PresentBySdl(Surface const &);
    static int WholeLogicalPixels(DeviceScale, int device, int current);

    SdlWindowSystem &system;
    SDL_Window *window;
    std::uint32_t id;
    DeviceScale scale;
    int width, height; // logical pixels
    SizeLimits limits;
    bool placePending; // `placeH` and `placeV` wait for the frame
    int placeH, placeV;
    std::unique_ptr<SdlPicture> picture; // null: not yet, or SDL's is shown
    bool sharesMemory = true;            // as far as is known
    bool keptHidden = false;             // there are pixels of ours that could not be shown yet
    std::vector<DeviceRect> updated;     // of one Present; kept for its memory
};
