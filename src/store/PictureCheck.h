#pragma once
#include <cstdint>
#include <span>
#include <string>

// Checks that a picture file holds all the data its headers promise. The
// decoders fill a cut-off picture with grey and call it a success; the
// picture store refuses such a file instead of opening half a photo.
namespace store {

// An empty result means complete; otherwise the reason for the user.
// Kinds it does not know are left to the decoder.
std::string CheckComplete(std::span<const uint8_t> file);

} // namespace store
