#include "host/server/sealedtext.h"

#include <cerrno>
#include <span>

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

namespace favrin::host::server {

namespace {

bool writeAll(int descriptor, std::span<const char> bytes)
{
    while (!bytes.empty()) {
        const ssize_t written = ::write(descriptor, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR)
            continue;
        if (written <= 0)
            return false;
        bytes = bytes.subspan(static_cast<std::size_t>(written));
    }
    return true;
}

} // namespace

int sealedText(const std::string &text, Writable writable)
{
    const int descriptor = ::memfd_create("favrin-text", MFD_CLOEXEC | MFD_ALLOW_SEALING);
    if (descriptor < 0)
        return -1;
    const int writeSeal = writable == Writable::No ? F_SEAL_WRITE : 0;
    if (writeAll(descriptor, std::span(text.c_str(), text.size() + 1)) &&
        ::fcntl(descriptor, F_ADD_SEALS, F_SEAL_SHRINK | F_SEAL_GROW | writeSeal | F_SEAL_SEAL) == 0)
        return descriptor;
    const int error = errno;
    ::close(descriptor);
    errno = error;
    return -1;
}

} // namespace favrin::host::server
