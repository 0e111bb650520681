#include "paint/qt/PictureView.h"

#include <QMouseEvent>
#include <QPainter>

#include "paint/Picture.h"
#include "paint/PaintEngine.h"

QImage ToQImage(const Picture& picture) {
    QImage image(picture.width(), picture.height(), QImage::Format_RGB32);
    for (int y = 0; y < picture.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        const int32_t* src = picture.data() + static_cast<size_t>(y) * picture.width();
        for (int x = 0; x < picture.width(); ++x) {
            const auto v = static_cast<uint32_t>(src[x]);
            line[x] = 0xFF000000u | ((v & 0xFFu) << 16) | (v & 0xFF00u) | ((v >> 16) & 0xFFu);
        }
    }
    return image;
}

PictureView::PictureView(QWidget* parent) : QFrame(parent) {
    setFrameStyle(QFrame::Panel | QFrame::Sunken);
    setLineWidth(kBorder);
    setMouseTracking(true);
    // A click takes the focus (so a box name being typed is committed first);
    // the press itself still goes to the engine as before.
    setFocusPolicy(Qt::ClickFocus);
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void PictureView::setPicture(const Picture* picture) {
    picture_ = picture;
    refresh();
}

void PictureView::refresh() {
    if (picture_)
        image_ = ToQImage(*picture_);
    else
        image_ = QImage();
    update();
}

void PictureView::paintEvent(QPaintEvent* event) {
    {
        QPainter painter(this);
        painter.fillRect(contentsRect(), palette().window());
        if (!image_.isNull()) painter.drawImage(QPoint(kBorder, kBorder), image_);
    }
    QFrame::paintEvent(event);
}

namespace {
int ButtonCode(Qt::MouseButton b) {
    switch (b) {
    case Qt::LeftButton: return kLeftButton;
    case Qt::RightButton: return kRightButton;
    case Qt::MiddleButton: return kMiddleButton;
    default: return 0;
    }
}
int ButtonsCode(Qt::MouseButtons b) {
    int code = 0;
    if (b & Qt::LeftButton) code |= kLeftButton;
    if (b & Qt::RightButton) code |= kRightButton;
    if (b & Qt::MiddleButton) code |= kMiddleButton;
    return code;
}
} // namespace

void PictureView::mousePressEvent(QMouseEvent* event) {
    const QPointF p = event->position() - QPointF(kBorder, kBorder);
    emit mousePressed(ButtonCode(event->button()), static_cast<float>(p.x()), static_cast<float>(p.y()));
}

void PictureView::mouseMoveEvent(QMouseEvent* event) {
    const QPointF p = event->position() - QPointF(kBorder, kBorder);
    emit mouseMoved(ButtonsCode(event->buttons()), static_cast<float>(p.x()), static_cast<float>(p.y()));
}

void PictureView::mouseReleaseEvent(QMouseEvent* event) {
    const QPointF p = event->position() - QPointF(kBorder, kBorder);
    emit mouseReleased(ButtonCode(event->button()), static_cast<float>(p.x()), static_cast<float>(p.y()));
}
