// What is held down, and where the pointer is, as the taken events tell.
#pragma once
#include "desktop/windows/InputEvent.h"
#include <set>

// Follows the events as a program takes them, not as they happen: a program that still has a release to take
// sees the button held.
class InputState {
public:
    void Take(InputEvent const &);
    // Forgets what refers to the window: it is about to be destroyed.
    void Forget(PlatformWindow const *);

    bool IsMouseDown() const { return primaryDown; }
    bool IsKeyPressed(int keyCode) const { return keys.count(keyCode) != 0; }
    unsigned short CurrentModifiers() const { return modifiers; }

    // The window whose mouse event was taken last, and the place in it; null before the first and when the
    // window is gone.
    PlatformWindow *PointerWindow() const { return pointerWindow; }
    int PointerH() const { return pointerH; }
    int PointerV() const { return pointerV; }

private:
    bool primaryDown = false;
    std::set<int> keys;
    unsigned short modifiers = 0;
    PlatformWindow *pointerWindow = nullptr;
    int pointerH = 0, pointerV = 0;
};
