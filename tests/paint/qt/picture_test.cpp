// The work picture in the window: mouse events on Picture1 paint the photo.
#include <QAction>
#include <QApplication>
#include <QMouseEvent>
#include <QTest>

#include "paint/PhotoArt.h"
#include "paint/qt/PictureView.h"
#include "support/FormFixture.h"

using namespace painttest;

namespace {

// A sunlit wall with a blue door at x 100..139, y 100..129.
void LoadDoorPhoto(Workspace& ws) {
    FillPhoto(ws, 'Y');
    DrawPhoto(ws, std::vector<std::string>(30, std::string(40, 'B')), 100, 100);
    ws.PictureLoaded = true;
    ws.Boxes[1].color = HSLcolor::JoinColor(200, 60, 30);
}

void Send(QWidget* w, QEvent::Type type, QPointF picturePoint, Qt::MouseButton button, Qt::MouseButtons buttons) {
    const QPointF local = picturePoint + QPointF(PictureView::kBorder, PictureView::kBorder);
    QMouseEvent event(type, local, w->mapToGlobal(local), button, buttons, Qt::NoModifier);
    QApplication::sendEvent(w, &event);
}

// The toolbar's button when it has one, else the state it is synced from.
bool UndoShown(FormFixture& f) {
    if (f.form().toolbarButtons.contains(QStringLiteral("Undo"))) return f.form().toolbarButtonEnabled(QStringLiteral("Undo"));
    return f.ws().UndoEnabled;
}
bool RedoShown(FormFixture& f) {
    if (f.form().toolbarButtons.contains(QStringLiteral("Redo"))) return f.form().toolbarButtonEnabled(QStringLiteral("Redo"));
    return f.ws().RedoEnabled;
}

} // namespace

class PictureTest : public QObject {
    Q_OBJECT
private slots:
    void dragPaintsTheDoor_data();
    void dragPaintsTheDoor();
    void pressWithoutColourWarns();
};

void PictureTest::dragPaintsTheDoor_data() {
    QTest::addColumn<QPointF>("press");   // in picture pixels
    QTest::addColumn<QPointF>("drag");
    QTest::addColumn<bool>("paints");
    QTest::newRow("inside the door") << QPointF(110, 110) << QPointF(125, 115) << true;
    QTest::newRow("sub-pixel positions") << QPointF(110.5, 109.5) << QPointF(125, 115) << true;
    QTest::newRow("on the frame, outside the picture") << QPointF(-1.5, -1.5) << QPointF(-1.5, -1.5) << false;
}

void PictureTest::dragPaintsTheDoor() {
    QFETCH(QPointF, press);
    QFETCH(QPointF, drag);
    QFETCH(bool, paints);
    FormFixture f;
    Workspace& ws = f.ws();
    LoadDoorPhoto(ws);
    f.form().show();
    QWidget* picture = f.form().Picture1;

    Send(picture, QEvent::MouseButtonPress, press, Qt::LeftButton, Qt::LeftButton);
    Send(picture, QEvent::MouseMove, drag, Qt::NoButton, Qt::LeftButton);
    Send(picture, QEvent::MouseButtonRelease, drag, Qt::LeftButton, Qt::NoButton);

    QCOMPARE(f.platform().messages.size(), 0);
    if (!paints) {
        QCOMPARE(ws.StrokeNumber, 0);
        QVERIFY(!UndoShown(f));
        return;
    }
    // The whole door and, with Expand Edges ticked, the one-pixel ring around it
    // (no corners); the wall beyond stays as it was.
    QCOMPARE(ws.StrokeNumber, 1);
    QCOMPARE(StrokeArt(ws, 97, 97, 6, 6),
             (std::vector<std::string>{"......", "......", "...111", "..1111", "..1111", "..1111"}));
    QCOMPARE(StrokeArt(ws, 137, 127, 5, 5),
             (std::vector<std::string>{"1111.", "1111.", "1111.", "111..", "....."}));
    QCOMPARE(ws.ColorPlane(120, 120), int16_t(1));
    QCOMPARE(ws.Boxes[1].reference != 0, true);  // taken by the first press
    QCOMPARE(ws.Picture1.pixel(200, 200), Swatch('Y'));
    QVERIFY(ws.Picture1.pixel(120, 120) != Swatch('B'));
    // What the widget shows is the painted picture.
    const auto* view = static_cast<PictureView*>(picture);
    const QRgb shown = view->image().pixel(120, 120);
    QCOMPARE(HSLcolor::JoinColor(qRed(shown), qGreen(shown), qBlue(shown)), ws.Picture1.pixel(120, 120));
    QVERIFY(UndoShown(f));
    QVERIFY(!RedoShown(f));

    f.form().engine().UndoStroke();
    QCOMPARE(ws.Stroke(120, 120), int16_t(-1));
    QCOMPARE(ws.Picture1.pixel(120, 120), Swatch('B'));
    QVERIFY(!UndoShown(f));
    QVERIFY(RedoShown(f));
}

void PictureTest::pressWithoutColourWarns() {
    FormFixture f;
    LoadDoorPhoto(f.ws());
    f.ws().Boxes[1].color = kButtonFace;
    f.form().show();
    Send(f.form().Picture1, QEvent::MouseButtonPress, QPointF(110, 110), Qt::LeftButton, Qt::LeftButton);
    Send(f.form().Picture1, QEvent::MouseButtonRelease, QPointF(110, 110), Qt::LeftButton, Qt::NoButton);
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QStringLiteral("Warning - Painting Picture"));
    QCOMPARE(f.platform().messages[0].text, QStringLiteral("No Paint color has been set yet."));
    QCOMPARE(f.platform().messages[0].icon, platform::Icon::Exclamation);
    QCOMPARE(f.ws().StrokeNumber, 0);
    QVERIFY(!UndoShown(f));
}

QTEST_MAIN(PictureTest)
#include "picture_test.moc"
