#pragma once

namespace favrin::platform {

struct Confinement;

/** Lets this thread and those it starts write only where @p confinement says. 0, or the error that kept it from it. */
int applyFileRules(const Confinement &confinement);

} // namespace favrin::platform
