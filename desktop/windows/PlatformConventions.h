// What windows of the platform look like.
#pragma once

// Settings of the desktop that panes ask for by way of OS::Services; set them before panes are made.
struct PlatformConventions {
    static bool scrollArrowsTogetherAtEnd; // default false: an arrow at either end of a scroll bar
    static bool showsGrowBoxes;            // default true
};
