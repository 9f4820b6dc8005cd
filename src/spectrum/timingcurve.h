#pragma once

namespace favrin::spectrum {

/**
 * A cubic Bézier curve from (0, 0) to (1, 1), used as a function of its abscissa. All arithmetic is strict single
 * precision: the same input gives the same bits everywhere. A pure value, usable on any thread.
 */
class TimingCurve
{
public:
    /** The curve with the inner control points (p1x, p1y) and (p2x, p2y). */
    TimingCurve(float p1x, float p1y, float p2x, float p2y);

    /** The y of the curve at @p x, which lies in 0…1. */
    float y(float x) const;
    /** The x of the curve at @p y, which lies in 0…1. */
    float x(float y) const;

    /** One coordinate as a polynomial in the parameter: ((a·t + b)·t + c)·t. */
    struct Polynomial
    {
        Polynomial(float p1, float p2);

        float value(float t) const { return ((a * t + b) * t + c) * t; }
        float slope(float t) const { return (3.0F * a * t + 2.0F * b) * t + c; }

        float c;
        float b;
        float a;
    };

private:
    Polynomial m_x;
    Polynomial m_y;
};

} // namespace favrin::spectrum
