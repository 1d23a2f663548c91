// The keyboard of an X server, and its input method.
#pragma once
#include "desktop/windows/InputQueue.h"
#include <cstdint>
#include <map>
#include <string>

struct SDL_KeyboardEvent;
struct Rect;

// Makes the events of keys and text. While text input is on, what a key types is what the keyboard's layout
// or the input method says; while it is off, as SdlKeys::TextOf guesses.
//
// The calls take the event with its time filled in, and the window that SDL names; null for none of ours.
class SdlKeyboard {
public:
    explicit SdlKeyboard(InputQueue &);

    // Bits of Modifiers, as of the last key.
    unsigned short CurrentModifiers() const { return modifiers; }

    void Press(InputEvent, PlatformWindow *, SDL_KeyboardEvent const &);
    // With the code of the press, even when a modifier has changed since what the key means.
    void Release(InputEvent, PlatformWindow *, SDL_KeyboardEvent const &);
    // Text joins the press before it that typed it; otherwise it is an event of its own.
    void CommitText(InputEvent, PlatformWindow *, std::string const &utf8);
    void EditText(InputEvent, PlatformWindow *, std::string const &utf8, int caret);

    // Text input goes to one window at a time.
    void StartTextInput(PlatformWindow *);
    void StopTextInput(PlatformWindow const *);
    // Whether an input method may have something to say that no event of the X server announces.
    bool MustAskInputMethod() const;
    // The window is about to be destroyed.
    void Forget(PlatformWindow const *);

private:
    PlatformWindow *WindowForText(PlatformWindow *) const;

    InputQueue &queue;
    unsigned short modifiers = 0;
    std::map<int, int> pressed; // SDL's scan code of each key that is down, and our code
    PlatformWindow *textWindow = nullptr;
    bool inputMethod; // the session names one
};
