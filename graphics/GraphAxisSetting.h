// One axis of a graph.
#pragma once

struct GraphAxisSetting {
    int dataMinimum, dataMaximum; // values at the ends of the axis
    // From one grid line to the next, in the data's units. Below 1, and where that would be more lines than
    // 65536, there are none.
    int gridInterval;
    int pixelMinimum, pixelMaximum; // where the ends are, in the graph's coordinates
};
