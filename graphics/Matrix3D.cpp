#include "graphics/Matrix3D.h"
#include <cmath>

Matrix3D::Matrix3D() {
    for (int row = 0; row < kSide; ++row)
        for (int column = 0; column < kSide; ++column)
            at[row][column] = row == column ? 1.0 : 0.0;
}

Matrix3D Matrix3D::Rotation(double angle) {
    Matrix3D matrix;
    matrix.at[0][0] = matrix.at[2][2] = std::cos(angle);
    matrix.at[0][2] = std::sin(angle);
    matrix.at[2][0] = -std::sin(angle);
    return matrix;
}

Matrix3D Matrix3D::Translation(double tx, double ty, double tz) {
    Matrix3D matrix;
    matrix.at[3][0] = tx;
    matrix.at[3][1] = ty;
    matrix.at[3][2] = tz;
    return matrix;
}

Matrix3D Matrix3D::MirrorY() {
    Matrix3D matrix;
    matrix.at[1][1] = -1.0;
    return matrix;
}

Matrix3D Matrix3D::Perspective(double d) {
    Matrix3D matrix;
    matrix.at[2][3] = 1.0 / d;
    matrix.at[3][3] = 0.0;
    return matrix;
}

Matrix3D Matrix3D::Scale(double sx, double sy, double sz) {
    Matrix3D matrix;
    matrix.at[0][0] = sx;
    matrix.at[1][1] = sy;
    matrix.at[2][2] = sz;
    return matrix;
}

Matrix3D Matrix3D::operator*(Matrix3D const &other) const {
    Matrix3D product;
    for (int row = 0; row < kSide; ++row) {
        for (int column = 0; column < kSide; ++column) {
            double sum = 0.0;
            for (int i = 0; i < kSide; ++i)
                sum += at[row][i] * other.at[i][column];
            product.at[row][column] = sum;
        }
    }
    return product;
}

Matrix3D::Image Matrix3D::Project(Point3D const &point) const {
    double const vector[kSide] = {point.x, point.y, point.z, 1.0};
    double image[kSide];
    for (int column = 0; column < kSide; ++column) {
        image[column] = 0.0;
        for (int i = 0; i < kSide; ++i)
            image[column] += vector[i] * at[i][column];
    }
    return {image[0] / image[3], image[1] / image[3]};
}
