#pragma once

class OSPath {
public:
    OSPath();
    ~OSPath();
    void CreateSubpath(double h, double v);
    void AddLine(double h, double v);

    void AddPath(OSPath const &, double dh, double dv);
    void CloseSubpath();
private:
    OSPath(OSPath const &);
    OSPath &operator=(OSPath const &);
    struct Rep;
    Rep *rep;
};
