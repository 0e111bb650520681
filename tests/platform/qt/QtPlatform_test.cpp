// The desktop's message boxes and file dialogs, built but never run modally.
#include <QFileDialog>
#include <QHeaderView>
#include <QTreeView>
#include <QLabel>
#include <QMessageBox>
#include <QScreen>
#include <QtTest>

#include "platform/QtPlatform.h"
#include "print/HelpTopics.h"

namespace {

QString FromView(std::string_view s) { return QString::fromUtf8(s.data(), static_cast<qsizetype>(s.size())); }

// Shows the box without making it modal and waits until it is laid out.
QLabel* ShowLaidOut(QMessageBox& box) {
    box.setWindowModality(Qt::NonModal);
    box.show();
    auto* label = box.findChild<QLabel*>(QStringLiteral("qt_msgbox_label"));
    return label && QTest::qWaitFor([&] { return label->width() >= label->minimumWidth(); }) ? label : nullptr;
}

// Lines of `text` that the label breaks into more than one.
int LinesBroken(const QLabel& label, const QString& text) {
    const QFontMetrics fm(label.font());
    const int width = label.contentsRect().width();
    int broken = 0;
    for (const QString& line : text.split('\n'))
        if (fm.boundingRect(QRect(0, 0, width, 100000), Qt::TextWordWrap, line).height() > fm.height()) ++broken;
    return broken;
}

int LongestLine(const QLabel& label, const QString& text) {
    const QFontMetrics fm(label.font());
    int longest = 0;
    for (const QString& line : text.split('\n')) longest = std::max(longest, fm.horizontalAdvance(line));
    return longest;
}

} // namespace

class QtPlatformTest : public QObject {
    Q_OBJECT
private slots:
    void helpTopicLinesNeverWrap() {
        const int screenWidth = QGuiApplication::primaryScreen()->availableGeometry().width();
        int widest = 0;
        bool narrowScreen = false;
        for (const HelpTopic& topic : HelpTopics()) {
            const QString text = FromView(HelpText(topic));
            const auto box = platform::MakeMessageBox(nullptr, {FromView(topic.title), text, platform::Buttons::Ok});
            QLabel* label = ShowLaidOut(*box);
            QVERIFY(label);
            QCOMPARE(box->text().split('\n'), text.split(QStringLiteral("\r\n")));   // the words as written, "<Enter>" too
            // Lines wrap only on a screen too narrow for them (a large scale factor
            // or font DPI), and then the box takes most of its width.
            if (LongestLine(*label, box->text()) < screenWidth * 2 / 3) {
                QCOMPARE(LinesBroken(*label, box->text()), 0);
            } else {
                narrowScreen = true;
                QVERIFY(box->width() >= screenWidth * 2 / 3);
            }
            QVERIFY(box->width() <= screenWidth);
            widest = std::max(widest, box->width());
        }
        // A short question keeps a short box.
        const auto shortBox = platform::MakeMessageBox(nullptr, {"Clear All Colors", "Are you Sure?", platform::Buttons::YesNo});
        ShowLaidOut(*shortBox);
        QVERIFY(shortBox->width() < widest || narrowScreen);
    }

    void fileDialogsOpenReadable() {
        QFileDialog dialog(nullptr, "Open", QDir::tempPath());
        platform::PrepareFileDialog(dialog);
        const QFontMetrics fm = dialog.fontMetrics();
        // Room for long names and many rows, as far as the screen allows.
        const QSize screen = dialog.screen()->availableGeometry().size();
        QVERIFY(dialog.width() >= std::min(fm.horizontalAdvance(QString(80, 'n')), screen.width() * 2 / 3)
                && dialog.height() >= std::min(24 * fm.lineSpacing(), screen.height() * 2 / 3));
        QVERIFY(dialog.width() <= std::max(screen.width(), dialog.minimumSizeHint().width()));   // only its controls may need more
        QCOMPARE(dialog.viewMode(), QFileDialog::Detail);
        dialog.setOption(QFileDialog::DontUseNativeDialog);
        platform::PrepareFileDialog(dialog);
        const auto* files = dialog.findChild<QTreeView*>("treeView");
        QVERIFY(files && files->header()->sectionSize(0) >= fm.horizontalAdvance(QString(40, 'n')));   // a long name
        dialog.setOption(QFileDialog::DontUseNativeDialog, false);
        QVERIFY(!dialog.testOption(QFileDialog::DontUseNativeDialog));   // the desktop's own dialog where there is one
    }
};

QTEST_MAIN(QtPlatformTest)
#include "QtPlatform_test.moc"
