#include "store/MaskFile.h"

#include <algorithm>
#include <cstdlib>

#include "store/Paths.h"

namespace store {

namespace {
// Fills `mask` from the start of `bytes`: whole elements only, never more
// than the mask holds; elements the bytes do not reach are left alone.
void DecodePaintMask(const Bytes& bytes, std::vector<int16_t>& mask) {
    const size_t count = std::min({bytes.size() / 2, mask.size(), kMaskFileSize / 2});
    for (size_t i = 0; i < count; ++i) {
        const auto v = static_cast<uint16_t>(bytes[2 * i] | (bytes[2 * i + 1] << 8));
        mask[i] = static_cast<int16_t>(v);
    }
}

// A colour-plane value must name one of the twelve boxes (or none).
bool ColorPlaneIsValid(const std::vector<int16_t>& mask) {
    for (size_t i = Workspace::kMaskPlane; i < mask.size(); ++i)
        if (std::abs(static_cast<int>(mask[i])) > kColorBoxCount) return false;
    return true;
}

std::string MaskPathFor(const std::string& path) { return StripExtension(path) + ".msk"; }
} // namespace

Bytes EncodePaintMask(const std::vector<int16_t>& mask) {
    Bytes bytes(kMaskFileSize, 0);
    const size_t count = std::min(mask.size(), kMaskFileSize / 2);
    for (size_t i = 0; i < count; ++i) {
        const auto v = static_cast<uint16_t>(mask[i]);
        bytes[2 * i] = static_cast<uint8_t>(v & 0xFFu);
        bytes[2 * i + 1] = static_cast<uint8_t>(v >> 8);
    }
    return bytes;
}

MaskRead ReadPaintMask(Workspace& ws, const std::string& path) {
    Bytes bytes;
    if (!ReadFileHead(MaskPathFor(path), kMaskFileSize, bytes)) return MaskRead::Missing;
    std::vector<int16_t> mask(ws.PaintMask.size(), 0);
    DecodePaintMask(bytes, mask);
    if (!ColorPlaneIsValid(mask)) {
        ws.ClearMask();
        return MaskRead::Broken;
    }
    // What the file does not reach keeps the value the loader gave it.
    const size_t supplied = std::min(bytes.size() / 2, mask.size());
    std::copy(mask.begin(), mask.begin() + static_cast<std::ptrdiff_t>(supplied), ws.PaintMask.begin());
    return MaskRead::Loaded;
}

bool WritePaintMask(const Workspace& ws, const std::string& path, std::string& error) {
    return WriteFileSafely(MaskPathFor(path), EncodePaintMask(ws.PaintMask), error);
}

} // namespace store
