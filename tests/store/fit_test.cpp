#include <gtest/gtest.h>

#include "store/Fit.h"

TEST(FitSource, CropsTheWiderOrTallerSide) {
    struct Row { int w, h; bool autoCrop; store::SourceRect expected; };
    const Row rows[] = {
        {800, 300, true, {200, 0, 400, 300}},     // c = 200: the middle 400 x 300
        {400, 600, true, {0, 150, 400, 300}},     // rows 150..449
        {1600, 1200, true, {1, 0, 1598, 1200}},   // already 4:3, still one column off each side
        {400, 300, true, {0, 0, 400, 300}},
        {800, 300, false, {0, 0, 800, 300}},      // stretched: the whole photo
        {1, 1000, true, {0, 499, 1, 2}},          // c would be 500: something must be left
    };
    for (const Row& r : rows)
        EXPECT_EQ(store::FitSource(r.w, r.h, 400, 300, r.autoCrop), r.expected) << r.w << " x " << r.h;
}

TEST(ResampleArea, AveragesTheCoveredPartOfTheSource) {
    // Green edges cropped off; 90 red, 30 red, 60 blue into two targets of 1.5 source pixels each.
    const uint32_t px[5] = {0xFF00FF00, 0xFF5A0000, 0xFF1E0000, 0xFF00003C, 0xFF00FF00};
    const Picture out = store::ResampleArea(store::PixelBuffer{px, 5, 1, 5}, 1, 0, 3, 1, 2, 1);
    EXPECT_EQ(out.pixel(0, 0), 70);               // (90 + 0.5 * 30) / 1.5
    EXPECT_EQ(out.pixel(1, 0), 10 + 65536 * 40);  // (0.5 * 30) / 1.5 red, 60 / 1.5 blue
}
