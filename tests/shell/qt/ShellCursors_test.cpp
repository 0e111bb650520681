// The work picture's pointer: no-drop without a colour in the current box,
// else the icon of the tool with its hot spot where the tool touches.
#include <QTest>

#include "paint/Tools.h"
#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"

Q_DECLARE_METATYPE(PictureCursor)

namespace {
constexpr int32_t kBrick = 0x3050B0;

enum class Tool { Wide, Narrow, Chalk, Pickup, SetReference, Eraser };

void Choose(FormFixture& f, Tool tool) {
    TintrollaForm& form = f.form();
    switch (tool) {
    case Tool::Wide: form.Toolbar1_ButtonClick("WideRoller"); break;
    case Tool::Narrow: form.Toolbar1_ButtonClick("NarrowRoller"); break;
    case Tool::Chalk: form.Toolbar1_ButtonClick("ChalkLine"); break;
    case Tool::Pickup: form.Toolbar1_ButtonClick("PickupColour"); break;
    case Tool::SetReference: form.Toolbar1_ButtonClick("SetRefPoint"); break;
    case Tool::Eraser:
        // The eraser's icon shows while the right button is held.
        f.ws().Cursor = PictureCursor::Eraser;
        form.ToolStateChanged();
        break;
    }
}

QImage Argb(const QImage& image) { return image.convertToFormat(QImage::Format_ARGB32); }
} // namespace

Q_DECLARE_METATYPE(Tool)

class ShellCursorsTest : public QObject {
    Q_OBJECT
private slots:
    void pointer_data();
    void pointer();
    void hotSpotsTouchTheIcon_data();
    void hotSpotsTouchTheIcon();
    void colouringTheBoxBringsTheRoller();
    void titleScreenShowsTheDefaultPointer();
};

void ShellCursorsTest::pointer_data() {
    QTest::addColumn<Tool>("tool");
    QTest::addColumn<bool>("coloured");
    QTest::addColumn<PictureCursor>("expected");
    using C = PictureCursor;
    QTest::newRow("wide, no colour") << Tool::Wide << false << C::NoDrop;
    QTest::newRow("narrow, no colour") << Tool::Narrow << false << C::NoDrop;
    QTest::newRow("chalk, no colour") << Tool::Chalk << false << C::NoDrop;
    QTest::newRow("set reference, no colour") << Tool::SetReference << false << C::NoDrop;
    QTest::newRow("pickup, no colour") << Tool::Pickup << false << C::Pickup;
    QTest::newRow("wide") << Tool::Wide << true << C::WideRoller;
    QTest::newRow("narrow") << Tool::Narrow << true << C::NarrowRoller;
    QTest::newRow("chalk") << Tool::Chalk << true << C::ChalkLine;
    QTest::newRow("set reference") << Tool::SetReference << true << C::SetReference;
    QTest::newRow("pickup") << Tool::Pickup << true << C::Pickup;
    QTest::newRow("eraser") << Tool::Eraser << true << C::Eraser;
}

void ShellCursorsTest::pointer() {
    QFETCH(Tool, tool);
    QFETCH(bool, coloured);
    QFETCH(PictureCursor, expected);
    FormFixture f;
    if (coloured) f.ws().Boxes[f.ws().CurrentColor].color = kBrick;
    f.form().UpdatePictureCursor();
    Choose(f, tool);
    QCOMPARE(f.ws().Cursor, expected);
    const QCursor shown = f.form().Picture1->cursor();
    if (expected == PictureCursor::NoDrop) {
        QCOMPARE(shown.shape(), Qt::ForbiddenCursor);
        return;
    }
    QCOMPARE(shown.shape(), Qt::BitmapCursor);
    QCOMPARE(Argb(shown.pixmap().toImage()), Argb(artwork::CursorIcon(expected)));
    QCOMPARE(shown.hotSpot(), artwork::CursorHotSpot(expected));
    // The rest of the window keeps its own pointer.
    QCOMPARE(f.form().cursor().shape(), Qt::ArrowCursor);
}

void ShellCursorsTest::hotSpotsTouchTheIcon_data() {
    QTest::addColumn<PictureCursor>("cursor");
    using C = PictureCursor;
    for (const auto& [name, c] : {std::pair{"wide", C::WideRoller}, std::pair{"narrow", C::NarrowRoller},
                                  std::pair{"chalk", C::ChalkLine}, std::pair{"set reference", C::SetReference},
                                  std::pair{"pickup", C::Pickup}, std::pair{"eraser", C::Eraser}})
        QTest::newRow(name) << c;
}

void ShellCursorsTest::hotSpotsTouchTheIcon() {
    QFETCH(PictureCursor, cursor);
    const QImage icon = Argb(artwork::CursorIcon(cursor));
    QCOMPARE(icon.size(), QSize(32, 32));
    const QPoint hot = artwork::CursorHotSpot(cursor);
    QVERIFY(icon.rect().contains(hot));
    // The tool touches the picture at the hot spot: drawn there, or right beside it.
    int opaque = 0;
    for (int dy = -1; dy <= 1; ++dy)
        for (int dx = -1; dx <= 1; ++dx)
            if (icon.rect().contains(hot + QPoint(dx, dy)) && qAlpha(icon.pixel(hot + QPoint(dx, dy))) > 128) ++opaque;
    QVERIFY2(opaque > 0, qPrintable(QStringLiteral("hot spot %1,%2 is in empty space").arg(hot.x()).arg(hot.y())));
    // The 2x icon is there for high-density screens.
    const QPixmap big(QStringLiteral(":/cursors/%1@2x.png").arg(
        QStringList{"", "", "WideRollerIcon", "NarrowRollerIcon", "ChalkLineIcon", "SetReferenceColorIcon",
                    "PickupColorIcon", "EraserIcon"}[static_cast<int>(cursor)]));
    QCOMPARE(big.size(), QSize(64, 64));
}

void ShellCursorsTest::colouringTheBoxBringsTheRoller() {
    FormFixture f;
    f.form().Toolbar1_ButtonClick("NarrowRoller");
    QCOMPARE(f.form().Picture1->cursor().shape(), Qt::ForbiddenCursor);
    f.ws().Boxes[1].color = kBrick;
    f.form().UpdatePictureCursor();
    QCOMPARE(f.ws().Cursor, PictureCursor::NarrowRoller);
    QCOMPARE(f.form().Picture1->cursor().shape(), Qt::BitmapCursor);
    // A box of its own colour elsewhere does not help the current one.
    f.ws().Boxes[1].color = kButtonFace;
    f.ws().Boxes[2].color = kBrick;
    f.form().UpdatePictureCursor();
    QCOMPARE(f.form().Picture1->cursor().shape(), Qt::ForbiddenCursor);
}

void ShellCursorsTest::titleScreenShowsTheDefaultPointer() {
    FormFixture f;
    f.ws().Boxes[1].color = kBrick;
    f.form().UpdatePictureCursor();
    f.ws().PictureLoaded = true;
    f.form().AboutMenuItem_Click();
    QCOMPARE(f.ws().Cursor, PictureCursor::Default);
    QVERIFY(!f.form().Picture1->testAttribute(Qt::WA_SetCursor));
    QCOMPARE(f.form().Picture1->cursor().shape(), Qt::ArrowCursor);
    // Set-reference over the plain pointer leaves it plain.
    ToggleSetReference(f.ws());
    QCOMPARE(f.ws().Cursor, PictureCursor::Default);
}

QTEST_MAIN(ShellCursorsTest)
#include "ShellCursors_test.moc"
