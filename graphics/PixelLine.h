// A line through very many points.
#pragma once
#include <cstddef>
#include <vector>

class OSPort;

// Of points that follow each other in one column of pixels only those are kept that the line reaches furthest
// with, and those next to the other columns, on which its corners depend: it looks as if it went through all
// of them. A line that is still very long is stroked in pieces, since the time for a path grows with the
// square of its length; pieces overlap by a column.
class PixelLine {
public:
    void Add(int h, int v); // the next point, in pixels
    // Strokes the line with the port's colour and width, which must cover what is beneath. There is nothing
    // to add afterwards.
    void Stroke(OSPort &);

private:
    struct InColumn {
        int index, v;
    };
    struct Kept {
        int h, v;
        bool endsColumn;
        std::size_t columnStart; // among those that are kept
    };
    void EndColumn();
    void StrokePiece(OSPort &, std::size_t first, std::size_t last) const;

    std::vector<Kept> kept;
    int count = 0; // points of the column so far
    int h = 0;     // of the column
    InColumn first = {0, 0}, second = {0, 0}, top = {0, 0}, bottom = {0, 0}, beforeLast = {0, 0},
             last = {0, 0};
};
