#pragma once

namespace favrin::spectrum {

/** A color of the field: gamma-encoded sRGB, nominally 0…1. The field itself is opaque. */
struct FieldColor
{
    float r = 0.0F;
    float g = 0.0F;
    float b = 0.0F;
    float a = 1.0F;

    bool operator==(const FieldColor &) const = default;
};

/**
 * A place in the field, in the square from -1 to 1. x is the lightness: -1 white (left), 0 the pure hue, 1 black
 * (right). y is the hue: 1 red (top), down through yellow, green, cyan, blue and magenta to red again (-1, bottom).
 */
struct FieldLocation
{
    float x = 0.0F;
    float y = 0.0F;

    bool operator==(const FieldLocation &) const = default;
};

} // namespace favrin::spectrum
