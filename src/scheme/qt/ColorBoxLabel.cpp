#include "scheme/qt/ColorBoxLabel.h"

#include <QMouseEvent>

#include "paint/ColorBox.h"
#include "paint/PaintEngine.h"

ColorBoxLabel::ColorBoxLabel(int index, QWidget* parent) : QLabel(parent), index_(index) {
    setAutoFillBackground(true);
    setAlignment(Qt::AlignCenter);
    setLineWidth(2);
}

QColor ColorBoxQColor(int32_t value, const QColor& buttonFace) {
    if (value == kButtonFace) return buttonFace;
    return QColor(value & 0xFF, (value >> 8) & 0xFF, (value >> 16) & 0xFF);
}

QColor ColorBoxNameColor(int32_t backColor, int32_t foreColor, const QPalette& host) {
    if (backColor == kButtonFace) return host.color(QPalette::ButtonText);
    return ColorBoxQColor(foreColor, Qt::white);
}

namespace {
int ButtonCode(Qt::MouseButton b) {
    return b == Qt::LeftButton ? kLeftButton : b == Qt::RightButton ? kRightButton : kMiddleButton;
}
} // namespace

void ColorBoxLabel::setLook(int32_t backColor, int32_t foreColor, bool flat) {
    if (lookSet_ && backColor == back_ && foreColor == fore_ && flat == flat_) return;
    lookSet_ = true;
    back_ = backColor;
    fore_ = foreColor;
    flat_ = flat;
    // "No colour" shows the button colour of the window the box sits in.
    const QWidget* host = parentWidget() ? parentWidget() : this;
    QPalette pal = palette();
    pal.setColor(QPalette::Window, ColorBoxQColor(backColor, host->palette().color(QPalette::Button)));
    pal.setColor(QPalette::WindowText, ColorBoxNameColor(backColor, foreColor, host->palette()));
    setPalette(pal);
    setFrameStyle(flat ? (QFrame::Box | QFrame::Plain) : (QFrame::Panel | QFrame::Raised));
    setLineWidth(flat ? 1 : 2);
}

void ColorBoxLabel::mousePressEvent(QMouseEvent* event) { emit pressed(index_, ButtonCode(event->button())); }
void ColorBoxLabel::mouseReleaseEvent(QMouseEvent* event) { emit released(index_, ButtonCode(event->button())); }

// Only the left button asks for a new colour; a second press of another
// button is an ordinary press.
void ColorBoxLabel::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton)
        emit doubleClicked(index_);
    else
        emit pressed(index_, ButtonCode(event->button()));
}
