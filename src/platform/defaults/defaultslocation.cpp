#include "platform/defaults/defaultslocation.h"

#include <cstdlib>

namespace favrin::platform {

namespace {

std::filesystem::path environmentPath(const char *variable)
{
    const char *text = std::getenv(variable);
    return text ? text : "";
}

std::filesystem::path dataHome()
{
    auto home = environmentPath("XDG_DATA_HOME");
    if (home.is_absolute())
        return home;
    home = environmentPath("HOME");
    return home.is_absolute() ? home / ".local/share" : std::filesystem::path();
}

} // namespace

std::filesystem::path standardDefaultsFile()
{
    if (const auto file = environmentPath("FAVRIN_DEFAULTS_FILE"); !file.empty())
        return file;
    const auto folder = dataHome();
    return folder.empty() ? folder : folder / "favrin-color-picker" / "defaults.sqlite";
}

} // namespace favrin::platform
