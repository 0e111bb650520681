#include "scheme/ColorScheme.h"

#include <gtest/gtest.h>

#include "imaging/HSLcolor.h"
#include "scheme/SchemeFile.h"

namespace {

float LumOf(int32_t color) { return HSLcolor::RGBToHSL(HSLcolor::SplitColor(color)).lum; }

class ColorSchemeTest : public ::testing::Test {
protected:
    Workspace ws;
};

TEST_F(ColorSchemeTest, SetNewColorTakesTheAbsoluteIndexAndLeavesTheReference) {
    ws.Boxes[4].reference = 0x203040;
    SetNewColor(ws, 0x3366CC, -4);
    EXPECT_EQ(ws.Boxes[4].color, 0x3366CC);
    EXPECT_EQ(ws.Boxes[4].reference, 0x203040);
    const HSLcolor::HSL hsl = HSLcolor::RGBToHSL(0xCC, 0x66, 0x33);
    EXPECT_EQ(ws.PaintHue, hsl.hue);
    EXPECT_EQ(ws.PaintSat, hsl.sat);
    EXPECT_EQ(ws.PaintLum, hsl.lum);
    for (int i : {1, 3, 5, 12}) EXPECT_FALSE(ws.Boxes[i].hasColor()) << i;
    EXPECT_EQ(ws.CurrentColor, 1);  // giving a colour does not select
}

TEST_F(ColorSchemeTest, SetNewColorOutsideTheBoxesChangesNothing) {
    const ColorBoxes before = ws.Boxes;
    for (int index : {0, 13, -13, INT32_MIN}) SetNewColor(ws, 0x00FF00, index);
    EXPECT_EQ(ws.Boxes, before);
    EXPECT_EQ(ws.PaintLum, 0.0f);
}

TEST(ForeColor, GreenOfOneHundredTurnsTheNameBlack) {
    struct Row { int32_t color; int32_t fore; };
    const Row rows[] = {{0x006300, kWhite},   // green 99 only
                        {0x006400, kBlack},   // green 100 only
                        {0xFF63FF, kWhite},   // green 99, red and blue full
                        {0x0064FF, kBlack},   // green 100 with red
                        {0xFFFFFF, kBlack},
                        {kButtonFace, kWhite}};
    for (const Row& r : rows) EXPECT_EQ(ForeColorFor(r.color), r.fore) << std::hex << r.color;
}

TEST_F(ColorSchemeTest, SelectingABoxLoadsItsColourAndEndsTheModalTools) {
    SetNewColor(ws, 0x10A040, 6);
    ws.Boxes[6].reference = 0x808080;
    SetNewColor(ws, 0x0000FF, 1);  // drawing colour now box 1's
    ws.PickupLabelVisible = true;
    ws.SetReferenceMode = true;
    ws.RefLum = 7.0f;
    SelectBox(ws, 6);
    EXPECT_EQ(ws.CurrentColor, 6);
    EXPECT_EQ(ws.PaintLum, LumOf(0x10A040));
    EXPECT_EQ(ws.RefLum, LumOf(0x808080));
    EXPECT_FALSE(ws.PickupLabelVisible);
    EXPECT_FALSE(ws.SetReferenceMode);
    EXPECT_EQ(ws.Cursor, PictureCursor::WideRoller);
}

TEST_F(ColorSchemeTest, SelectingABoxWithoutReferenceKeepsRefLum) {
    SetNewColor(ws, 0x10A040, 2);
    ws.RefLum = 93.0f;
    SelectBox(ws, 2);
    EXPECT_EQ(ws.RefLum, 93.0f);
    SelectBox(ws, 3);  // no colour: no-drop pointer
    EXPECT_EQ(ws.Cursor, PictureCursor::NoDrop);
    EXPECT_EQ(ws.CurrentColor, 3);
}

TEST_F(ColorSchemeTest, ClearAllColorsKeepsNamesSelectionAndDrawingColour) {
    for (int i = 1; i <= kColorBoxCount; ++i) {
        SetNewColor(ws, 0x010101 * i, i);
        ws.Boxes[i].reference = 0x020202 * i;
    }
    ws.Boxes[3].name = "Hall";
    SelectBox(ws, 5);
    const float lum = ws.PaintLum, ref = ws.RefLum;
    ClearAllColors(ws);
    for (int i = 1; i <= kColorBoxCount; ++i) {
        EXPECT_EQ(ws.Boxes[i].color, kButtonFace) << i;
        EXPECT_EQ(ws.Boxes[i].reference, 0) << i;
    }
    EXPECT_EQ(ws.Boxes[3].name, "Hall");
    EXPECT_EQ(ws.Boxes[12].name, "Extra 4");
    EXPECT_EQ(ws.CurrentColor, 5);
    EXPECT_EQ(ws.PaintLum, lum);
    EXPECT_EQ(ws.RefLum, ref);
}

TEST_F(ColorSchemeTest, LoadingASchemeLeavesBox12AsDrawingColour) {
    ColorBoxes scheme = StartupColorBoxes();
    scheme[2] = {"Trim", 0x0000FF, 0x404040};
    scheme[12] = {"Gate", 0x00C000, 0};
    std::string problem;
    ASSERT_TRUE(LoadScheme(ws, SchemeFile::Encode(scheme), problem)) << problem;
    EXPECT_EQ(ws.Boxes[2], scheme[2]);
    EXPECT_EQ(ws.Boxes[12], scheme[12]);
    EXPECT_EQ(ws.PaintLum, LumOf(0x00C000));
    EXPECT_EQ(ws.CurrentColor, 1);
}

TEST_F(ColorSchemeTest, MalformedSchemeLeavesEveryBoxAsItWas) {
    SetNewColor(ws, 0x224466, 3);
    ws.Boxes[3].reference = 0x111111;
    ws.Boxes[9].name = "Shed";
    const ColorBoxes before = ws.Boxes;
    ColorBoxes other = StartupColorBoxes();
    for (int i = 1; i <= kColorBoxCount; ++i) other[i] = {"Other", 0x0A0B0C, 0x0C0B0A};
    const std::vector<uint8_t> full = SchemeFile::Encode(other);
    for (size_t size = 0; size < full.size(); ++size) {
        std::string problem;
        EXPECT_FALSE(LoadScheme(ws, std::vector<uint8_t>(full.begin(), full.begin() + static_cast<long>(size)), problem));
        ASSERT_EQ(ws.Boxes, before) << "cut at " << size;
    }
    std::vector<uint8_t> negative = full;
    negative[15 * 5] = 0xFF;  // box 6's name length (each "Other" record is 15 bytes)
    negative[15 * 5 + 1] = 0xFF;
    std::string problem;
    EXPECT_FALSE(LoadScheme(ws, negative, problem));
    EXPECT_EQ(problem, "The name of box 6 has a negative length (-1).");
    EXPECT_EQ(ws.Boxes, before);
}

} // namespace
