#include "apps/tool/exitstatus.h"
#include "apps/tool/toolmain.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <filesystem>
#include <span>
#include <string_view>
#include <system_error>

#include <dlfcn.h>

// The picker's process needs longer than anything else here, so it is started before this one loads its own libraries:
// the program links none of them, and the tool is a library that it opens.

namespace fs = std::filesystem;

namespace {

/** These ask for a text only. What is wrong in other ways has a picker started in vain, which leaves by itself. */
bool asksForText(std::span<char *const> arguments)
{
    constexpr std::array<std::string_view, 4> texts = {"-h", "--help", "-v", "--version"};
    return std::ranges::any_of(
        arguments, [&texts](std::string_view argument) { return std::ranges::find(texts, argument) != texts.end(); });
}

/** The tool beside its program, as built, or where it is installed; a tree that was moved as a whole works. */
void *loadTool()
{
    std::error_code error;
    const fs::path folder = fs::canonical("/proc/self/exe", error).parent_path();
    for (const std::string_view way : {FAVRIN_TOOL_LIBRARY, FAVRIN_TOOL_FROM_BIN}) {
        const fs::path file = folder / way;
        if (fs::exists(file, error))
            return dlopen(file.c_str(), RTLD_LAZY | RTLD_LOCAL);
    }
    return nullptr;
}

} // namespace

int main(int argc, char *argv[])
{
    favrin::host::LaunchedService service;
    if (!asksForText({argv, static_cast<std::size_t>(argc)}))
        service = favrin::host::launchService(favrin::host::servicePath());
    void *tool = loadTool();
    auto *run =
        tool ? reinterpret_cast<decltype(&favrinColorPickerMain)>(dlsym(tool, "favrinColorPickerMain")) : nullptr;
    if (!run) {
        const char *reason = dlerror();
        std::fprintf(stderr, "favrin-color-picker: %s\n", reason ? reason : FAVRIN_TOOL_LIBRARY " is not installed");
        return static_cast<int>(favrin::tool::ExitStatus::Failed);
    }
    return run(argc, argv, &service);
}
