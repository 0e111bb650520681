#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "paint/ColorBox.h"

// The colour scheme file (".csc"): no header, exactly twelve records, box 1
// first. Each record, little-endian:
//   int16 name length n, n name bytes (Windows-1252), int32 colour, int32 reference
// A colour is red + 256 green + 65536 blue, or kButtonFace for "no colour";
// a reference of 0 means none. Bytes after the twelfth record are ignored.
namespace SchemeFile {

inline constexpr int kMaxNameBytes = 32767;
// The most a reader ever needs: twelve records with the longest names.
inline constexpr size_t kMaxSchemeBytes = static_cast<size_t>(kColorBoxCount) * (10 + kMaxNameBytes);

// The scheme that belongs to `path`: the last extension of the file name
// (never of a folder) is dropped and ".csc" added. Separators are "/".
//   "/p/garden.bmp" -> "/p/garden.csc", "/p/garden" -> "/p/garden.csc"
std::string SchemePath(const std::string& path);

// Boxes 1 to 12 as file bytes. Names longer than the length field can hold
// are cut.
std::vector<uint8_t> Encode(const ColorBoxes& boxes);

struct Decoded {
    bool ok = false;
    ColorBoxes boxes{};      // meaningful only when ok
    std::string problem;     // why not, in words for the user
};

// Reads twelve records and checks each: a file that ends early, a name length
// that is negative or runs past the end, or a colour that is neither a colour
// value nor "no colour" makes the whole file fail.
Decoded Decode(const uint8_t* data, size_t size);
inline Decoded Decode(const std::vector<uint8_t>& bytes) { return Decode(bytes.data(), bytes.size()); }

// Name text: UTF-8 inside the program, Windows-1252 in the file. A character
// (or byte) with no counterpart becomes "?".
std::string ToWindows1252(const std::string& utf8);
std::string FromWindows1252(const std::string& bytes);

// Whole-file helpers on exact paths (SchemePath is the caller's business).
// Read never creates a file; Write replaces the file only once the new
// content is completely on disk. Both return false with a reason on failure.
bool Read(const std::string& path, std::vector<uint8_t>& bytes, std::string& problem);
bool Write(const std::string& path, const ColorBoxes& boxes, std::string& problem);

} // namespace SchemeFile
