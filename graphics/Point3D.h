// Places in a cube.
#pragma once

// y is the vertical axis.
enum Axis3D : int { kAxisX = 0, kAxisY = 1, kAxisZ = 2 };

// A place, or anything else with a number for each axis.
struct Point3D {
    double x = 0.0, y = 0.0, z = 0.0;

    // The number for the axis.
    double &operator[](Axis3D axis) { return axis == kAxisX ? x : axis == kAxisY ? y : z; }
    // The same, to be read.
    double operator[](Axis3D axis) const { return axis == kAxisX ? x : axis == kAxisY ? y : z; }
    // NaN differs from everything.
    bool operator==(Point3D const &other) const { return x == other.x && y == other.y && z == other.z; }
};
