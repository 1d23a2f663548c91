// What every comparison with FLTK 1.3 begins with.
#pragma once
#include <string>

class FltkToolkit {
public:
    FltkToolkit(); // with the font that all toolkits use, as FL_HELVETICA

    // Draws what is damaged, and waits for the server.
    static void Finish();
    // Handles what has come, and waits for the server.
    static void Settle();
    // Waits for events and handles them, until `over` or for a while.
    static void WaitUntil(bool const &over);

private:
    std::string font; // FLTK keeps the pointer
};
