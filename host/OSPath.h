// Paths of straight lines, to be stroked by OSPort::StrokePath or to narrow the clip.
#pragma once

// A list of subpaths, each a chain of straight lines. Coordinates are logical pixels, horizontal first; what
// they are relative to is decided by the port that draws the path.
class OSPath {
public:
    OSPath(); // without subpaths
    ~OSPath();

    // Begins a new subpath at the point; the one before stays open unless it was closed.
    void CreateSubpath(double h, double v);
    // Continues the last subpath with a line to the point. Without a subpath, begins one there.
    void AddLine(double h, double v);
    // Appends copies of all subpaths of the other path, moved by the offset. A path may be added to itself.
    void AddPath(OSPath const &, double dh, double dv);
    // Joins the last point of the last subpath to its first. Without effect when there is no subpath.
    void CloseSubpath();
    // Removes all subpaths.
    void Clear();

private:
    OSPath(OSPath const &);
    OSPath &operator=(OSPath const &);

    friend struct PathAccess; // the host's way to the representation

    struct Rep;
    Rep *rep;
};
