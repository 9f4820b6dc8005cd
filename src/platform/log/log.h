#pragma once

#include <memory>
#include <string_view>

namespace favrin::platform {

/**
 * One log object with a subsystem and a category, e.g. "com.quenta.favrin.ColorPicker" and "ColorPicker".
 * Entries go to Qt's logging under the category name "<subsystem>.<category>" and obey its filter rules; debug entries
 * are off unless a rule turns them on. Messages are UTF-8. Thread-safe.
 */
class Log
{
public:
    /** Both texts are copied. */
    Log(const char *subsystem, const char *category);
    ~Log();
    Log(const Log &) = delete;
    Log &operator=(const Log &) = delete;

    /** True when debug entries are written, for callers that would have to build the text. */
    bool isDebugEnabled() const;
    void debug(std::string_view message) const;
    void warning(std::string_view message) const;
    void error(std::string_view message) const;

private:
    struct Private;
    std::unique_ptr<Private> d;
};

} // namespace favrin::platform
