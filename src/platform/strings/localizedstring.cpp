#include "platform/strings/localizedstring.h"

#include <memory>
#include <mutex>

namespace favrin::platform {

namespace {

struct InstalledTable
{
    std::mutex mutex;
    std::shared_ptr<const StringTable> table;
};

InstalledTable &installed()
{
    static InstalledTable instance;
    return instance;
}

} // namespace

std::string localizedString(std::string_view key, std::string_view)
{
    // The table is called outside the lock: it stays alive by its count, and a slow one keeps nobody waiting.
    const std::shared_ptr<const StringTable> table = [] {
        const std::lock_guard lock(installed().mutex);
        return installed().table;
    }();
    return table ? (*table)(key) : std::string(key);
}

void setStringTable(StringTable table)
{
    auto replacement = table ? std::make_shared<const StringTable>(std::move(table)) : nullptr;
    const std::lock_guard lock(installed().mutex);
    installed().table.swap(replacement);
}

} // namespace favrin::platform
