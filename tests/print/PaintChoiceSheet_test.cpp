#include "print/PaintChoiceSheet.h"

#include <gtest/gtest.h>

using namespace print;

namespace {

// A made-up font: lines of 300 twips, every character 100 wide, so a column is 100.
SheetFont EvenFont() {
    return SheetFont{300.0, 100.0, [](const std::string& s) { return 100.0 * static_cast<double>(s.size()); }};
}

constexpr SheetPage kLetter{12240.0, 11880.0, 15120.0};
constexpr SheetPage kA4{210.0 / 25.4 * 1440.0, 11500.0, 16000.0};

SheetContent Content(std::initializer_list<int> usedBoxes) {
    SheetContent c{"house", "Friday, 6 March 2026", StartupColorBoxes()};
    for (int i = 1; i <= kColorBoxCount; ++i) c.boxes[static_cast<size_t>(i)].color = 0x102030 * i;  // all coloured
    for (int i : usedBoxes) c.boxes[static_cast<size_t>(i)].reference = 0x808080;
    return c;
}

std::string Texts(const std::vector<SheetText>& texts) {
    std::string out;
    for (const SheetText& t : texts)
        out += t.text + "@" + std::to_string(t.page) + ":" + std::to_string(static_cast<int>(t.x)) + "," +
               std::to_string(static_cast<int>(t.y - texts[0].y)) + " ";
    return out;
}

} // namespace

TEST(PaintChoiceSheet, PictureShadowAndFrameFollowThePaperWidth) {
    // Two thirds of the paper's width, in the work picture's 399 : 299 shape.
    const struct { const char* paper; SheetPage page; double pw, ph; } rows[] = {
        {"Letter", kLetter, 8078.4, 6053.7383},
        {"A4", kA4, 7857.6378, 5888.3050},
    };
    for (const auto& r : rows) {
        const PaintChoiceSheet s = LayoutPaintChoiceSheet(Content({}), r.page, EvenFont());
        SCOPED_TRACE(r.paper);
        EXPECT_NEAR(s.picture.left, 800.0, 1e-9);
        EXPECT_NEAR(s.picture.top, 800.0, 1e-9);
        EXPECT_NEAR(s.picture.width(), r.pw, 1e-3);
        EXPECT_NEAR(s.picture.height(), r.ph, 1e-3);
        EXPECT_NEAR(s.shadow.left - s.picture.left, 100.0, 1e-9);
        EXPECT_NEAR(s.shadow.top - s.picture.top, 100.0, 1e-9);
        EXPECT_NEAR(s.shadow.width(), r.pw, 1e-3);
        EXPECT_NEAR(s.shadow.height(), r.ph, 1e-3);
        EXPECT_EQ(s.frame.left, s.picture.left);
        EXPECT_EQ(s.frame.bottom, s.picture.bottom);
        EXPECT_EQ(s.frame.right, s.picture.right);
        // The headings start one margin below the picture.
        ASSERT_EQ(s.headings.size(), 6u);
        EXPECT_NEAR(s.headings[0].y, 800.0 + r.ph + 800.0, 1e-3);
    }
}

TEST(PaintChoiceSheet, NoBoxUsedGivesTitlePictureAndTwoHeadingLinesOnly) {
    // Every box has a colour but none a reference.
    const PaintChoiceSheet s = LayoutPaintChoiceSheet(Content({}), kLetter, EvenFont());
    EXPECT_EQ(s.pages, 1);
    EXPECT_TRUE(s.rows.empty());
    EXPECT_EQ(s.pictureName.text, "house");
    EXPECT_EQ(s.pictureName.x, 800.0);
    EXPECT_EQ(s.pictureName.y, 450.0);
    // Column 75 counted from the page's left edge, not after the name.
    EXPECT_EQ(s.date.text, "Friday, 6 March 2026");
    EXPECT_EQ(s.date.x, 7400.0);
    EXPECT_EQ(s.date.y, 450.0);
    EXPECT_EQ(Texts(s.headings), "COLOR@0:800,0 ITEM@0:3000,0 PAINT CHOICE@0:5000,0 "
                                 "======@0:800,300 ====@0:3000,300 ============@0:5000,300 ");
}

