// Where a graph's points come from.
#pragma once

struct GraphDataPoint {       // in the units of the data
    int horizontal, vertical; // to the right, and up
};

// Made by the program, owned by the graph.
class GraphData {
public:
    GraphData() {}
    GraphData(GraphData const &) {}
    virtual ~GraphData() {}

    // Both are asked at every redraw. Below 1 there is nothing to draw.
    virtual int CountPoints() = 0;                  // how many there are
    virtual GraphDataPoint GetPoint(int index) = 0; // from 0
};
