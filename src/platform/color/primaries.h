#pragma once

#include "platform/color/colorspace.h"

namespace favrin::platform {

/** Three rows of three. */
using Matrix = std::array<Triple, 3>;

/** A point of the CIE 1931 chromaticity diagram. */
struct Chromaticity
{
    double x;
    double y;
};

struct Primaries
{
    Chromaticity red;
    Chromaticity green;
    Chromaticity blue;
};

constexpr Matrix multiplied(const Matrix &left, const Matrix &right)
{
    Matrix product = {};
    for (std::size_t row = 0; row < 3; ++row) {
        for (std::size_t column = 0; column < 3; ++column) {
            for (std::size_t i = 0; i < 3; ++i)
                product[row][column] += left[row][i] * right[i][column];
        }
    }
    return product;
}

constexpr Triple multiplied(const Matrix &matrix, const Triple &vector)
{
    Triple product = {};
    for (std::size_t row = 0; row < 3; ++row)
        product[row] = matrix[row][0] * vector[0] + matrix[row][1] * vector[1] + matrix[row][2] * vector[2];
    return product;
}

/** By cofactors. @p m must not be singular, which no matrix of real primaries is. */
constexpr Matrix inverse(const Matrix &m)
{
    Matrix cofactors = {};
    for (std::size_t row = 0; row < 3; ++row) {
        const std::size_t r1 = (row + 1) % 3;
        const std::size_t r2 = (row + 2) % 3;
        for (std::size_t column = 0; column < 3; ++column) {
            const std::size_t c1 = (column + 1) % 3;
            const std::size_t c2 = (column + 2) % 3;
            cofactors[row][column] = m[r1][c1] * m[r2][c2] - m[r1][c2] * m[r2][c1];
        }
    }
    const double determinant = m[0][0] * cofactors[0][0] + m[0][1] * cofactors[0][1] + m[0][2] * cofactors[0][2];
    Matrix result = {};
    for (std::size_t row = 0; row < 3; ++row) {
        for (std::size_t column = 0; column < 3; ++column)
            result[row][column] = cofactors[column][row] / determinant;
    }
    return result;
}

/** From linear components to CIE XYZ, scaled so that equal full components give @p white with Y = 1. */
constexpr Matrix matrixToXYZ(const Primaries &primaries, Chromaticity white)
{
    const auto xyz = [](Chromaticity c) { return Triple{c.x / c.y, 1.0, (1.0 - c.x - c.y) / c.y}; };
    const Triple red = xyz(primaries.red);
    const Triple green = xyz(primaries.green);
    const Triple blue = xyz(primaries.blue);
    Matrix columns = {};
    for (std::size_t row = 0; row < 3; ++row)
        columns[row] = {red[row], green[row], blue[row]};
    const Triple scale = multiplied(inverse(columns), xyz(white));
    for (Triple &row : columns)
        row = {row[0] * scale[0], row[1] * scale[1], row[2] * scale[2]};
    return columns;
}

} // namespace favrin::platform
