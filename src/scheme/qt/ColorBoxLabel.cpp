#include "scheme/qt/ColorBoxLabel.h"

#include <QMouseEvent>

#include "paint/ColorBox.h"
#include "paint/PaintEngine.h"

ColorBoxLabel::ColorBoxLabel(int index, QWidget* parent) : QLabel(parent), index_(index) {
    setAutoFillBackground(true);
    setAlignment(Qt::AlignCenter);
    setLineWidth(2);
}

namespace {
QColor FromColorValue(int32_t v) { return QColor(v & 0xFF, (v >> 8) & 0xFF, (v >> 16) & 0xFF); }
int ButtonCode(Qt::MouseButton b) {
    return b == Qt::LeftButton ? kLeftButton : b == Qt::RightButton ? kRightButton : kMiddleButton;
}
} // namespace

void ColorBoxLabel::setLook(int32_t backColor, int32_t foreColor, bool flat) {
    QPalette pal = palette();
    const QColor back = backColor == kButtonFace ? QPalette().color(QPalette::Button) : FromColorValue(backColor);
    pal.setColor(QPalette::Window, back);
    pal.setColor(QPalette::WindowText, FromColorValue(foreColor));
    setPalette(pal);
    setFrameStyle(flat ? (QFrame::Box | QFrame::Plain) : (QFrame::Panel | QFrame::Raised));
    setLineWidth(flat ? 1 : 2);
}

void ColorBoxLabel::mousePressEvent(QMouseEvent* event) { emit pressed(index_, ButtonCode(event->button())); }
void ColorBoxLabel::mouseReleaseEvent(QMouseEvent* event) { emit released(index_, ButtonCode(event->button())); }
void ColorBoxLabel::mouseDoubleClickEvent(QMouseEvent*) { emit doubleClicked(index_); }
