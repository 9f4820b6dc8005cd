#version 450

// The color of the field at a location, in strict single precision: what spectrummapping.cpp computes for the same
// place, so that a pick gives the color that was touched.

// The space in which the pixels are read: 0 sRGB, 1 Display P3.
layout(constant_id = 0) const uint surfaceColorSpace = 0;

layout(location = 0) in vec2 fieldLocation;
layout(location = 0) out vec4 color;

// A cubic Bezier curve from (0, 0) to (1, 1): the coefficients (c, b, a) of ((a t + b) t + c) t for x and for y.
struct TimingCurve { vec3 x; vec3 y; };

vec3 polynomial(float p1, float p2)
{
    precise float c = 3.0 * p1;
    precise float b = 3.0 * (p2 - p1) - c;
    precise float a = 1.0 - c - b;
    return vec3(c, b, a);
}

TimingCurve timingCurve(vec2 p1, vec2 p2)
{
    return TimingCurve(polynomial(p1.x, p2.x), polynomial(p1.y, p2.y));
}

float value(vec3 p, float t)
{
    precise float result = ((p.z * t + p.y) * t + p.x) * t;
    return result;
}

float slope(vec3 p, float t)
{
    precise float result = (3.0 * p.z * t + 2.0 * p.y) * t + p.x;
    return result;
}

// The parameter at which the polynomial has the value x: by Newton's method, or by halving where that fails.
float parameter(vec3 p, float x)
{
    float t = x;
    for (int round = 0; round < 8; ++round) {
        precise float error = value(p, t) - x;
        if (abs(error) < 1e-5)
            return t;
        float d = slope(p, t);
        if (abs(d) < 1e-6)
            break;
        t = t - error / d;
    }
    if (x < 0.0)
        return 0.0;
    if (x > 1.0)
        return 1.0;
    float low = 0.0;
    float high = 1.0;
    t = x;
    for (int round = 0; round < 1024 && low < high; ++round) {
        precise float error = value(p, t) - x;
        if (abs(error) < 1e-5)
            break;
        if (error < 0.0)
            low = t;
        else
            high = t;
        t = low + (high - low) * 0.5;
    }
    return t;
}

float curve(TimingCurve c, float x)
{
    return value(c.y, parameter(c.x, x));
}

vec3 hueColor(float y)
{
    const float sixth = 1.0 / 6.0;
    precise float h = 0.5 - 0.5 * y;
    int segment = 0;
    for (int k = 1; k < 6; ++k)
        segment += h < float(k) * sixth ? 0 : 1;
    precise float t = 6.0 * h - float(segment);
    if ((segment & 1) == 1)
        t = 1.0 - t;
    float u = curve(timingCurve(vec2(0.47, 0.0), vec2(0.68, 1.0)), t);
    switch (segment) {
    case 0: return vec3(1.0, u, 0.0);
    case 1: return vec3(u, 1.0, 0.0);
    case 2: return vec3(0.0, 1.0, u);
    case 3: return vec3(0.0, u, 1.0);
    case 4: return vec3(u, 0.0, 1.0);
    }
    return vec3(1.0, 0.0, max(u, 1.0 / 255.0));
}

vec3 fieldColor(vec2 location)
{
    vec3 hue = hueColor(location.y);
    float distance = abs(location.x);
    float k = curve(timingCurve(vec2(0.42, 0.1), vec2(0.83, 0.95)), location.x < 0.0 ? 1.0 - distance : distance);
    precise vec3 tint = 1.0 + (hue - 1.0) * k;
    precise vec3 shade = hue * (1.0 - k);
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
