// The pixels of a window on an X server, in memory that the server reads as well.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstddef>
#include <memory>

struct SDL_Window;
class Surface;
struct PixelMove;

// SDL has such memory too, but waits for the server's answer each time some of it is shown. Here a program
// goes on while the server copies: at a click that wait would cost as much as all the rest.
class SdlPicture {
public:
    // Null where memory cannot be shared, as on a server of another machine, and where its pixels are not
    // 0x00RRGGBB in 32 bits. The window must outlive the picture.
    static std::unique_ptr<SdlPicture> New(SDL_Window *, int width, int height);
    ~SdlPicture();
    SdlPicture(SdlPicture const &) = delete;
    SdlPicture &operator=(SdlPicture const &) = delete;

    int Width() const;
    int Height() const;

    // Takes over what has changed within the rectangles from the surface, which must be as large as the
    // picture, as the rectangles must lie within it, and has the server copy that to the window. The surface
    // is not read any more when the call returns. The server is never behind by more than one call.
    void Show(Surface const &, DeviceRect const *, std::size_t count);
    // The same for a window that is not on the screen yet; ShowAll is to follow.
    void Keep(Surface const &, DeviceRect const *, std::size_t count);
    // Has the server copy all that was taken over.
    void ShowAll();
    // Has the server move what the window shows; Show is for what was not in the window before. False where
    // the server may not have all of that: then the box is to be shown. What lies behind another window only
    // comes to light when the server has said so: SdlWindow::Lost is called for it.
    bool Move(PixelMove const &);
    // The server has lost what it showed.
    void Forget();
    // Returns when the server has copied all that is to be shown.
    void Finish();

private:
    struct Shared;
    explicit SdlPicture(std::unique_ptr<Shared>);
    std::unique_ptr<Shared> shared;
};
