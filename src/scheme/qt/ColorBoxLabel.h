#pragma once
#include <QLabel>

// One colour box of the scheme: a label that reports presses, releases and
// double clicks with the button that caused them.
class ColorBoxLabel : public QLabel {
    Q_OBJECT
public:
    ColorBoxLabel(int index, QWidget* parent = nullptr);
    int index() const { return index_; }

    // Paint colour (or no colour), name colour and the flat or raised look.
    void setLook(int32_t backColor, int32_t foreColor, bool flat);

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
};
