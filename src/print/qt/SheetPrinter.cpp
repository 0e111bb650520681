#include "print/qt/SheetPrinter.h"

#include <QFontMetricsF>
#include <QPageLayout>
#include <QPainter>
#include <QPalette>
#include <QPrinter>

namespace print {

namespace {

constexpr double kTwipsPerInch = 1440.0;
constexpr double kTwipsPerMillimetre = kTwipsPerInch / 25.4;
// Outlines and the writing lines: half a point, so they show on any printer.
constexpr double kPenTwips = 10.0;

QColor ColorOf(int32_t value) {
    // A box without a colour prints in the button face it shows on screen.
    if (value == kButtonFace) return QPalette().color(QPalette::Button);
    return QColor(value & 0xFF, (value >> 8) & 0xFF, (value >> 16) & 0xFF);
}

// Twips to the device's pixels.
class DeviceScale {
public:
    explicit DeviceScale(const QPaintDevice& device)
        : sx_(device.logicalDpiX() / kTwipsPerInch), sy_(device.logicalDpiY() / kTwipsPerInch) {}
    QRectF rect(const SheetRect& r) const {
        return QRectF(QPointF(r.left * sx_, r.top * sy_), QPointF(r.right * sx_, r.bottom * sy_));
    }
    QLineF line(const SheetLine& l) const { return QLineF(l.x1 * sx_, l.y1 * sy_, l.x2 * sx_, l.y2 * sy_); }
    QPointF point(double x, double y) const { return QPointF(x * sx_, y * sy_); }
    double width(double twips) const { return twips * sx_; }

private:
    double sx_;
    double sy_;
};

} // namespace

SheetFont SheetFontOn(const QFont& font, const QPaintDevice& device) {
    const QFontMetricsF metrics(font, &device);
    const double kx = kTwipsPerInch / device.logicalDpiX();
    const double ky = kTwipsPerInch / device.logicalDpiY();
    SheetFont out;
    out.lineHeight = metrics.height() * ky;
    out.columnWidth = metrics.averageCharWidth() * kx;
    out.textWidth = [metrics, kx](const std::string& text) {
        return metrics.horizontalAdvance(QString::fromStdString(text)) * kx;
    };
    return out;
}

SheetPage SheetPageOf(const QPrinter& printer) {
    const QPageLayout layout = printer.pageLayout();
    const QRectF paper = layout.fullRect(QPageLayout::Millimeter);
    const QRectF printable = layout.paintRect(QPageLayout::Millimeter);
    return SheetPage{paper.width() * kTwipsPerMillimetre, printable.width() * kTwipsPerMillimetre,
                     printable.height() * kTwipsPerMillimetre};
}

QFont SheetFace(const QPainter& painter) {
    QFont font = painter.font();
    font.setPointSizeF(12.0);
    return font;
}

void DrawPaintChoiceSheet(QPainter& painter, const PaintChoiceSheet& sheet, const QImage& picture,
                          const std::function<bool()>& newPage) {
    const DeviceScale scale(*painter.device());
    const double ascent = QFontMetricsF(painter.font(), painter.device()).ascent();
    const QPen outline(Qt::black, scale.width(kPenTwips), Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin);
    auto text = [&](const SheetText& t) {
        painter.setPen(Qt::black);
        painter.drawText(scale.point(t.x, t.y) + QPointF(0.0, ascent), QString::fromStdString(t.text));
    };
    // The picture goes out as it is on screen, pixel for pixel.
    painter.setRenderHint(QPainter::LosslessImageRendering);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);

    for (int page = 0; page < sheet.pages; ++page) {
        if (page > 0 && !(newPage && newPage())) return;
        if (page == 0) {
            text(sheet.pictureName);
            text(sheet.date);
            painter.fillRect(scale.rect(sheet.shadow), ColorOf(kShadowColor));
            painter.drawImage(scale.rect(sheet.picture), picture);
            painter.setPen(outline);
            painter.setBrush(Qt::NoBrush);
            painter.drawRect(scale.rect(sheet.frame));
        }
        for (const SheetText& heading : sheet.headings)
            if (heading.page == page) text(heading);
        for (const SheetRow& row : sheet.rows) {
            if (row.page != page) continue;
            text(row.name);
            painter.setPen(outline);
            painter.setBrush(ColorOf(row.color));
            painter.drawRect(scale.rect(row.swatch));
            painter.drawLine(scale.line(row.writingLine));
        }
    }
}

bool PrintPaintChoiceSheet(QPrinter& printer, const SheetContent& content, const QImage& picture) {
    QPainter painter;
    if (!painter.begin(&printer)) return false;
    painter.setFont(SheetFace(painter));
    const PaintChoiceSheet sheet = LayoutPaintChoiceSheet(content, SheetPageOf(printer),
                                                          SheetFontOn(painter.font(), printer));
    DrawPaintChoiceSheet(painter, sheet, picture, [&printer] { return printer.newPage(); });
    return painter.end();
}

} // namespace print
