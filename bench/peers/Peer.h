// What the comparison asks of a toolkit.
#pragma once

// One toolkit with one form at a time. Every operation that draws returns when its pixels are finished: in
// the window on the X server, or in memory.
class Peer {
public:
    virtual ~Peer() {}

    // Makes the form in a window of that height, not shown.
    virtual void Build(int boxes, int height) = 0;
    virtual void Destroy() = 0;
    // Shows the window at the screen's top left corner and draws it.
    virtual void Show() = 0;

    // Draws all of the window once more.
    virtual void Repaint() = 0;
    // Changes one check box, and draws what that damages.
    virtual void Toggle(int box) = 0;

    // Draws the form into memory of the toolkit's own choice.
    virtual void RepaintOffscreen() = 0;

    // Handles what has come.
    virtual void Settle() = 0;
    // Waits for events and handles them, until Heard is called or for a while.
    virtual void WaitUntilHeard() = 0;

protected:
    // To be called by the listener of every check box.
    void Heard();
};

// Every program has its own. Off screen there need not be a display.
Peer *NewPeer(bool offscreen, int &argc, char **argv);
