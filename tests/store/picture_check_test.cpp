#include <gtest/gtest.h>

#include "store/PictureCheck.h"
#include "store/SafeFile.h"

using store::Bytes;

namespace {

// SOI, an APP1 holding a thumbnail's own EOI, SOF0, SOS, a scan with a
// stuffed byte and a restart marker, then EOI.
const Bytes kJpeg = {0xFF, 0xD8, 0xFF, 0xE1, 0x00, 0x06, 0xFF, 0xD9, 0x00, 0x00,
                     0xFF, 0xC0, 0x00, 0x05, 0x08, 0x00, 0x01, 0xFF, 0xDA, 0x00, 0x03, 0x01,
                     0x12, 0xFF, 0x00, 0x34, 0xFF, 0xD0, 0x56, 0xFF, 0xD9};
// A 1 x 1 GIF without its trailer: colour table, control extension, image, LZW data.
const Bytes kGif = {'G', 'I', 'F', '8', '9', 'a', 1, 0, 1, 0, 0x80, 0, 0, 0, 0, 0, 255, 255, 255,
                    0x21, 0xF9, 4, 0, 0, 0, 0, 0, 0x2C, 0, 0, 0, 0, 1, 0, 1, 0, 0, 2, 2, 0x44, 0x01, 0};

// A 24-bit BMP header for width x height, followed by `pixelBytes` bytes.
Bytes Bmp(uint32_t width, uint32_t height, size_t pixelBytes) {
    Bytes b(54 + pixelBytes, 0);
    b[0] = 'B', b[1] = 'M', b[10] = 54, b[14] = 40, b[28] = 24;
    for (int i = 0; i < 4; ++i) b[18 + i] = uint8_t(width >> (8 * i)), b[22 + i] = uint8_t(height >> (8 * i));
    return b;
}

Bytes Cut(const Bytes& b, size_t drop) { return Bytes(b.begin(), b.end() - static_cast<std::ptrdiff_t>(drop)); }

TEST(PictureCheck, FindsFilesThatEndBeforeTheirData) {
    Bytes badLength = kJpeg;
    badLength[13] = 0x40;   // SOF claims more bytes than the file has
    const struct { const char* what; Bytes bytes; bool complete; } rows[] = {
        {"whole jpeg", kJpeg, true},
        {"jpeg cut in its scan", Cut(kJpeg, 5), false},
        {"jpeg segment past the end", badLength, false},
        {"whole bmp", Bmp(3, 2, 2 * 12), true},
        {"bmp one row short", Bmp(3, 2, 12), false},
        {"top-down bmp", Bmp(3, uint32_t(-2), 2 * 12), true},
        {"bmp declaring 65000 x 65000", Bmp(65000, 65000, 16), false},
        {"gif", kGif, true},
        {"gif cut in its image", Cut(kGif, 3), false},
        {"text", Bytes{'h', 'e', 'l', 'l', 'o'}, true},   // unknown kinds are the decoder's business
    };
    for (const auto& row : rows) EXPECT_EQ(store::CheckComplete(row.bytes).empty(), row.complete) << row.what;
}

} // namespace
