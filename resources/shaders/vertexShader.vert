#version 450

// A vertex is a location of the field and the same place of the viewport.
layout(location = 0) in vec2 vertex;
layout(location = 0) out vec2 fieldLocation;

void main()
{
    gl_Position = vec4(vertex, 0.0, 1.0);
    fieldLocation = vertex;
}
