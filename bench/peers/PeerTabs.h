// What the comparison of tabs asks of a toolkit.
#pragma once
#include <string>

// A window with one row of 40 tabs. Every operation returns when its pixels are finished in the window.
class PeerTabs {
public:
    static int const kTabs = 40, kWidest = 2000, kNarrowest = 100, kHeight = 40; // pixels

    virtual ~PeerTabs() {}

    // Makes the row, as wide as it may get, and shows it.
    virtual void Show() = 0;
    // Gives the row another width, which it does with in its way, and draws it.
    virtual void SetWidth(int width) = 0;
    // Handles what has come.
    virtual void Settle() = 0;

protected:
    static std::string NameOf(int tab) { return "Ch " + std::to_string(tab + 1); }
};

// Every program has its own.
PeerTabs *NewPeerTabs(int &argc, char **argv);
