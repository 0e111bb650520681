// The work picture in the window: mouse events on Picture1 reach the engine.
#include <QLineEdit>
#include <QTest>

#include "paint/PhotoArt.h"
#include "paint/qt/PictureView.h"
#include "support/FormFixture.h"

using namespace painttest;

class PictureTest : public QObject {
    Q_OBJECT
private slots:
    // A drag over a blue door on a sunlit wall while a box name is being typed.
    void dragPaintsTheDoorAndCommitsTheName() {
        FormFixture f;
        Workspace& ws = f.ws();
        DrawPhoto(ws, Art(300, std::string(400, 'Y')));
        DrawPhoto(ws, Art(30, std::string(40, 'B')), 100, 100);
        ws.PictureLoaded = true;
        ws.Boxes[1].color = HSLcolor::JoinColor(200, 60, 30);
        f.form().show();
        QVERIFY(QTest::qWaitForWindowActive(&f.form()));
        f.form().PictureColor_MouseUp(2, kRightButton);
        f.form().ColorNameBox->setText(QStringLiteral("Porch"));
        PictureView* picture = f.form().Picture1;
        const QPoint border(PictureView::kBorder, PictureView::kBorder);  // the frame around the picture
        QTest::mousePress(picture, Qt::LeftButton, {}, QPoint(110, 110) + border);
        QVERIFY(picture->hasFocus());
        QCOMPARE(ws.Boxes[2].name, std::string("Porch"));
        QTest::mouseMove(picture, QPoint(125, 115) + border);
        QTest::mouseRelease(picture, Qt::LeftButton, {}, QPoint(125, 115) + border);

        // The door and, with Expand Edges ticked, the ring around it (no corners).
        QCOMPARE(MaskArt(ws, 0, 98, 98, 4, 4), (Art{"....", "..11", ".111", ".111"}));
        const QRgb shown = picture->image().pixel(120, 120);
        QCOMPARE(HSLcolor::JoinColor(qRed(shown), qGreen(shown), qBlue(shown)), ws.Picture1.pixel(120, 120));
        QVERIFY(f.form().toolbarButtonEnabled(QStringLiteral("Undo")));
    }
};

QTEST_MAIN(PictureTest)
#include "picture_test.moc"
