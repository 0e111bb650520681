#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "store/MaskFile.h"

namespace fs = std::filesystem;

namespace {

class MaskFile : public testing::Test {
protected:
    void SetUp() override {
        dir = fs::temp_directory_path() / ("mask_test_" + std::to_string(::getpid()) + "_" +
                                           testing::UnitTest::GetInstance()->current_test_info()->name());
        fs::create_directories(dir);
    }
    void TearDown() override { fs::remove_all(dir); }
    std::string path(const char* name) const { return (dir / name).string(); }
    void writeRaw(const char* name, const store::Bytes& bytes) const {
        std::ofstream(path(name), std::ios::binary).write(reinterpret_cast<const char*>(bytes.data()),
                                                          static_cast<std::streamsize>(bytes.size()));
    }
    fs::path dir;
};

// Three strokes painted, the third undone, two boxes used.
void PaintThreeStrokes(Workspace& ws) {
    ws.Stroke(0, 0) = 1;   ws.ColorPlane(0, 0) = 3;
    ws.Stroke(399, 0) = 2; ws.ColorPlane(399, 0) = 12;
    ws.Stroke(5, 299) = -3; ws.ColorPlane(5, 299) = -7;   // undone chalk line of box 7
    ws.Stroke(400, 300) = 2;                             // outside the picture, stored all the same
}

TEST_F(MaskFile, EncodesLittleEndianStrokePlaneFirst) {
    Workspace ws;
    PaintThreeStrokes(ws);
    const store::Bytes bytes = store::EncodePaintMask(ws.PaintMask);
    ASSERT_EQ(bytes.size(), 482804u);
    EXPECT_EQ(bytes[0], 1);
    EXPECT_EQ(bytes[1], 0);
    EXPECT_EQ(bytes[2 * 399], 2);
    const size_t undone = 2 * (5 + 401 * 299);
    EXPECT_EQ(bytes[undone], 0xFD);       // -3
    EXPECT_EQ(bytes[undone + 1], 0xFF);
    EXPECT_EQ(bytes[241402], 3);         // colour plane of (0, 0)
    EXPECT_EQ(bytes[241402 + undone], 0xF9);  // -7
    EXPECT_EQ(bytes[2 * (400 + 401 * 300)], 2);
    EXPECT_EQ(bytes[2], 0);               // (1, 0) never painted
}

TEST_F(MaskFile, RoundTripKeepsUndoneStrokes) {
    Workspace ws;
    PaintThreeStrokes(ws);
    std::string error;
    ASSERT_TRUE(store::WritePaintMask(ws, path("house"), error)) << error;
    EXPECT_EQ(fs::file_size(path("house.msk")), 482804u);

    Workspace back;
    ASSERT_EQ(store::ReadPaintMask(back, path("house.bmo")), store::MaskRead::Loaded);
    EXPECT_EQ(back.PaintMask, ws.PaintMask);
    EXPECT_EQ(back.Stroke(5, 299), -3);
    EXPECT_EQ(back.ColorPlane(399, 0), 12);
}

TEST_F(MaskFile, SizeIsFixedWhateverWasPainted) {
    Workspace empty;
    Workspace full;
    std::fill(full.PaintMask.begin(), full.PaintMask.end(), int16_t{-12});
    std::string error;
    ASSERT_TRUE(store::WritePaintMask(empty, path("a"), error));
    ASSERT_TRUE(store::WritePaintMask(full, path("b"), error));
    EXPECT_EQ(fs::file_size(path("a.msk")), 482804u);
    EXPECT_EQ(fs::file_size(path("b.msk")), 482804u);
}

TEST_F(MaskFile, ShortFileFillsWhatItHasAndLeavesTheRest) {
    // Four elements and a stray half: (0,0)=7, (1,0)=-2, (2,0)=300, (3,0)=1.
    writeRaw("short.msk", {7, 0, 0xFE, 0xFF, 0x2C, 0x01, 1, 0, 9});
    Workspace ws;
    ws.Stroke(4, 0) = 55;   // beyond the file: stays
    ws.Stroke(0, 1) = 66;
    ASSERT_EQ(store::ReadPaintMask(ws, path("short.bmo")), store::MaskRead::Loaded);
    EXPECT_EQ(ws.Stroke(0, 0), 7);
    EXPECT_EQ(ws.Stroke(1, 0), -2);
    EXPECT_EQ(ws.Stroke(2, 0), 300);
    EXPECT_EQ(ws.Stroke(3, 0), 1);
    EXPECT_EQ(ws.Stroke(4, 0), 55);
    EXPECT_EQ(ws.Stroke(0, 1), 66);
}

TEST_F(MaskFile, LongFileIsReadOnlyToTheMaskSize) {
    Workspace ws;
    PaintThreeStrokes(ws);
    store::Bytes bytes = store::EncodePaintMask(ws.PaintMask);
    bytes.resize(bytes.size() + 1000, 0x7F);   // trailing rubbish
    writeRaw("long.msk", bytes);
    Workspace back;
    ASSERT_EQ(store::ReadPaintMask(back, path("long.bmo")), store::MaskRead::Loaded);
    EXPECT_EQ(back.PaintMask, ws.PaintMask);
    EXPECT_EQ(back.PaintMask.size(), 241402u);
}

TEST_F(MaskFile, MissingFileLeavesTheMask) {
    Workspace ws;
    ws.Stroke(10, 10) = 4;
    EXPECT_EQ(store::ReadPaintMask(ws, path("none.bmo")), store::MaskRead::Missing);
    EXPECT_EQ(ws.Stroke(10, 10), 4);
    EXPECT_FALSE(fs::exists(path("none.msk")));
}

TEST_F(MaskFile, ColourPlaneBeyondTheTwelveBoxesIsBroken) {
    struct Row { int16_t color; bool broken; };
    for (const Row& row : {Row{12, false}, Row{-12, false}, Row{13, true}, Row{-13, true}, Row{32767, true}}) {
        Workspace painted;
        painted.Stroke(20, 30) = 1;
        painted.ColorPlane(20, 30) = row.color;
        std::string error;
        ASSERT_TRUE(store::WritePaintMask(painted, path("w"), error));
        Workspace ws;
        ws.Stroke(1, 1) = 9;
        const store::MaskRead result = store::ReadPaintMask(ws, path("w.bmo"));
        EXPECT_EQ(result == store::MaskRead::Broken, row.broken) << row.color;
        if (row.broken) {
            EXPECT_TRUE(std::all_of(ws.PaintMask.begin(), ws.PaintMask.end(), [](int16_t v) { return v == 0; }));
        } else {
            EXPECT_EQ(ws.ColorPlane(20, 30), row.color);
        }
    }
}

} // namespace
