#pragma once
#include <cstdint>
#include <string>
#include <vector>

// Files of the picture store are written whole or not at all: the bytes go
// to a temporary file beside the target, every write is checked and flushed,
// and only then is the temporary renamed over the target.
namespace store {

using Bytes = std::vector<uint8_t>;

// A temporary file holding the complete new content of `target`.
struct StagedFile {
    std::string temp;
    std::string target;
};

// Writes `bytes` to a new temporary file in the target's folder. On failure
// nothing is left behind and `error` says why.
bool StageFile(const std::string& target, const Bytes& bytes, StagedFile& staged, std::string& error);
// Moves a staged file into place (atomic on one file system).
bool CommitStaged(StagedFile& staged, std::string& error);
// Removes a staged file that will not be committed.
void DiscardStaged(StagedFile& staged);

// Stage and commit in one step.
bool WriteFileSafely(const std::string& path, const Bytes& bytes, std::string& error);

// Reads at most `limit` bytes of a file. False when it cannot be opened or read.
bool ReadFileHead(const std::string& path, size_t limit, Bytes& bytes);

} // namespace store
