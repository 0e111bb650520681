#include <gtest/gtest.h>

#include "imaging/HSLcolor.h"
#include "store/Analysis.h"

namespace {

int32_t Rgb(int r, int g, int b) { return r + 256 * g + 65536 * b; }

// A 3 x 2 photo in the top-left corner of Picture2 (MaxX 2, MaxY 1):
//   (10,20,30)   (100,0,50)  (200,40,0)
//   (60,90,120)  (30,60,90)  (255,0,0)
void SmallPhoto(Workspace& ws) {
    ws.MaxX = 2;
    ws.MaxY = 1;
    const int32_t rows[2][3] = {{Rgb(10, 20, 30), Rgb(100, 0, 50), Rgb(200, 40, 0)},
                                {Rgb(60, 90, 120), Rgb(30, 60, 90), Rgb(255, 0, 0)}};
    for (int y = 0; y < 2; ++y)
        for (int x = 0; x < 3; ++x) ws.Picture2.setPixel(x, y, rows[y][x]);
}

struct PlaneRow {
    int x, y;
    int r, g, b;       // planes 0..2 after the contrast step
    int sr, sg, sb;    // the smoothed colour planes 3..5 were taken from
    int luma;
};

// Worked by hand: the interior from its left and upper neighbours (0 at
// first), the top row from below, the left column from the right; averages
// 665/7 = 95, 230/7 = 33, 320/7 = 46; contrast only inside.
const PlaneRow kPlanes[] = {
    {0, 0, 32, 15, 35, 32, 15, 35, 18},
    {1, 0, 55, 10, 40, 55, 10, 40, 35},
    {2, 0, 144, 24, 5, 144, 24, 5, 83},
    {0, 1, 35, 55, 75, 35, 55, 75, 84},
    {1, 1, 181, 7, 14, 10, 20, 30, 54},
    {2, 1, 81, 237, 230, 88, 7, 10, 76},
};

TEST(Analysis, SmallPhotoGivesHandWorkedPlanes) {
    Workspace ws;
    SmallPhoto(ws);
    ws.Stroke(1, 1) = 5;
    ws.ColorPlane(1, 1) = 2;
    ws.Stroke(3, 1) = 8;     // outside the photo: not visited
    ws.StrokeNumber = 5;
    ws.UndoEnabled = ws.RedoEnabled = true;
    store::PhotoAverages avg;
    ASSERT_TRUE(store::AnalysePhoto(ws, nullptr, &avg));

    EXPECT_EQ(avg.pixelCount, 7);   // (0, 0) counted twice
    EXPECT_EQ(avg.red, 95);
    EXPECT_EQ(avg.green, 33);
    EXPECT_EQ(avg.blue, 46);
    EXPECT_EQ(ws.RefLum, 52.0f);    // floor(368 / 7)
    for (const PlaneRow& r : kPlanes) {
        SCOPED_TRACE(testing::Message() << "pixel " << r.x << "," << r.y);
        EXPECT_EQ(ws.Plane(r.x, r.y, 0), r.r);
        EXPECT_EQ(ws.Plane(r.x, r.y, 1), r.g);
        EXPECT_EQ(ws.Plane(r.x, r.y, 2), r.b);
        EXPECT_EQ(ws.Luma(r.x, r.y), r.luma);
        const HSLcolor::HSL hsl = HSLcolor::RGBToHSL(r.sr, r.sg, r.sb);
        EXPECT_EQ(ws.Plane(r.x, r.y, 3), static_cast<int>(std::nearbyint(hsl.lum)));
        EXPECT_EQ(ws.Plane(r.x, r.y, 5), static_cast<int>(std::nearbyint(hsl.sat)));
        EXPECT_EQ(ws.Plane(r.x, r.y, 4), store::HueWave(hsl.hue, hsl.lum));
    }
    EXPECT_EQ(ws.Stroke(1, 1), 0);
    EXPECT_EQ(ws.ColorPlane(1, 1), 0);
    EXPECT_EQ(ws.Stroke(3, 1), 8);
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_FALSE(ws.RedoEnabled);
}

TEST(Analysis, ContrastStepDoublesAroundTheAverageWithWrapAround) {
    Workspace ws;
    ws.MaxX = 2;
    ws.MaxY = 1;
    ws.Plane(1, 1, 0) = 200;   // -> (400 - 100 + 256) mod 256 = 44
    ws.Plane(2, 1, 0) = 150;   // -> 200
    ws.Plane(1, 1, 1) = 0;     // -> (0 - 255 + 256) = 1
    ws.Plane(1, 1, 2) = 255;   // -> (510 - 0 + 256) mod 256 = 254
    ws.Plane(0, 1, 0) = 200;   // column 0 and row 0 keep their values
    ws.Plane(1, 0, 0) = 150;
    ws.Plane(1, 1, 3) = 77;    // planes 3..5 untouched
    ASSERT_TRUE(store::ApplyContrastStep(ws, store::PhotoAverages{1, 100, 255, 0}, nullptr));
    EXPECT_EQ(ws.Plane(1, 1, 0), 44);
    EXPECT_EQ(ws.Plane(2, 1, 0), 200);
    EXPECT_EQ(ws.Plane(1, 1, 1), 1);
    EXPECT_EQ(ws.Plane(1, 1, 2), 254);
    EXPECT_EQ(ws.Plane(0, 1, 0), 200);
    EXPECT_EQ(ws.Plane(1, 0, 0), 150);
    EXPECT_EQ(ws.Plane(1, 1, 3), 77);
}

TEST(Analysis, HueWaveNearTheEndsOfTheCircle) {
    struct Row { float hue, lum; int expected; };
    for (const Row& r : {Row{0, 0, 128}, Row{255, 255, 125}, Row{64, 100, 255}, Row{192, 100, 1}})
        EXPECT_EQ(store::HueWave(r.hue, r.lum), r.expected) << r.hue << " " << r.lum;
}

TEST(Analysis, SamePhotoGivesSamePlanesWhateverCameBefore) {
    Workspace ws;
    SmallPhoto(ws);
    ws.MaxX = 399;
    ws.MaxY = 299;
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) ws.Picture2.setPixel(x, y, Rgb((x * 3) % 256, (y * 5) % 256, (x + y) % 256));
    const Picture first = ws.Picture2;
    ASSERT_TRUE(store::AnalysePhoto(ws, nullptr));
    const std::vector<int32_t> planes = ws.PixelPlanes;

    ws.Picture2.fill(Rgb(250, 10, 130));   // another photo in between
    ASSERT_TRUE(store::AnalysePhoto(ws, nullptr));
    EXPECT_NE(ws.PixelPlanes, planes);

    ws.Picture2 = first;
    ASSERT_TRUE(store::AnalysePhoto(ws, nullptr));
    EXPECT_EQ(ws.PixelPlanes, planes);
}

TEST(Analysis, StopsWhenTheYieldSaysSo) {
    Workspace ws;
    ws.Picture2.fill(Rgb(10, 200, 30));
    ws.Stroke(399, 10) = 3;
    int calls = 0;
    EXPECT_FALSE(store::AnalysePhoto(ws, [&] { return ++calls < 5; }));
    EXPECT_EQ(calls, 5);                 // before each column: stopped at the fifth
    EXPECT_EQ(ws.Stroke(399, 10), 3);    // columns not reached are untouched
    calls = 0;
    EXPECT_TRUE(store::AnalysePhoto(ws, [&] { return ++calls > 0; }));
    EXPECT_EQ(calls, 2 * 399);           // interior and contrast columns
}

} // namespace
