#pragma once
#include <string>

#include "paint/Workspace.h"
#include "store/SafeFile.h"

// The paint-mask file (".msk"): the whole PaintMask as 16-bit little-endian
// values, the stroke plane first, then the colour plane; x fastest, then y.
namespace store {

inline constexpr size_t kMaskFileSize = static_cast<size_t>(Workspace::kMaskPlane) * 2 * 2;  // 482,804

// The mask as the file's bytes.
Bytes EncodePaintMask(const std::vector<int16_t>& mask);

enum class MaskRead { Loaded, Missing, Broken };

// Reads StripExtension(path) & ".msk" into ws.PaintMask. A missing or
// unreadable file leaves the mask as it is; a file whose colour plane names
// no box leaves the mask cleared and reports Broken.
MaskRead ReadPaintMask(Workspace& ws, const std::string& path);

// Writes ws.PaintMask to StripExtension(path) & ".msk", whole or not at all.
bool WritePaintMask(const Workspace& ws, const std::string& path, std::string& error);

} // namespace store
