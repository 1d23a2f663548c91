// What windows of the platform look like, and how its mouse is used.
#pragma once

// Settings of the desktop. What panes ask for by way of OS::Services is set before panes are made.
struct PlatformConventions {
    static bool scrollArrowsTogetherAtEnd; // default false: an arrow at either end of a scroll bar
    static bool showsGrowBoxes;            // default true
    // Two presses make a double click when they are no farther apart than this.
    static double doubleClickSeconds; // default 0.5
    static int doubleClickDistance;   // logical pixels in either direction, default 4: two quick clicks on
                                      // small controls side by side are no double click on the second
};
