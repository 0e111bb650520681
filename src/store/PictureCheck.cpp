#include "store/PictureCheck.h"

#include <cstdint>

namespace store {

namespace {
const char* const kTruncated = "The picture file is incomplete (it ends before its picture data does).";

uint32_t Le16(std::span<const uint8_t> b, size_t at) { return b[at] | (b[at + 1] << 8); }
uint32_t Le32(std::span<const uint8_t> b, size_t at) {
    return b[at] | (b[at + 1] << 8) | (b[at + 2] << 16) | (static_cast<uint32_t>(b[at + 3]) << 24);
}

// Walks the marker segments; entropy-coded data after each SOS is skipped up
// to the next marker. Complete when EOI is reached inside the file.
bool JpegComplete(std::span<const uint8_t> b) {
    size_t i = 2;
    while (i + 1 < b.size()) {
        if (b[i] != 0xFF) return false;
        uint8_t marker = b[i + 1];
        if (marker == 0xFF) { ++i; continue; }  // fill byte
        i += 2;
        if (marker == 0xD9) return true;        // EOI
        if (marker == 0x01 || (marker >= 0xD0 && marker <= 0xD7)) continue;
        if (i + 1 >= b.size()) return false;
        const size_t length = (b[i] << 8) | b[i + 1];
        if (length < 2 || i + length > b.size()) return false;
        i += length;
        if (marker == 0xDA) {
            // Scan data: stop at a marker that is neither stuffing nor a restart.
            while (i + 1 < b.size()) {
                if (b[i] == 0xFF && b[i + 1] != 0x00 && !(b[i + 1] >= 0xD0 && b[i + 1] <= 0xD7) && b[i + 1] != 0xFF)
                    break;
                ++i;
            }
            if (i + 1 >= b.size()) return false;
        }
    }
    return false;
}

bool BmpComplete(std::span<const uint8_t> b) {
    if (b.size() < 26) return false;
    const uint32_t offset = Le32(b, 10);
    const uint32_t headerSize = Le32(b, 14);
    int64_t width = 0, height = 0;
    uint32_t bits = 0, compression = 0;
    if (headerSize == 12) {
        width = Le16(b, 18);
        height = Le16(b, 20);
        bits = Le16(b, 24);
    } else {
        if (b.size() < 34) return false;
        width = static_cast<int32_t>(Le32(b, 18));
        height = static_cast<int32_t>(Le32(b, 22));
        bits = Le16(b, 28);
        compression = Le32(b, 30);
    }
    if (compression != 0 && compression != 3) return offset <= b.size();  // RLE: length unknown
    if (height < 0) height = -height;
    if (width < 0 || bits == 0) return false;
    const int64_t stride = ((width * bits + 31) / 32) * 4;
    return static_cast<int64_t>(offset) + stride * height <= static_cast<int64_t>(b.size());
}

// Walks the GIF blocks up to the trailer.
bool GifComplete(std::span<const uint8_t> b) {
    if (b.size() < 13) return false;
    size_t i = 13;
    if (b[10] & 0x80) i += 3u * (1u << ((b[10] & 7) + 1));
    auto skipSubBlocks = [&]() {
        while (i < b.size()) {
            const size_t n = b[i];
            ++i;
            if (n == 0) return true;
            i += n;
        }
        return false;
    };
    bool sawImage = false;
    while (i < b.size()) {
        const uint8_t kind = b[i];
        if (kind == 0x3B) return sawImage;
        if (kind == 0x21) {
            i += 2;
            if (!skipSubBlocks()) return false;
        } else if (kind == 0x2C) {
            if (i + 10 > b.size()) return false;
            const uint8_t flags = b[i + 9];
            i += 10;
            if (flags & 0x80) i += 3u * (1u << ((flags & 7) + 1));
            i += 1;  // LZW minimum code size
            if (!skipSubBlocks()) return false;
            sawImage = true;
        } else {
            return false;
        }
    }
    // Some writers leave out the trailer; a file ending right after a
    // complete image is still whole.
    return sawImage && i == b.size();
}
} // namespace

std::string CheckComplete(std::span<const uint8_t> b) {
    // The kind is told by the first bytes, whatever the file's name says.
    bool complete = true;
    if (b.size() >= 3 && b[0] == 0xFF && b[1] == 0xD8 && b[2] == 0xFF)
        complete = JpegComplete(b);
    else if (b.size() >= 2 && b[0] == 'B' && b[1] == 'M')
        complete = BmpComplete(b);
    else if (b.size() >= 6 && b[0] == 'G' && b[1] == 'I' && b[2] == 'F')
        complete = GifComplete(b);
    return complete ? std::string() : std::string(kTruncated);
}

} // namespace store
