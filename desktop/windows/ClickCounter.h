// Which presses of a mouse button belong together.
#pragma once

struct InputEvent;
class PlatformWindow;

// Counts presses of one button that follow each other within PlatformConventions::doubleClickSeconds, each no
// farther than doubleClickDistance from the one before, in one window.
class ClickCounter {
public:
    // 1 for a press that begins anew, 2 for the second of a double click, and so on. The press has its
    // window, button, place and time.
    int Count(InputEvent const &press);
    // The press has a count of its own, from which the next goes on.
    void Take(InputEvent const &press, int count);
    // The window is about to be destroyed.
    void Forget(PlatformWindow const *);

private:
    bool GoesOn(InputEvent const &press) const;

    PlatformWindow const *window = nullptr; // of the last press; null before the first
    int button = 0;
    int h = 0, v = 0;
    double time = 0;
    int count = 0;
};
