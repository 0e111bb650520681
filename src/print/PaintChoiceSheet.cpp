#include "print/PaintChoiceSheet.h"

#include <algorithm>

#include "store/Paths.h"

namespace print {

namespace {

// The printer's current position and text output: printing moves x past the
// text, a tab goes to a column counted from the page's left edge (the next
// line when already past it), and the end of a line goes back to the left
// edge one line down.
class PrintPosition {
public:
    explicit PrintPosition(const SheetFont& font) : font_(font) {}

    double x = 0.0;
    double y = 0.0;
    int page = 0;

    double column(int n) const { return (n - 1) * font_.columnWidth; }
    void tab(int n) {
        const double to = column(n);
        if (x > to) endLine();
        x = to;
    }
    SheetText print(const std::string& text) {
        SheetText t{page, x, y, text};
        x += width(text);
        return t;
    }
    void endLine() {
        x = 0.0;
        y += font_.lineHeight;
    }
    double width(const std::string& text) const { return font_.textWidth ? font_.textWidth(text) : 0.0; }

private:
    const SheetFont& font_;
};

void PrintHeadings(PrintPosition& at, std::vector<SheetText>& out) {
    at.x = kSheetMargin;
    out.push_back(at.print("COLOR"));
    at.tab(kItemColumn);
    out.push_back(at.print("ITEM"));
    at.tab(kChoiceColumn);
    out.push_back(at.print("PAINT CHOICE"));
    at.endLine();
    at.x = kSheetMargin;
    out.push_back(at.print("======"));
    at.tab(kItemColumn);
    out.push_back(at.print("===="));
    at.tab(kChoiceColumn);
    out.push_back(at.print("============"));
    at.endLine();
}

// Where the writing line of a row started at `y` ends up.
double RowBottom(double y, const SheetFont& font) { return y + 200.0 + font.lineHeight - 50.0 + kSwatchHeight; }

} // namespace

std::string SheetPictureName(const std::string& currentPicturePath) {
    return store::FileNameOf(store::StripExtension(currentPicturePath));
}

PaintChoiceSheet LayoutPaintChoiceSheet(const SheetContent& content, const SheetPage& page, const SheetFont& font) {
    PaintChoiceSheet sheet;
    PrintPosition at(font);
    const double m = kSheetMargin;

    // Title line: the picture's name and, at its column, the date.
    at.x = m;
    at.y = m - 350.0;
    sheet.pictureName = at.print(content.pictureName);
    const double nameEnd = at.x;
    at.tab(kDateColumn);
    const double dateWidth = at.width(content.date);
    if (at.x + dateWidth > page.printableWidth) {
        // Keep the date on the paper: it ends at the right edge, clear of the
        // name, or goes to the next line when the name is in the way.
        const double left = page.printableWidth - dateWidth;
        if (at.y == sheet.pictureName.y && left < nameEnd + font.columnWidth) at.endLine();
        at.x = std::max(left, 0.0);
    }
    sheet.date = at.print(content.date);
    at.endLine();

    // The picture keeps the work picture's shape, 0.66 of the paper's width wide.
    const double pw = 0.66 * page.width;
    const double ph = pw * content.maxY / content.maxX;
    sheet.shadow = {m + kShadowOffset, m + kShadowOffset, m + kShadowOffset + pw, m + kShadowOffset + ph};
    sheet.picture = {m, m, m + pw, m + ph};
    sheet.frame = sheet.picture;
    at.x = m + pw;
    at.y = m + ph;

    at.y += m;
    PrintHeadings(at, sheet.headings);

    for (int i = 1; i <= kColorBoxCount; ++i) {
        const ColorBox& box = content.boxes[static_cast<size_t>(i)];
        if (box.reference == 0) continue;
        // A row that would run off the paper starts a new page under the headings.
        if (RowBottom(at.y, font) > page.printableHeight) {
            ++at.page;
            at.y = m;
            PrintHeadings(at, sheet.headings);
        }

        SheetRow row;
        row.box = i;
        row.page = at.page;
        row.color = box.color;
        at.y += 200.0;
        at.x = m;
        at.tab(kItemColumn);
        row.name = at.print(box.name);
        at.endLine();
        at.x = m;
        at.y -= 50.0;
        row.swatch = {at.x, at.y, at.x + kSwatchWidth, at.y + kSwatchHeight};
        row.writingLine = {kWritingLineLeft, row.swatch.bottom, kWritingLineRight, row.swatch.bottom};
        at.x = kWritingLineRight;
        at.y = row.swatch.bottom;
        sheet.rows.push_back(row);
    }
    sheet.pages = at.page + 1;
    return sheet;
}

} // namespace print
