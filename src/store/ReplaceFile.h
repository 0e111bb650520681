#pragma once
#include <ctime>
#include <string>
#include <sys/types.h>

#include "store/SafeFile.h"

// Exported pictures replace a file of the same name without asking, but never
// lose it: the new file is written complete beside the target, takes over the
// old file's permission bits (and, when asked, its access and modification
// times) and only then is renamed over it. A read-only target is refused.
namespace store {

// The file a write is about to replace.
struct ReplacedFile {
    std::string path;       // the target; a symbolic link is followed to its file
    bool existed = false;
    mode_t mode = 0;        // permission bits (07777)
    timespec times[2]{};    // access, modification
};

// Looks at the target. False (with `error`) when it exists but must not be
// replaced: read-only (no write bit, or not writable by us), or not a plain file.
bool InspectTarget(const std::string& target, ReplacedFile& old, std::string& error);

// A name for a new file in the target's folder, unlikely to be taken.
std::string TempNameBeside(const std::string& target);

// Creates `path` (it must not exist yet) with the system's usual permissions,
// writes every byte, flushes it to disk and closes it. On failure the file is
// removed and `error` says why.
bool WriteNewFile(const std::string& path, const Bytes& bytes, std::string& error);

// Gives `temp` the old file's permission bits and, with keepTimes, its times,
// then renames it over the target. On failure `temp` is removed.
bool MoveIntoPlace(const std::string& temp, const ReplacedFile& old, bool keepTimes, std::string& error);

// All of the above for bytes already in memory.
bool ReplaceFileWith(const std::string& target, const Bytes& bytes, bool keepTimes, std::string& error);

} // namespace store
