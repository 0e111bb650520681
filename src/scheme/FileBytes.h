#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

// Whole files in and out, for the small file formats of the program.
namespace FileBytes {

// Reads at most `maxBytes` of an existing regular file. A missing file stays
// missing. False with a reason for the user on failure.
bool ReadFile(const std::string& path, std::vector<uint8_t>& bytes, size_t maxBytes, std::string& problem);

// Writes `bytes` to a temporary file beside `path`, checks that every byte
// reached the disk, then renames it over `path`. On failure the old file (if
// any) is unchanged and no temporary file is left behind.
bool CommitFile(const std::string& path, const std::vector<uint8_t>& bytes, std::string& problem);

} // namespace FileBytes
