#include "shell/WrappingCheckBox.h"

#include <QStyleOptionButton>
#include <QStylePainter>

void WrappingCheckBox::paintEvent(QPaintEvent*) {
    QStylePainter painter(this);
    QStyleOptionButton option;
    initStyleOption(&option);
    option.text.clear();  // the box alone; the caption is drawn wrapped beside it
    const QRect indicator = style()->subElementRect(QStyle::SE_CheckBoxIndicator, &option, this);
    option.rect = QRect(0, (height() - indicator.height()) / 2, indicator.width(), indicator.height());
    painter.drawControl(QStyle::CE_CheckBox, option);
    const int left = indicator.width() + 4;
    painter.setPen(palette().color(isEnabled() ? QPalette::Active : QPalette::Disabled, QPalette::WindowText));
    painter.drawText(QRect(left, 0, width() - left, height()), Qt::AlignVCenter | Qt::TextWordWrap, text());
}

bool WrappingCheckBox::hitButton(const QPoint& pos) const { return rect().contains(pos); }
