#include <gtest/gtest.h>

#include "store/PictureCheck.h"
#include "store/SafeFile.h"

namespace {

using store::Bytes;

// A minimal marker skeleton: SOI, an APP1 holding a thumbnail's own EOI,
// SOF0, SOS with stuffed and restart bytes in the scan, then EOI.
Bytes Jpeg() {
    return {0xFF, 0xD8,
            0xFF, 0xE1, 0x00, 0x06, 0xFF, 0xD9, 0x00, 0x00,          // APP1: an EOI inside must not count
            0xFF, 0xC0, 0x00, 0x05, 0x08, 0x00, 0x01,                // SOF0 (short but well formed)
            0xFF, 0xDA, 0x00, 0x03, 0x01,                            // SOS
            0x12, 0xFF, 0x00, 0x34, 0xFF, 0xD0, 0x56,                // scan: stuffing, restart
            0xFF, 0xD9};
}

Bytes Bmp(int width, int height, int bits, size_t pixelBytes) {
    Bytes b(54 + pixelBytes, 0);
    b[0] = 'B'; b[1] = 'M';
    b[10] = 54;
    b[14] = 40;
    for (int i = 0; i < 4; ++i) {
        b[18 + i] = static_cast<uint8_t>(static_cast<uint32_t>(width) >> (8 * i));
        b[22 + i] = static_cast<uint8_t>(static_cast<uint32_t>(height) >> (8 * i));
    }
    b[28] = static_cast<uint8_t>(bits);
    return b;
}

Bytes Gif(bool trailer) {
    Bytes b = {'G', 'I', 'F', '8', '9', 'a', 1, 0, 1, 0, 0x80, 0, 0,
               0, 0, 0, 255, 255, 255,                         // two-colour table
               0x21, 0xF9, 4, 0, 0, 0, 0, 0,                   // graphic control extension
               0x2C, 0, 0, 0, 0, 1, 0, 1, 0, 0,                // image descriptor
               2, 2, 0x44, 0x01, 0};                           // LZW data
    if (trailer) b.push_back(0x3B);
    return b;
}

struct CheckRow {
    const char* what;
    Bytes bytes;
    bool complete;
};

std::vector<CheckRow> Rows() {
    Bytes cut = Jpeg();
    cut.resize(26);   // inside the scan data
    Bytes noEoi = Jpeg();
    noEoi.resize(noEoi.size() - 2);
    Bytes badLength = Jpeg();
    badLength[13] = 0x40;   // SOF claims more bytes than the file has
    Bytes gifCut = Gif(true);
    gifCut.resize(gifCut.size() - 4);
    return {
        {"whole jpeg", Jpeg(), true},
        {"jpeg cut in its scan", cut, false},
        {"jpeg without EOI", noEoi, false},
        {"jpeg segment past the end", badLength, false},
        {"whole 24-bit bmp", Bmp(3, 2, 24, 2 * 12), true},
        {"bmp one row short", Bmp(3, 2, 24, 12), false},
        {"top-down bmp", Bmp(3, -2, 24, 2 * 12), true},
        {"bmp declaring 65000 x 65000", Bmp(65000, 65000, 24, 16), false},
        {"gif with trailer", Gif(true), true},
        {"gif without trailer", Gif(false), true},
        {"gif cut in its image", gifCut, false},
        {"text", Bytes{'h', 'e', 'l', 'l', 'o'}, true},   // unknown kinds are the decoder's business
    };
}

TEST(PictureCheck, FindsFilesThatEndBeforeTheirData) {
    for (const CheckRow& row : Rows())
        EXPECT_EQ(store::CheckComplete(row.bytes).empty(), row.complete) << row.what;
}

TEST(PictureCheck, KnowsTheKindFromTheFirstBytes) {
    EXPECT_EQ(store::KindOf(Jpeg()), store::PictureKind::Jpeg);
    EXPECT_EQ(store::KindOf(Bmp(1, 1, 24, 4)), store::PictureKind::Bmp);
    EXPECT_EQ(store::KindOf(Gif(true)), store::PictureKind::Gif);
    EXPECT_EQ(store::KindOf(Bytes{}), store::PictureKind::Unknown);
}

} // namespace
