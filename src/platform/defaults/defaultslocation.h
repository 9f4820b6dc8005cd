#pragma once

#include <filesystem>

namespace favrin::platform {

/**
 * The file of the standard user defaults: the one that the environment variable FAVRIN_DEFAULTS_FILE names, otherwise
 * "favrin-color-picker/defaults.sqlite" in XDG_DATA_HOME, or in ~/.local/share where that is unset or relative. Empty
 * when there is no home directory either.
 */
std::filesystem::path standardDefaultsFile();

} // namespace favrin::platform
