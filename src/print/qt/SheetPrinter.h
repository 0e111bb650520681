#pragma once
#include <QFont>
#include <QImage>
#include <functional>

#include "print/PaintChoiceSheet.h"

class QPaintDevice;
class QPainter;
class QPrinter;

// The paint-choice sheet on a Qt paint device: the font's measures and the
// paper in twips for the layout, and a thin drawing of the laid-out sheet.
namespace print {

// `font` measured on `device`, in twips. A text column is the font's average
// character width, as printers count tab columns.
SheetFont SheetFontOn(const QFont& font, const QPaintDevice& device);

// The printer's paper width and printable area, in twips.
SheetPage SheetPageOf(const QPrinter& printer);

// The printer's default face at 12 pt, as `painter` starts out on it.
QFont SheetFace(const QPainter& painter);

// Draws the sheet with `painter`, whose font is the sheet's face; the device's
// resolution turns twips into its pixels. `newPage` starts every page after
// the first and returns false when it could not.
void DrawPaintChoiceSheet(QPainter& painter, const PaintChoiceSheet& sheet, const QImage& picture,
                          const std::function<bool()>& newPage);

// The whole printout on `printer`: lays the sheet out for its font and paper
// and prints it. False when the printer could not start or finish the document.
bool PrintPaintChoiceSheet(QPrinter& printer, const SheetContent& content, const QImage& picture);

} // namespace print
