#pragma once
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "paint/ColorBox.h"

// The "PAINT CHOICE" sheet as plain data: where every text, box and line goes,
// in twips (1440 per inch) from the printable area's top-left corner. The
// window draws it with the printer; tests read the numbers.
namespace print {

inline constexpr double kSheetMargin = 800.0;
inline constexpr int32_t kShadowColor = 0xA0A0A0;
inline constexpr double kShadowOffset = 100.0;
inline constexpr double kSwatchWidth = 2000.0;
inline constexpr double kSwatchHeight = 400.0;
inline constexpr double kWritingLineLeft = 5350.0;
inline constexpr double kWritingLineRight = 10100.0;
// Text columns of the title line and the list.
inline constexpr int kDateColumn = 75;
inline constexpr int kItemColumn = 31;
inline constexpr int kChoiceColumn = 51;

// What the layout needs to know of the printer's font, in twips.
struct SheetFont {
    double lineHeight = 0.0;    // one line of text
    double columnWidth = 0.0;   // one text column (tab stops are counted in these)
    std::function<double(const std::string&)> textWidth;
};

// The paper: its whole width, and the printable area the sheet is laid in.
struct SheetPage {
    double width = 0.0;
    double printableWidth = 0.0;
    double printableHeight = 0.0;
};

// Text whose cell has its top-left corner at (x, y).
struct SheetText {
    int page = 0;
    double x = 0.0;
    double y = 0.0;
    std::string text;
};

struct SheetRect {
    double left = 0.0;
    double top = 0.0;
    double right = 0.0;
    double bottom = 0.0;
    double width() const { return right - left; }
    double height() const { return bottom - top; }
};

struct SheetLine {
    double x1 = 0.0, y1 = 0.0, x2 = 0.0, y2 = 0.0;
};

// One colour box in use: its swatch (black outline, filled with the paint
// colour), its name, and the line the user writes the chosen paint on.
struct SheetRow {
    int box = 0;
    int page = 0;
    int32_t color = kButtonFace;
    SheetText name;
    SheetRect swatch;
    SheetLine writingLine;
};

struct PaintChoiceSheet {
    int pages = 1;
    SheetText pictureName;
    SheetText date;
    SheetRect shadow;    // filled with kShadowColor
    SheetRect picture;   // the work picture, stretched
    SheetRect frame;     // black outline
    // "COLOR", "ITEM", "PAINT CHOICE" and their rules; a continued page repeats them.
    std::vector<SheetText> headings;
    std::vector<SheetRow> rows;
};

struct SheetContent {
    std::string pictureName;
    std::string date;
    ColorBoxes boxes;
    float maxX = 399.0f;
    float maxY = 299.0f;
};

// The picture's name as the sheet prints it: no folder, no extension.
std::string SheetPictureName(const std::string& currentPicturePath);

// Lays out the sheet. A box is listed when it has a reference colour, in box
// order. Rows that would run past the printable area continue on a new page
// under repeated headings, and a date that would run past the right edge is
// pulled back inside it.
PaintChoiceSheet LayoutPaintChoiceSheet(const SheetContent& content, const SheetPage& page, const SheetFont& font);

} // namespace print
