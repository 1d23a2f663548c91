// A window full of panes.
#pragma once
#include "desktop/SimulatedDesktop.h"
#include "host/Geometry.h"

class OvalButtonPane;
struct glogRec;

// Oval, stud and frame buttons and labels, 200 in all, in rows and columns; shown and drawn.
class BenchPage {
public:
    static constexpr int kColumns = 10, kRows = 20;
    static constexpr short kColumnWidth = 100, kRowHeight = 30; // pixels
    static constexpr short kWidth = kColumns * kColumnWidth, kHeight = kRows * kRowHeight;

    BenchPage();

    glogRec *Glog() const { return glog; }
    // One of the buttons, somewhere in the middle, and where to click it.
    OvalButtonPane &Button() const { return *button; }
    static Point PlaceOfButton();

    // Redraws what the rectangle covers, and shows it.
    void Redraw(Rect const &);

    SimulatedDesktop desktop;

private:
    void AddPane(int place);

    glogRec *glog;
    OvalButtonPane *button = nullptr;
};
