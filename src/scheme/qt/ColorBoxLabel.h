#pragma once
#include <QLabel>
#include <cstdint>

// One colour box of the scheme: a label that reports presses, releases and
// left double clicks with the button that caused them.
class ColorBoxLabel : public QLabel {
    Q_OBJECT
public:
    ColorBoxLabel(int index, QWidget* parent = nullptr);

    // Paint colour (kButtonFace: the window's button colour), name colour and
    // the flat (selected) or raised look. Repaints only when something changed.
    void setLook(int32_t backColor, int32_t foreColor, bool flat);
    int32_t backColor() const { return back_; }
    int32_t foreColor() const { return fore_; }
    bool isFlat() const { return flat_; }

signals:
    void pressed(int index, int button);
    void released(int index, int button);
    void doubleClicked(int index);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    int index_;
    int32_t back_ = 0;
    int32_t fore_ = 0;
    bool flat_ = false;
    bool lookSet_ = false;
};

// A colour value as a QColor; kButtonFace becomes `buttonFace`.
QColor ColorBoxQColor(int32_t value, const QColor& buttonFace);

// The colour a box's name is drawn in over `backColor`. On the button face
// (no colour set) white cannot be read on a light desktop theme, so the name
// takes the theme's button text; over a paint colour it is `foreColor`.
QColor ColorBoxNameColor(int32_t backColor, int32_t foreColor, const QPalette& host);
