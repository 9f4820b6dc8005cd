#pragma once

#include <string>

namespace favrin::host::server {

enum class Writable { No, Yes };

/**
 * A file in memory that holds @p text and its terminating zero, whose size nobody can change; close-on-exec. For
 * readers that map it shared, which the kernel refuses for a file sealed against writing, it can be left @p writable.
 * Returns -1 with errno.
 */
int sealedText(const std::string &text, Writable writable);

} // namespace favrin::host::server
