// One axis of a graph.
#pragma once

struct GraphAxisSetting {
    int dataMinimum, dataMaximum; // values at the ends of the axis
    int gridInterval; // from one grid line to the next, in the data's units; below 1 there are none
    int pixelMinimum, pixelMaximum; // where the ends are, in the graph's coordinates
};
