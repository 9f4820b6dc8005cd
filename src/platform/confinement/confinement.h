#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace favrin::platform {

/** What a confined process keeps; everything else that can be given up is. */
struct Confinement
{
    /** Folders in which files and folders, but no links, may be made, written, renamed and removed, at any depth. */
    std::vector<std::filesystem::path> writableFolders;
    /** Device files, or folders of them, that may be opened for writing. */
    std::vector<std::filesystem::path> writableDevices;
};

struct ConfinementResult
{
    bool filesAreConfined = false;
    bool systemCallsAreFiltered = false;
    /** What the system could not give, for the log; empty when nothing is missing. */
    std::string missing;
};

/**
 * Confines this process and all that it starts, for good. A path that does not exist is left out.
 *
 * To be called before there is a second thread: file rules bind only the calling one and those it starts later. What
 * the kernel does not know is left out and said in the result.
 */
ConfinementResult confine(const Confinement &confinement);

} // namespace favrin::platform
