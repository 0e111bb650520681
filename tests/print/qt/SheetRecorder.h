#pragma once
// Reads back what was drawn on a QPicture: replayed onto this device, every
// rectangle, line, image and text arrives in device coordinates with the pen,
// brush and font it was drawn with.
#include <QFont>
#include <QImage>
#include <QList>
#include <QPaintDevice>
#include <QPaintEngine>
#include <QPainter>
#include <QPainterPath>
#include <QPicture>
#include <QTextItem>
#include <memory>

namespace printtest {

struct Drawn {
    enum Kind { Rect, Line, Image, Text } kind = Rect;
    QRectF rect;     // rectangles and images
    QLineF line;
    QPen pen;
    QBrush brush;
    QString text;    // text: drawn with its baseline's left end at `at`
    QPointF at;
    QFont font;
    QImage image;
};

class RecordingEngine : public QPaintEngine {
public:
    RecordingEngine() : QPaintEngine(QPaintEngine::AllFeatures) {}
    QList<Drawn> drawn;

    bool begin(QPaintDevice*) override { return true; }
    bool end() override { return true; }
    Type type() const override { return QPaintEngine::User; }
    void updateState(const QPaintEngineState& s) override {
        if (s.state() & DirtyPen) pen_ = s.pen();
        if (s.state() & DirtyBrush) brush_ = s.brush();
        if (s.state() & DirtyFont) font_ = s.font();
        if (s.state() & DirtyTransform) transform_ = s.transform();
    }
    void drawRects(const QRectF* rects, int count) override {
        for (int i = 0; i < count; ++i) add(Drawn::Rect).rect = transform_.mapRect(rects[i]);
    }
    void drawRects(const QRect* rects, int count) override {
        for (int i = 0; i < count; ++i) {
            const QRectF r(rects[i]);
            drawRects(&r, 1);
        }
    }
    void drawLines(const QLineF* lines, int count) override {
        for (int i = 0; i < count; ++i) add(Drawn::Line).line = transform_.map(lines[i]);
    }
    void drawLines(const QLine* lines, int count) override {
        for (int i = 0; i < count; ++i) {
            const QLineF l(lines[i]);
            drawLines(&l, 1);
        }
    }
    void drawPixmap(const QRectF& r, const QPixmap& pm, const QRectF&) override {
        Drawn& d = add(Drawn::Image);
        d.rect = transform_.mapRect(r);
        d.image = pm.toImage();
    }
    void drawImage(const QRectF& r, const QImage& image, const QRectF&, Qt::ImageConversionFlags) override {
        Drawn& d = add(Drawn::Image);
        d.rect = transform_.mapRect(r);
        d.image = image;
    }
    void drawTextItem(const QPointF& p, const QTextItem& item) override {
        Drawn& d = add(Drawn::Text);
        d.at = transform_.map(p);
        d.text = item.text();
        d.font = item.font();
    }
    // Outlined boxes and lines may come as paths or polygons: a flat one is
    // a line, any other a box.
    void drawPath(const QPainterPath& path) override { addShape(transform_.map(path).boundingRect()); }
    void drawPolygon(const QPointF* points, int count, PolygonDrawMode) override {
        addShape(transform_.map(QPolygonF(QList<QPointF>(points, points + count))).boundingRect());
    }

private:
    void addShape(const QRectF& r) {
        if (r.width() == 0.0 || r.height() == 0.0) add(Drawn::Line).line = QLineF(r.topLeft(), r.bottomRight());
        else add(Drawn::Rect).rect = r;
    }
    Drawn& add(Drawn::Kind kind) {
        Drawn d;
        d.kind = kind;
        d.pen = pen_;
        d.brush = brush_;
        drawn.append(d);
        return drawn.last();
    }
    QPen pen_;
    QBrush brush_;
    QFont font_;
    QTransform transform_;
};

class RecordingDevice : public QPaintDevice {
public:
    explicit RecordingDevice(const QPaintDevice& like) : dpiX_(like.logicalDpiX()), dpiY_(like.logicalDpiY()) {}
    RecordingEngine engine;
    QPaintEngine* paintEngine() const override { return const_cast<RecordingEngine*>(&engine); }

protected:
    int metric(PaintDeviceMetric m) const override {
        switch (m) {
        case PdmWidth: return 20000;
        case PdmHeight: return 30000;
        case PdmDpiX: case PdmPhysicalDpiX: return dpiX_;
        case PdmDpiY: case PdmPhysicalDpiY: return dpiY_;
        case PdmDepth: return 32;
        case PdmNumColors: return 0x7fffffff;
        case PdmDevicePixelRatio: return 1;
        case PdmDevicePixelRatioScaled: return static_cast<int>(devicePixelRatioFScale());
        default: return QPaintDevice::metric(m);
        }
    }

private:
    int dpiX_;
    int dpiY_;
};

// What was drawn on `picture`, in the order it was drawn.
inline QList<Drawn> Replay(QPicture& picture) {
    RecordingDevice device(picture);
    QPainter painter(&device);
    picture.play(&painter);
    painter.end();
    return device.engine.drawn;
}

} // namespace printtest
