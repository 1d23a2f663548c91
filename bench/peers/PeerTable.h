// What the comparison of lists asks of a toolkit.
#pragma once
#include <string>

// A window with a list of 1,000,000 rows in 3 columns of text, without headings. A click selects one row.
// Every operation that draws returns when its pixels are finished in the window.
class PeerTable {
public:
    static int const kRows = 1000000, kColumns = 3, kRowHeight = 20, kWidth = 600, kHeight = 400; // pixels
    static int const kBarWidth = 16, kColumnWidth = (kWidth - kBarWidth) / kColumns;

    virtual ~PeerTable() {}

    // Makes the list, and shows it with its window until it is drawn.
    virtual void Show() = 0;
    // Draws all of the list once more.
    virtual void Repaint() = 0;
    // Makes the row, from 0, the first one that shows.
    virtual void ScrollTo(int row) = 0;
    // Handles what has come.
    virtual void Settle() = 0;
    // Waits for events and handles them, until Heard is called or for a while.
    virtual void WaitUntilHeard() = 0;

protected:
    // To be called by the listener of the selection, when a row has been selected.
    static void Heard();

    // What stands in a cell: made anew at each call, as by a program that reads it from somewhere.
    static std::string TextOf(int row, int column) {
        int const number = row + 1, seconds = row * 7 % 3600;
        switch (column) {
        case 0:
            return std::to_string(number);
        case 1:
            return "Region " + std::to_string(number % 5000);
        default:
            return std::to_string(seconds / 60) + (seconds % 60 < 10 ? ":0" : ":") +
                   std::to_string(seconds % 60);
        }
    }
};

// Every program has its own.
PeerTable *NewPeerTable(int &argc, char **argv);
