#include "scheme/ColorScheme.h"

#include <gtest/gtest.h>

#include <tuple>

#include "imaging/HSLcolor.h"
#include "scheme/SchemeFile.h"

namespace {

float LumOf(int32_t color) { return HSLcolor::RGBToHSL(HSLcolor::SplitColor(color)).lum; }

TEST(ColorScheme, SetNewColorTakesTheAbsoluteIndexAndIgnoresOthers) {
    Workspace ws;
    ws.Boxes[4].reference = 0x203040;
    const ColorBoxes before = ws.Boxes;
    for (int index : {0, 13, -13, INT32_MIN}) SetNewColor(ws, 0x00FF00, index);
    EXPECT_EQ(ws.Boxes, before);
    SetNewColor(ws, 0x3366CC, -4);
    const HSLcolor::HSL hsl = HSLcolor::RGBToHSL(0xCC, 0x66, 0x33);
    EXPECT_EQ(ws.Boxes[4], (ColorBox{before[4].name, 0x3366CC, 0x203040}));
    EXPECT_EQ(std::tie(ws.PaintHue, ws.PaintSat, ws.PaintLum), std::tie(hsl.hue, hsl.sat, hsl.lum));
    for (int i : {1, 3, 5, 12}) EXPECT_FALSE(ws.Boxes[i].hasColor()) << i;
    EXPECT_EQ(ws.CurrentColor, 1);  // giving a colour does not select
}

TEST(ColorScheme, NameTurnsBlackFromGreenOneHundred) {
    const std::pair<int32_t, int32_t> rows[] = {{0x006300, kWhite}, {0x0064FF, kBlack}, {0xFF63FF, kWhite}, {kButtonFace, kWhite}};
    for (const auto& [color, fore] : rows) EXPECT_EQ(ForeColorFor(color), fore) << std::hex << color;
}

TEST(ColorScheme, SelectingABoxEndsTheModalToolsAndClearingKeepsTheSelection) {
    Workspace ws;
    ws.Boxes[2].color = 0x10A040;
    ws.Boxes[6] = {"Shed", kButtonFace, 0x808080};
    ws.PickupLabelVisible = ws.SetReferenceMode = true;
    ws.RefLum = 7.0f;
    SelectBox(ws, 2);
    EXPECT_EQ(ws.PaintLum, LumOf(0x10A040));
    EXPECT_EQ(ws.RefLum, 7.0f);  // box 2 has no reference
    EXPECT_FALSE(ws.PickupLabelVisible || ws.SetReferenceMode);
    EXPECT_EQ(ws.Cursor, PictureCursor::WideRoller);
    SelectBox(ws, 6);
    EXPECT_EQ(ws.CurrentColor, 6);
    EXPECT_EQ(ws.RefLum, LumOf(0x808080));
    EXPECT_EQ(ws.Cursor, PictureCursor::NoDrop);
    const Workspace before = ws;
    ClearAllColors(ws);  // names, selection and drawing colour stay
    for (int i = 1; i <= kColorBoxCount; ++i) EXPECT_EQ(ws.Boxes[i], (ColorBox{before.Boxes[i].name, kButtonFace, 0}));
    EXPECT_EQ(std::tie(ws.CurrentColor, ws.PaintLum, ws.RefLum), std::tie(before.CurrentColor, before.PaintLum, before.RefLum));
}

TEST(ColorScheme, OnlyAWholeSchemeLoadsAndBox12IsLeftAsDrawingColour) {
    Workspace ws;
    ws.Boxes[9] = {"Shed", 0x224466, 0x111111};
    const ColorBoxes before = ws.Boxes;
    ColorBoxes other;
    other.fill({"Other", 0x0A0B0C, 0x0C0B0A});  // 15 bytes a record
    other[12].color = 0x00C000;
    const std::vector<uint8_t> full = SchemeFile::Encode(other);
    std::vector<std::string> problems(full.size() + 1);
    for (size_t size = 0; size < full.size(); ++size) {
        EXPECT_FALSE(LoadScheme(ws, std::vector<uint8_t>(full.begin(), full.begin() + static_cast<long>(size)), problems[size]));
        ASSERT_EQ(ws.Boxes, before) << "cut at " << size;
    }
    EXPECT_EQ(problems[0], "The file is empty.");
    EXPECT_EQ(problems[75], "The file holds only 5 of the 12 colour boxes.");
    EXPECT_EQ(problems[179], "The file ends inside the record of box 12.");
    ASSERT_TRUE(LoadScheme(ws, full, problems[180])) << problems[180];
    EXPECT_EQ(ws.Boxes[12], other[12]);
    EXPECT_EQ(ws.PaintLum, LumOf(0x00C000));
    EXPECT_EQ(ws.CurrentColor, 1);
}

} // namespace
