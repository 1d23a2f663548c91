// A line through very many points.
#pragma once

class OSPath;

// Appends one subpath to a path. Of points that follow each other in one column of pixels only those are kept
// that the line reaches furthest with, and those next to the other columns, on which its corners depend:
// stroked, it looks as if it went through all of them.
class PixelLine {
public:
    // The path must outlive this object.
    explicit PixelLine(OSPath &);

    void Add(int h, int v); // the next point
    void Finish();          // after the last one

private:
    struct Kept {
        int index, v; // in the column
    };
    void EndColumn();

    OSPath &path;
    bool begun = false; // the path has the first point
    int count = 0;      // points of the column so far
    int h = 0;          // of the column
    Kept first = {0, 0}, second = {0, 0}, top = {0, 0}, bottom = {0, 0}, beforeLast = {0, 0}, last = {0, 0};
};
