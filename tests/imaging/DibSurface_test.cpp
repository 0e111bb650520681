#include <gtest/gtest.h>

#include <climits>
#include <set>
#include <stdexcept>

#include "imaging/DibSurface.h"
#include "imaging/HSLcolor.h"

namespace {

using HSLcolor::JoinColor;

// A picture where every pixel differs from its mirror images and red differs from blue.
Picture Ramp(int width, int height) {
    Picture p(width, height);
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x) p.setPixel(x, y, JoinColor(x % 251, y % 241, 7 + (3 * x + 5 * y) % 200));
    return p;
}

// Blue, green and red at byte `offset` of the block.
std::array<int, 3> BytesAt(const DibSurface& s, size_t offset) {
    const uint8_t* p = s.DIBSectionBitsPtr() + offset;
    return {p[0], p[1], p[2]};
}

// Writes `value` into the padding of every row; counts the rows that still hold it.
void MarkPadding(DibSurface& s, uint8_t value) {
    for (int r = 0; r < s.Height(); ++r)
        for (int i = 3 * s.Width(); i < s.BytesPerScanLine(); ++i) s.DIBSectionBitsPtr()[r * s.BytesPerScanLine() + i] = value;
}
bool PaddingHolds(const DibSurface& s, uint8_t value) {
    for (int r = 0; r < s.Height(); ++r)
        for (int i = 3 * s.Width(); i < s.BytesPerScanLine(); ++i)
            if (s.DIBSectionBitsPtr()[r * s.BytesPerScanLine() + i] != value) return false;
    return true;
}

TEST(DibSurface, StrideIsThreeBytesAPixelPaddedToFour) {
    const std::pair<int, int> table[] = {{1, 4}, {2, 8}, {3, 12}, {4, 12}, {400, 1200}, {401, 1204}};
    for (const auto& [width, stride] : table) {
        DibSurface s;
        ASSERT_TRUE(s.Create(width, 3));
        EXPECT_EQ(s.BytesPerScanLine(), stride) << width;
        EXPECT_EQ(s.ImageSize(), 3 * stride) << width;
    }
}

TEST(DibSurface, PictureRowsLieBottomUpInBlueGreenRed) {
    const Picture picture = Ramp(400, 300);
    DibSurface s;
    s.CreateFromPicture(picture);
    ASSERT_TRUE(s.live());
    EXPECT_EQ(s.Width(), 400);
    EXPECT_EQ(s.Height(), 300);
    EXPECT_EQ(s.BytesPerScanLine(), 1200);
    // Top left (0, 0) = red 0, green 0, blue 7 at the start of the last memory row.
    EXPECT_EQ(BytesAt(s, 299 * 1200), (std::array<int, 3>{7, 0, 0}));
    // Bottom left (0, 299): red 0, green 58, blue (1495 % 200) + 7 = 102.
    EXPECT_EQ(BytesAt(s, 0), (std::array<int, 3>{102, 58, 0}));
    // Top right (399, 0): red 148, green 0, blue (1197 % 200) + 7 = 204.
    EXPECT_EQ(BytesAt(s, 299 * 1200 + 3 * 399), (std::array<int, 3>{204, 0, 148}));

    Picture back(400, 300);
    s.PaintPicture(back);
    EXPECT_EQ(back, picture);
}

TEST(DibSurface, BlockTransfersClipAtBothPictures) {
    // A 3 x 2 surface taken from (2, 1) of a 4 x 3 picture, painted back at (2, 0) of a 4 x 2 one.
    const Picture picture = Ramp(4, 3);
    DibSurface s;
    ASSERT_TRUE(s.Create(3, 2));
    s.LoadPictureBlt(picture, 2, 1);
    Picture target(4, 2, 0x010203);
    s.PaintPicture(target, 2, 0);
    const int32_t u = 0x010203;
    const int32_t expected[2][4] = {{u, u, picture.pixel(2, 1), picture.pixel(3, 1)},
                                    {u, u, picture.pixel(2, 2), picture.pixel(3, 2)}};
    for (int y = 0; y < 2; ++y)
        for (int x = 0; x < 4; ++x) EXPECT_EQ(target.pixel(x, y), expected[y][x]) << x << "," << y;
    // The picture has no column 4: the surface's last column stays black.
    for (const size_t offset : {6u, 18u}) EXPECT_EQ(BytesAt(s, offset), (std::array<int, 3>{0, 0, 0}));
}

