#pragma once
#include <QFrame>
#include <QImage>

class Picture;

// Shows a 400 x 300 picture buffer 1:1 inside a sunken 2-pixel border and
// reports mouse events as floats in picture pixels.
class PictureView : public QFrame {
    Q_OBJECT
public:
    static constexpr int kBorder = 2;

    explicit PictureView(QWidget* parent = nullptr);

    // The picture shown; it must outlive the view. Null shows the background.
    void setPicture(const Picture* picture);
    // Takes the buffer's current pixels and repaints once.
    void refresh();
    // The picture as currently shown (for tests and grabs).
    const QImage& image() const { return image_; }

signals:
    void mousePressed(int button, float x, float y);
    void mouseMoved(int buttons, float x, float y);
    void mouseReleased(int button, float x, float y);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    const Picture* picture_ = nullptr;
    QImage image_;
};

// A picture buffer as a QImage (RGB32).
QImage ToQImage(const Picture& picture);
