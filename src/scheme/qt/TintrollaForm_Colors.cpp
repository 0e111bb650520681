// The twelve colour boxes: building, showing the workspace, selecting a box,
// a new colour from the dialog and clearing all colours.
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <cmath>

#include "paint/Tools.h"
#include "scheme/ColorScheme.h"
#include "scheme/qt/ColorBoxLabel.h"
#include "scheme/qt/ColorNameEdit.h"
#include "shell/TintrollaForm.h"

namespace {

// Box i's place inside the frame, in pixels (positions are given in twips).
QRect BoxGeometry(int i) {
    auto px = [](int twips) { return static_cast<int>(std::lrint(twips / 15.0)); };
    return QRect(px(120), px(280 + 360 * (i - 1)), px(1335), px(255));
}

QString Caption(const ColorBox& box) { return QString::fromStdString(box.name); }

} // namespace

void TintrollaForm::buildColorBoxes() {
    for (int i = 1; i <= kColorBoxCount; ++i) {
        auto* box = new ColorBoxLabel(i, ColorSchemeFrame);
        box->setObjectName(QStringLiteral("PictureColor%1").arg(i));
        box->setGeometry(BoxGeometry(i));
        connect(box, &ColorBoxLabel::pressed, this, &TintrollaForm::PictureColor_MouseDown);
        connect(box, &ColorBoxLabel::released, this, &TintrollaForm::PictureColor_MouseUp);
        connect(box, &ColorBoxLabel::doubleClicked, this, &TintrollaForm::PictureColor_DblClick);
        PictureColor[static_cast<size_t>(i)] = box;
    }

    auto* nameBox = new ColorNameEdit(ColorSchemeFrame);
    nameBox->setObjectName(QStringLiteral("ColorNameBox"));
    nameBox->hide();
    connect(nameBox, &ColorNameEdit::commitRequested, this, &TintrollaForm::commitRename);
    connect(nameBox, &ColorNameEdit::cancelRequested, this, &TintrollaForm::cancelRename);
    connect(nameBox, &QLineEdit::textChanged, this, &TintrollaForm::ColorNameBox_Change);
    ColorNameBox = nameBox;

    // The pickup label lies over a box; a click on it reaches the box below.
    PickupColorLabel = new QLabel(ColorSchemeFrame);
    PickupColorLabel->setObjectName(QStringLiteral("PickupColorLabel"));
    PickupColorLabel->setAutoFillBackground(true);
    PickupColorLabel->setAlignment(Qt::AlignCenter);
    PickupColorLabel->setFrameStyle(QFrame::Box | QFrame::Plain);
    PickupColorLabel->setAttribute(Qt::WA_TransparentForMouseEvents);
    PickupColorLabel->hide();

    // A double click on the frame itself loads a scheme.
    ColorSchemeFrame->installEventFilter(
        new DoubleClickWatcher(ColorSchemeFrame, [this] { LoadSchemeMenuItem_Click(); }));

    syncColorBoxes();
}

void TintrollaForm::syncColorBoxes() {
    const Workspace& ws = workspace();
    for (int i = 1; i <= kColorBoxCount; ++i) {
        ColorBoxLabel* box = PictureColor[static_cast<size_t>(i)];
        if (!box) return;
        const ColorBox& state = ws.Boxes[static_cast<size_t>(i)];
        box->setText(Caption(state));
        box->setLook(state.color, ForeColorFor(state.color), i == ws.CurrentColor);
    }

    const int p = ws.PickupIndex;
    if (ws.PickupLabelVisible && p >= 1 && p <= kColorBoxCount) {
        const ColorBox& under = ws.Boxes[static_cast<size_t>(p)];
        const QColor buttonFace = ColorSchemeFrame->palette().color(QPalette::Button);
        PickupColorLabel->setGeometry(PictureColor[static_cast<size_t>(p)]->geometry());
        PickupColorLabel->setText(Caption(under));
        QPalette pal = PickupColorLabel->palette();
        pal.setColor(QPalette::Window, ColorBoxQColor(ws.PickupLabelColor, buttonFace));
        pal.setColor(QPalette::WindowText,
                     ColorBoxNameColor(ws.PickupLabelColor, ForeColorFor(under.color), ColorSchemeFrame->palette()));
        PickupColorLabel->setPalette(pal);
        PickupColorLabel->raise();
        PickupColorLabel->show();
    } else {
        PickupColorLabel->hide();
    }
}

void TintrollaForm::PictureColor_MouseDown(int index, int /*button*/) {
    if (index < 1 || index > kColorBoxCount) return;
    // A rename in progress is committed before anything else happens.
    if (!ColorNameBoxTag.isEmpty()) commitRename();
    SelectBox(workspace(), index);
    ToolStateChanged();
}

void TintrollaForm::PictureColor_DblClick(int /*index*/) { NewColourMenuItem_Click(); }

void TintrollaForm::NewColourMenuItem_Click() {
    Workspace& ws = workspace();
    const int i = ws.CurrentColor;
    const std::optional<int32_t> chosen = platformLayer().chooseColor(this, ws.Boxes[static_cast<size_t>(i)].color);
    if (chosen) {
        SetNewColor(ws, *chosen & 0xFFFFFF, i);
        engine().RepaintColor(i);
    }
    // Taken or cancelled, the pickup and set-reference tools end.
    endPickupAndSetReference();
}

void TintrollaForm::ClearAllColorsMenuItem_Click() {
    if (Ask(QStringLiteral("Clear All Colors"), QStringLiteral("Are you Sure?"), platform::Buttons::YesNo) !=
        platform::Answer::Yes)
        return;
    ClearAllColors(workspace());
    ToolStateChanged();
}
