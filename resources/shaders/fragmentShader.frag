#version 450

// The color of the field at a location, in strict single precision: what spectrummapping.cpp computes for the same
// place, so that a pick gives the color that was touched.

// The space in which the pixels are read: 0 sRGB, 1 Display P3.
layout(constant_id = 0) const uint surfaceColorSpace = 0;

layout(location = 0) in vec2 fieldLocation;
layout(location = 0) out vec4 color;

// Two cubic Bezier curves from (0, 0) to (1, 1), solved side by side: x holds what belongs to the ramp of a component
// within a sixth of the hues, y what belongs to the lightness. A coordinate is ((a t + b) t + c) t.
struct Polynomials { vec2 c; vec2 b; vec2 a; };

Polynomials polynomials(vec2 p1, vec2 p2)
{
    precise vec2 c = 3.0 * p1;
    precise vec2 b = 3.0 * (p2 - p1) - c;
    precise vec2 a = 1.0 - c - b;
    return Polynomials(c, b, a);
}

vec2 value(Polynomials p, vec2 t)
{
    precise vec2 result = ((p.a * t + p.b) * t + p.c) * t;
    return result;
}

vec2 slope(Polynomials p, vec2 t)
{
    precise vec2 result = (3.0 * p.a * t + 2.0 * p.b) * t + p.c;
    return result;
}

// The y of both curves at x. Newton's method, kept at the first value near enough; for these two curves that takes three
// rounds at most, so that nothing need be decided pixel by pixel.
vec2 curves(vec2 x)
{
    const Polynomials px = polynomials(vec2(0.47, 0.42), vec2(0.68, 0.83));
    const Polynomials py = polynomials(vec2(0.0, 0.1), vec2(1.0, 0.95));
    vec2 t = x;
    for (int round = 0; round < 3; ++round) {
        precise vec2 error = value(px, t) - x;
        precise vec2 next = t - error / slope(px, t);
        t = mix(t, next, greaterThanEqual(abs(error), vec2(1e-5)));
    }
    return value(py, t);
}

// The six sixths of the hues from the top: red, yellow, green, cyan, blue, magenta and red again.
int segmentOf(float h)
{
    const float sixth = 1.0 / 6.0;
    return int(h >= sixth) + int(h >= 2.0 * sixth) + int(h >= 3.0 * sixth) + int(h >= 4.0 * sixth) +
           int(h >= 5.0 * sixth);
}

// Where a sixth stands on the ramp, which alternately rises and falls.
float rampPlace(float h, int segment)
{
    precise float t = 6.0 * h - float(segment);
    return (segment & 1) == 1 ? 1.0 - t : t;
}

// u is the component that rises or falls.
vec3 hueColor(int segment, float u)
{
    float lastBlue = max(u, 1.0 / 255.0);
    return vec3(segment == 0 || segment == 5 ? 1.0 : (segment == 1 || segment == 4 ? u : 0.0),
                segment == 1 || segment == 2 ? 1.0 : (segment == 0 || segment == 3 ? u : 0.0),
                segment == 3 || segment == 4 ? 1.0 : (segment == 2 ? u : (segment == 5 ? lastBlue : 0.0)));
}

vec3 fieldColor(vec2 location)
{
    precise float h = 0.5 - 0.5 * location.y;
    int segment = segmentOf(h);
    float place = rampPlace(h, segment);
    float distance = abs(location.x);
    vec2 y = curves(vec2(place, location.x < 0.0 ? 1.0 - distance : distance));
    vec3 hue = hueColor(segment, y.x);
    precise vec3 tint = 1.0 + (hue - 1.0) * y.y;
    precise vec3 shade = hue * (1.0 - y.y);
    return location.x < 0.0 ? tint : shade;
}

vec3 decoded(vec3 c)
{
    return mix(pow((c + 0.055) / 1.055, vec3(2.4)), c / 12.92, lessThanEqual(c, vec3(0.04045)));
}

vec3 encoded(vec3 l)
{
    return mix(1.055 * pow(l, vec3(1.0 / 2.4)) - 0.055, 12.92 * l, lessThanEqual(l, vec3(0.0031308)));
}

// By columns: the linear Display P3 of linear sRGB red, green and blue.
const mat3 displayP3 = mat3(
    0.822461969, 0.033194199, 0.017082631,
    0.177538031, 0.966805801, 0.072397440,
    0.0, 0.0, 0.910519929);

void main()
{
    vec3 c = fieldColor(fieldLocation);
    if (surfaceColorSpace == 1)
        c = encoded(clamp(displayP3 * decoded(c), 0.0, 1.0));
    color = vec4(c, 1.0);
}