TEST(DibSurface, OddWidthsKeepTheirPaddingUntouched) {
    DibSurface s;
    ASSERT_TRUE(s.Create(401, 5));
    MarkPadding(s, 0xAB);
    s.LoadPictureBlt(Ramp(401, 5));
    EXPECT_TRUE(PaddingHolds(s, 0xAB));
    for (const bool gray : {true, false}) {
        s.RandomiseBits(gray);
        EXPECT_TRUE(PaddingHolds(s, 0xAB)) << gray;
    }
    const auto smaller = s.Resample(3, 201);
    ASSERT_TRUE(smaller);
    EXPECT_EQ(smaller->BytesPerScanLine(), 604);
    EXPECT_TRUE(PaddingHolds(*smaller, 0));
}

TEST(DibSurface, RandomBitsAreGreyOrWithoutBlue) {
    for (const bool gray : {true, false}) {
        DibSurface s;
        ASSERT_TRUE(s.Create(37, 23));
        s.RandomiseBits(gray);
        std::set<int> greens, reds;
        for (int r = 0; r < 23; ++r)
            for (int x = 0; x < 37; ++x) {
                const auto [b, g, red] = BytesAt(s, static_cast<size_t>(r * s.BytesPerScanLine() + 3 * x));
                if (gray) {
                    EXPECT_TRUE(b == g && g == red) << x << "," << r;
                } else {
                    EXPECT_EQ(b, 0) << x << "," << r;
                }
                greens.insert(g);
                reds.insert(red);
            }
        // 851 pixels of noise: many different values, in both channels.
        EXPECT_GT(greens.size(), 100u);
        EXPECT_GT(reds.size(), 100u);
    }
}

TEST(DibSurface, ResampleToTheSameSizeCopiesAndToOnePixelTakesTheFirst) {
    DibSurface s;
    s.CreateFromPicture(Ramp(401, 7));
    const auto copy = s.Resample(7, 401);
    ASSERT_TRUE(copy);
    EXPECT_EQ(std::vector<uint8_t>(copy->DIBSectionBitsPtr(), copy->DIBSectionBitsPtr() + copy->ImageSize()),
              std::vector<uint8_t>(s.DIBSectionBitsPtr(), s.DIBSectionBitsPtr() + s.ImageSize()));
    const auto one = s.Resample(1, 1);
    ASSERT_TRUE(one);
    EXPECT_EQ(BytesAt(*one, 0), BytesAt(s, 0));   // the bottom-left pixel of the picture
    EXPECT_EQ(s.Resample(0, 5), nullptr);
}

TEST(DibSurface, ResampleIsBilinearWithTiesToEven) {
    // Blue of a 3 x 3 source by memory row; green 0 and red 255 throughout.
    const int blue[3][3] = {{10, 21, 40}, {30, 48, 60}, {50, 70, 90}};
    DibSurface s;
    ASSERT_TRUE(s.Create(3, 3));
    for (int r = 0; r < 3; ++r)
        for (int x = 0; x < 3; ++x) {
            uint8_t* p = s.DIBSectionBitsPtr() + r * s.BytesPerScanLine() + 3 * x;
            p[0] = static_cast<uint8_t>(blue[r][x]);
            p[2] = 255;
        }
    // Scales 2/4: every other target sample falls halfway. 15.5 -> 16, 30.5 -> 30,
    // 34.5 -> 34 (so 27 and 42 next to it), 49.5 -> 50.
    const int expected[4][4] = {{10, 16, 21, 30}, {20, 27, 34, 42}, {30, 39, 48, 54}, {40, 50, 59, 67}};
    const auto big = s.Resample(4, 4);
    ASSERT_TRUE(big);
    for (int r = 0; r < 4; ++r)
        for (int x = 0; x < 4; ++x)
            EXPECT_EQ(BytesAt(*big, static_cast<size_t>(r * big->BytesPerScanLine() + 3 * x)),
                      (std::array<int, 3>{expected[r][x], 0, 255}))
                << x << "," << r;
}

TEST(DibSurface, SizesBeyondThirtyTwoBitsAreRefusedUnallocated) {
    const std::pair<int32_t, int32_t> tooLarge[] = {{715827882, 1}, {INT32_MAX, 1}, {40000, 20000}, {400, INT32_MAX}};
    for (const auto& [width, height] : tooLarge) {
        DibSurface s;
        ASSERT_TRUE(s.Create(4, 2));
        EXPECT_THROW(s.Create(width, height), std::overflow_error) << width << " x " << height;
        EXPECT_FALSE(s.live());
        EXPECT_EQ(s.Width(), 4);
    }
    // Sizes the platform refuses: no block, the size kept.
    DibSurface s;
    EXPECT_FALSE(s.Create(0, 5));
    EXPECT_FALSE(s.Create(-3, 5));
    EXPECT_EQ(s.DIBSectionBitsPtr(), nullptr);
    EXPECT_EQ(s.Width(), -3);
}

} // namespace
