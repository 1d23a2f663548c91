// What an X server shows, seen by another client than the one under test.
#pragma once
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

class XScreen {
public:
    XScreen(); // throws std::runtime_error when the server that DISPLAY names does not answer
    ~XScreen();
    XScreen(XScreen const &) = delete;
    XScreen &operator=(XScreen const &) = delete;

    // The colour at the place of the screen, as 0xRRGGBB, when all that SDL's windows have sent is there.
    std::uint32_t PixelAt(int x, int y) const;
    // The same for a rectangle of the screen, row by row.
    std::vector<std::uint32_t> PixelsIn(int x, int y, int width, int height) const;
    // Moves the mouse to the place of the screen; returns when it is there.
    void PointAt(int x, int y) const;
    // Sends an event to a window that there is not, and asks where it lies, as happens when one closes at
    // that moment; return when the server has refused it.
    void SendToAWindowThatIsGone() const;
    void LookForAWindowThatIsGone() const;
    // The window that has the clipboard, 0 for none.
    unsigned long ClipboardOwner() const;
    // What the window manager says it knows, by name; LetManagerSay lets it say something else.
    std::vector<std::string> SaidByManager() const;
    void LetManagerSay(std::vector<std::string> const &names) const;
    // Bits of each of the colours red, green and blue that the screen can show.
    int ColourBits() const;

    struct PointerPicture {
        int width, height, hotX, hotY;
        std::uint32_t middle; // the pixel there, 0xAARRGGBB premultiplied
    };
    // The mouse pointer as it is shown now.
    PointerPicture Pointer() const;

private:
    struct Connection;
    std::unique_ptr<Connection> connection;
};
