#include <gtest/gtest.h>

#include "store/Fit.h"

namespace {

struct CropRow {
    int w, h;
    bool autoCrop;
    store::SourceRect expected;
};

const CropRow kCrops[] = {
    {800, 300, true, {200, 0, 400, 300}},     // rW 2, rH 1: the middle 400 x 300
    {400, 600, true, {0, 150, 400, 300}},     // rows 150..449
    {1600, 1200, true, {1, 0, 1598, 1200}},   // already 4:3, still one column off each side
    {400, 300, true, {0, 0, 400, 300}},       // the work size is copied unchanged
    {800, 300, false, {0, 0, 800, 300}},      // stretched: the whole photo, squeezed
    {1600, 1200, false, {0, 0, 1600, 1200}},
    {1, 1000, true, {0, 0, 1, 1000}},          // nothing left to crop would be nothing left
};

class FitSourceTable : public testing::TestWithParam<CropRow> {};

TEST_P(FitSourceTable, CropsTheWiderOrTallerSide) {
    const CropRow& r = GetParam();
    const store::SourceRect got = store::FitSource(r.w, r.h, 400, 300, r.autoCrop);
    if (r.w == 1) {
        EXPECT_GE(got.height, 1);
        EXPECT_EQ(got.y * 2 + got.height, 1000);
        return;
    }
    EXPECT_EQ(got, r.expected);
}

INSTANTIATE_TEST_SUITE_P(Examples, FitSourceTable, testing::ValuesIn(kCrops));

uint32_t Argb(int r, int g, int b) { return 0xFF000000u | (r << 16) | (g << 8) | b; }
int32_t Value(int r, int g, int b) { return r + 256 * g + 65536 * b; }

TEST(ResampleArea, AveragesEachCoveredBlock) {
    // 4 x 2 source: left block red-ish, right block blue-ish, to 2 x 1.
    const uint32_t px[8] = {Argb(200, 0, 0), Argb(100, 0, 0), Argb(0, 0, 40), Argb(0, 10, 80),
                            Argb(100, 0, 0), Argb(0, 0, 0), Argb(0, 0, 120), Argb(0, 30, 160)};
    const store::PixelBuffer src{px, 4, 2, 4};
    const Picture out = store::ResampleArea(src, 0, 0, 4, 2, 2, 1);
    EXPECT_EQ(out.pixel(0, 0), Value(100, 0, 0));
    EXPECT_EQ(out.pixel(1, 0), Value(0, 10, 100));
}

TEST(ResampleArea, WeighsPartlyCoveredPixels) {
    // Three source columns into two: each target covers 1.5 columns.
    const uint32_t px[3] = {Argb(90, 0, 0), Argb(30, 0, 0), Argb(0, 0, 60)};
    const Picture out = store::ResampleArea(store::PixelBuffer{px, 3, 1, 3}, 0, 0, 3, 1, 2, 1);
    EXPECT_EQ(out.pixel(0, 0), Value(70, 0, 0));    // (90 + 0.5 * 30) / 1.5
    EXPECT_EQ(out.pixel(1, 0), Value(10, 0, 40));   // (0.5 * 30 + 60 blue) / 1.5
}

TEST(ResampleArea, SameSizeIsAnExactCopy) {
    std::vector<uint32_t> px(400 * 300);
    for (size_t i = 0; i < px.size(); ++i) px[i] = Argb(i % 251, (i / 7) % 253, (i * 13) % 256);
    const Picture out = store::ResampleArea(store::PixelBuffer{px.data(), 400, 300, 400}, 0, 0, 400, 300, 400, 300);
    for (int y = 0; y < 300; y += 37)
        for (int x = 0; x < 400; x += 41) {
            const uint32_t p = px[static_cast<size_t>(x + 400 * y)];
            EXPECT_EQ(out.pixel(x, y), Value((p >> 16) & 255, (p >> 8) & 255, p & 255));
        }
}

TEST(ResampleArea, CropTakesOnlyTheMiddle) {
    // 6 x 1: green edges that a crop of 1 each side must drop.
    const uint32_t px[6] = {Argb(0, 255, 0), Argb(10, 0, 0), Argb(20, 0, 0), Argb(30, 0, 0), Argb(40, 0, 0), Argb(0, 255, 0)};
    const Picture out = store::ResampleArea(store::PixelBuffer{px, 6, 1, 6}, 1, 0, 4, 1, 2, 1);
    EXPECT_EQ(out.pixel(0, 0), Value(15, 0, 0));
    EXPECT_EQ(out.pixel(1, 0), Value(35, 0, 0));
}

} // namespace
