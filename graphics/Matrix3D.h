// What turns places in space into places on a plane.
#pragma once
#include "graphics/Point3D.h"

// Four by four numbers, row by row. Points are rows, with w last: a point times the matrix is its image.
class Matrix3D {
public:
    Matrix3D(); // leaves everything where it is

    // Turns about the y axis, by radians.
    static Matrix3D Rotation(double angle);
    static Matrix3D Translation(double tx, double ty, double tz);
    static Matrix3D MirrorY();
    // Seen from the origin along z, on a plane at the distance d.
    static Matrix3D Perspective(double d);
    static Matrix3D Scale(double sx, double sy, double sz);

    // First this one, then the other.
    Matrix3D operator*(Matrix3D const &) const;

    // A place on the plane; not finite for points in the plane of the eye.
    struct Image {
        double x, y;
    };
    Image Project(Point3D const &) const; // the point times the matrix, by its w

private:
    static int const kSide = 4;
    double at[kSide][kSide];
};