TEST(PaintChoiceSheet, RowsFollowTheBoxIndexWithSwatchNameAndWritingLine) {
    SheetContent c = Content({9, 5, 2});
    c.boxes[5].name = "Garage Door";
    c.boxes[3].reference = 0;  // coloured, never used
    const PaintChoiceSheet s = LayoutPaintChoiceSheet(c, kLetter, EvenFont());
    ASSERT_EQ(s.rows.size(), 3u);
    const double h = s.headings[3].y + 300.0;  // below the rules
    const struct { int box; const char* name; double top; } rows[] = {
        {2, "Cornice", h + 200.0}, {5, "Garage Door", h + 200.0 + 850.0}, {9, "Extra 1", h + 200.0 + 1700.0}};
    for (size_t i = 0; i < 3; ++i) {
        const SheetRow& row = s.rows[i];
        SCOPED_TRACE(row.box);
        EXPECT_EQ(row.box, rows[i].box);
        EXPECT_EQ(row.color, 0x102030 * rows[i].box);
        EXPECT_EQ(row.name.text, rows[i].name);
        EXPECT_EQ(row.name.x, 3000.0);
        EXPECT_NEAR(row.name.y, rows[i].top, 1e-9);
        // The swatch starts 50 twips above the end of the name's line.
        EXPECT_EQ(row.swatch.left, 800.0);
        EXPECT_NEAR(row.swatch.top, rows[i].top + 250.0, 1e-9);
        EXPECT_EQ(row.swatch.width(), 2000.0);
        EXPECT_EQ(row.swatch.height(), 400.0);
        EXPECT_EQ(row.writingLine.x1, 5350.0);
        EXPECT_EQ(row.writingLine.x2, 10100.0);
        EXPECT_EQ(row.writingLine.y1, row.swatch.bottom);
        EXPECT_EQ(row.writingLine.y2, row.swatch.bottom);
    }
}

TEST(PaintChoiceSheet, RowsPastTheBottomContinueOnANewPageUnderTheHeadings) {
    const PaintChoiceSheet s = LayoutPaintChoiceSheet(Content({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12}), kLetter, EvenFont());
    // Letter: the first writing line at 800 + 6053.74 + 800 + 600 + 850 = 9103.74,
    // the eighth at 15053.74, the ninth would be at 15903.74.
    ASSERT_EQ(s.rows.size(), 12u);
    EXPECT_EQ(s.pages, 2);
    for (const SheetRow& row : s.rows) {
        EXPECT_EQ(row.page, row.box <= 8 ? 0 : 1) << row.box;
        EXPECT_LE(row.writingLine.y1, kLetter.printableHeight) << row.box;
    }
    EXPECT_NEAR(s.rows[7].writingLine.y1, 15053.7383, 1e-3);
    ASSERT_EQ(s.headings.size(), 12u);
    EXPECT_EQ(Texts({s.headings.begin() + 6, s.headings.end()}),
              "COLOR@1:800,0 ITEM@1:3000,0 PAINT CHOICE@1:5000,0 ======@1:800,300 ====@1:3000,300 ============@1:5000,300 ");
    EXPECT_EQ(s.headings[6].y, 800.0);
    EXPECT_EQ(s.rows[8].name.y, 800.0 + 600.0 + 200.0);
    EXPECT_EQ(s.rows[8].name.text, "Extra 1");
}

TEST(PaintChoiceSheet, TheDateStaysOnThePaper) {
    const std::string longDate = "Wednesday, 30 September 2026";  // 2800 wide
    const struct { const char* why; std::string name; std::string date; double printableWidth, x, y; } rows[] = {
        {"fits at column 75", "house", longDate, 10200.0, 7400.0, 450.0},
        {"ends at the right edge", "house", longDate, 9000.0, 6200.0, 450.0},
        {"a name past the column: next line", std::string(70, 'n'), "6 March", 11880.0, 7400.0, 750.0},
        {"the name in the way: next line, at the edge", std::string(54, 'n'), longDate, 9000.0, 6200.0, 750.0},
    };
    for (const auto& r : rows) {
        SheetContent c = Content({});
        c.pictureName = r.name;
        c.date = r.date;
        const PaintChoiceSheet s = LayoutPaintChoiceSheet(c, SheetPage{12240.0, r.printableWidth, 15120.0}, EvenFont());
        EXPECT_EQ(s.date.x, r.x) << r.why;
        EXPECT_EQ(s.date.y, r.y) << r.why;
    }
}

TEST(PaintChoiceSheet, PictureNameWithoutFolderAndExtension) {
    const struct { const char* path; const char* name; } rows[] = {
        {"/opt/tintrolla/PICS/From Clipboard.xyz", "From Clipboard"},
        {"/home/ann/Photos/house.tar.jpg", "house.tar"},
        {"/home/ann/a.b/house", "house"},
        {"", ""},
    };
    for (const auto& r : rows) EXPECT_EQ(SheetPictureName(r.path), r.name) << r.path;
}
