// Renaming a colour box in place: a text box laid over the box.
#include <QGroupBox>
#include <QLineEdit>
#include <algorithm>
#include <cmath>

#include "scheme/qt/ColorBoxLabel.h"
#include "shell/TintrollaForm.h"

namespace {
constexpr int kMaxNameLength = 15;

// The box number a tag names; text that is not a number reads as 0.
int TagIndex(const QString& tag) {
    bool ok = false;
    const double value = tag.trimmed().toDouble(&ok);
    if (!ok) return 0;
    return static_cast<int>(std::lrint(value));
}
} // namespace

void TintrollaForm::PictureColor_MouseUp(int index, int button) {
    if (button != kRightButton || index < 1 || index > kColorBoxCount) return;
    const ColorBoxLabel* box = PictureColor[static_cast<size_t>(index)];
    ColorNameBox->setText(QString::fromStdString(workspace().Boxes[static_cast<size_t>(index)].name));
    QPalette pal = ColorNameBox->palette();
    pal.setColor(QPalette::Text, Qt::black);
    pal.setColor(QPalette::Base, Qt::white);
    ColorNameBox->setPalette(pal);
    ColorNameBox->setFont(box->font());
    ColorNameBox->setAlignment(box->alignment());
    ColorNameBox->setGeometry(box->geometry());
    ColorNameBoxTag = QString::number(index);
    ColorNameBox->raise();
    ColorNameBox->show();
    ColorNameBox->setEnabled(true);
    ColorNameBox->setFocus(Qt::OtherFocusReason);
}

void TintrollaForm::ColorNameBox_Change() {
    const QString text = ColorNameBox->text();
    if (text.size() <= kMaxNameLength) return;
    const int caret = static_cast<int>(ColorNameBox->cursorPosition());
    QString kept = text.left(kMaxNameLength);
    // Never keep half of a character that takes two UTF-16 units.
    if (kept.back().isHighSurrogate()) kept.chop(1);
    ColorNameBox->setText(kept);
    ColorNameBox->setCursorPosition(std::min(caret, static_cast<int>(kept.size())));
}

void TintrollaForm::commitRename() {
    if (ColorNameBoxTag.isEmpty()) return;
    const int index = TagIndex(ColorNameBoxTag);
    // Empty the tag first: hiding the text box takes its focus, which commits again.
    ColorNameBoxTag.clear();
    if (index >= 1 && index <= kColorBoxCount)
        workspace().Boxes[static_cast<size_t>(index)].name = ColorNameBox->text().toStdString();
    ColorNameBox->hide();
    syncColorBoxes();
}

void TintrollaForm::cancelRename() {
    ColorNameBoxTag.clear();
    ColorNameBox->hide();
}
