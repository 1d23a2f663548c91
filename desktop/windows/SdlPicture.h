// The pixels of a window on an X server, in memory that the server reads as well.
#pragma once
#include <cstddef>
#include <cstdint>
#include <memory>

struct SDL_Rect;
struct SDL_Window;

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

    std::uint32_t *Pixels() const;
    int Width() const;
    int Height() const;

    // Has the server copy the rectangles, which lie within the picture, to the window. What is drawn before
    // it has done so may be seen already. It is never behind by more than one call.
    void Show(SDL_Rect const *, std::size_t count);
    // Returns when the server has copied all that is to be shown.
    void Finish();

private:
    struct Shared;
    explicit SdlPicture(std::unique_ptr<Shared>);
    std::unique_ptr<Shared> shared;
};
