#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <unistd.h>

#include "store/MaskFile.h"

namespace fs = std::filesystem;

namespace {

class MaskFile : public testing::Test {
protected:
    void SetUp() override { fs::create_directories(dir); }
    void TearDown() override { fs::remove_all(dir); }
    std::string path(const char* name) const { return (dir / name).string(); }
    const fs::path dir = fs::temp_directory_path() / ("mask_file_" + std::to_string(::getpid()));
};

TEST_F(MaskFile, RoundTripKeepsLayoutAndUndoneStrokes) {
    Workspace painted, back;
    // Strokes 1 and 2 shown, stroke 3 undone, and one element outside the picture.
    painted.Stroke(0, 0) = 1;    painted.ColorPlane(0, 0) = 3;
    painted.Stroke(399, 0) = 2;  painted.ColorPlane(399, 0) = 12;
    painted.Stroke(5, 299) = -3; painted.ColorPlane(5, 299) = -7;
    painted.Stroke(400, 300) = 2;
    std::string error;
    ASSERT_TRUE(store::WritePaintMask(painted, path("house"), error)) << error;
    std::ifstream in(path("house.msk"), std::ios::binary);
    const store::Bytes b{std::istreambuf_iterator<char>(in), {}};
    ASSERT_EQ(b.size(), 482804u);
    const size_t undone = 2 * (5 + 401 * 299);   // little-endian, x fastest, stroke plane first
    const std::pair<size_t, int> expected[] = {{0, 1}, {1, 0}, {2, 0}, {2 * 399, 2}, {undone, 0xFD}, {undone + 1, 0xFF},
                                               {241402, 3}, {241402 + undone, 0xF9}, {2 * (400 + 401 * 300), 2}};
    for (const auto& [offset, value] : expected) EXPECT_EQ(b[offset], value) << offset;
    ASSERT_EQ(store::ReadPaintMask(back, path("house.bmo")), store::MaskRead::Loaded);
    EXPECT_EQ(back.PaintMask, painted.PaintMask);
}

TEST_F(MaskFile, ShortOrMissingFileFillsOnlyWhatItHas) {
    // Four elements and a stray half: 7, -2, 300, 1.
    std::ofstream(path("short.msk"), std::ios::binary).write("\x07\x00\xFE\xFF\x2C\x01\x01\x00\x09", 9);
    Workspace ws;
    ws.Stroke(4, 0) = 55;
    ASSERT_EQ(store::ReadPaintMask(ws, path("short.bmo")), store::MaskRead::Loaded);
    EXPECT_EQ(std::vector<int16_t>(ws.PaintMask.begin(), ws.PaintMask.begin() + 5), std::vector<int16_t>({7, -2, 300, 1, 55}));
    EXPECT_EQ(store::ReadPaintMask(ws, path("none.bmo")), store::MaskRead::Missing);
    EXPECT_EQ(ws.Stroke(4, 0), 55);
}

TEST_F(MaskFile, ColourPlaneBeyondTheTwelveBoxesIsBroken) {
    for (const int16_t color : {int16_t{-12}, int16_t{13}, int16_t{-13}}) {
        Workspace painted, ws;
        painted.Stroke(20, 30) = 1;
        painted.ColorPlane(20, 30) = color;
        std::string error;
        ASSERT_TRUE(store::WritePaintMask(painted, path("w"), error));
        const bool broken = store::ReadPaintMask(ws, path("w.bmo")) == store::MaskRead::Broken;
        EXPECT_EQ(broken, color != -12) << color;
        EXPECT_EQ(ws.Stroke(20, 30), broken ? 0 : 1) << color;   // cleared, not half loaded
    }
}

} // namespace
