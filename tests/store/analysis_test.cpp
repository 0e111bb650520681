#include <gtest/gtest.h>

#include "imaging/HSLcolor.h"
#include "store/Analysis.h"

namespace {

int32_t Rgb(int r, int g, int b) { return r + 256 * g + 65536 * b; }

// A 3 x 2 photo (MaxX 2, MaxY 1):
//   (10,20,30)   (100,0,50)  (200,40,0)
//   (60,90,120)  (30,60,90)  (255,0,0)
void SmallPhoto(Workspace& ws) {
    ws.MaxX = 2;
    ws.MaxY = 1;
    const int32_t px[6] = {Rgb(10, 20, 30), Rgb(100, 0, 50), Rgb(200, 40, 0),
                           Rgb(60, 90, 120), Rgb(30, 60, 90), Rgb(255, 0, 0)};
    for (int i = 0; i < 6; ++i) ws.Picture2.setPixel(i % 3, i / 3, px[i]);
}

TEST(Analysis, SmallPhotoGivesHandWorkedPlanes) {
    // Planes 0..2 and the luma, pixel by pixel. The interior from its left and
    // upper neighbours (0 at first), the top row from below, the left column
    // from the right; averages 665/7 = 95, 230/7 = 33, 320/7 = 46; the
    // contrast step only inside, wrapping both ways.
    const int expected[6][4] = {{32, 15, 35, 18},  {55, 10, 40, 35},   {144, 24, 5, 83},
                                {35, 55, 75, 84},  {181, 7, 14, 54},   {81, 237, 230, 76}};
    Workspace ws;
    SmallPhoto(ws);
    ws.Stroke(3, 1) = 8;   // outside the photo: not visited
    store::PhotoAverages avg;
    ASSERT_TRUE(store::AnalysePhoto(ws, nullptr, &avg));
    EXPECT_EQ(avg.pixelCount, 7);   // (0, 0) counted twice
    EXPECT_EQ(std::vector<int32_t>({avg.red, avg.green, avg.blue}), std::vector<int32_t>({95, 33, 46}));
    EXPECT_EQ(ws.RefLum, 52.0f);    // floor(368 / 7)
    for (int i = 0; i < 6; ++i) {
        const int x = i % 3, y = i / 3;
        EXPECT_EQ(std::vector<int32_t>({ws.Plane(x, y, 0), ws.Plane(x, y, 1), ws.Plane(x, y, 2), ws.Luma(x, y)}),
                  std::vector<int32_t>(expected[i], expected[i] + 4)) << x << "," << y;
    }
    // Plane 3 comes from the smoothed colour before the contrast step: (10, 20, 30) at (1, 1).
    EXPECT_EQ(ws.Plane(1, 1, 3), std::nearbyint(HSLcolor::RGBToHSL(10, 20, 30).lum));
    EXPECT_EQ(ws.Stroke(3, 1), 8);
}

TEST(Analysis, HueWaveNearTheEndsOfTheCircle) {
    for (const auto& [hue, lum, wave] : {std::tuple{0.f, 0.f, 128}, {255.f, 255.f, 125}, {64.f, 100.f, 255}, {192.f, 100.f, 1}})
        EXPECT_EQ(store::HueWave(hue, lum), wave) << hue << " " << lum;
}

TEST(Analysis, SamePhotoGivesSamePlanesWhateverCameBefore) {
    Workspace fresh, reused;
    SmallPhoto(fresh);
    SmallPhoto(reused);
    std::fill(reused.PixelPlanes.begin(), reused.PixelPlanes.end(), 77);   // a previous photo's planes
    ASSERT_TRUE(store::AnalysePhoto(fresh, nullptr));
    ASSERT_TRUE(store::AnalysePhoto(reused, nullptr));
    for (int p = 0; p < 6; ++p)
        for (int i = 0; i < 6; ++i) EXPECT_EQ(reused.Plane(i % 3, i / 3, p), fresh.Plane(i % 3, i / 3, p)) << p << " " << i;
}

} // namespace
