// What the comparison of scrolling asks of a toolkit.
#pragma once
#include <string>

// A window with 1,000 labels, one below the other, in a view that scrolls. Every operation returns when its
// pixels are finished in the window.
class PeerList {
public:
    static int const kLabels = 1000, kRowHeight = 20, kWidth = 300, kHeight = 600, kBarWidth = 16; // pixels

    virtual ~PeerList() {}

    // Makes the list and shows it.
    virtual void Show() = 0;
    // Brings the view to a position in pixels, and draws what that uncovers.
    virtual void ScrollTo(int position) = 0;
    // Handles what has come.
    virtual void Settle() = 0;

protected:
    static std::string TextOf(int label) { return "Region " + std::to_string(label + 1); }
};

// Every program has its own.
PeerList *NewPeerList(int &argc, char **argv);
