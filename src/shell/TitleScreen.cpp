#include <QFont>
#include <QFontMetrics>
#include <QPainter>
#include <QTimer>
#include <cmath>

#include "imaging/TitleHue.h"
#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "shell/PictureCanvas.h"
#include "shell/TintrollaForm.h"
#include "store/qt/BrowserLists.h"

namespace {
constexpr int kBackgroundWidth = 80;
constexpr int kBackgroundHeight = 60;
constexpr int kMajor = 1;
constexpr int kMinor = 0;
constexpr int kRevision = 3;

// Font sizes are points on a 96 dpi picture: whole pixels, nearest.
int PointsToPixels(double points) { return static_cast<int>(std::lrint(points * 96.0 / 72.0)); }

// The faces of the title: "Times" and "Arial" as the desktop has them.
void SetFace(QFont& font, bool serif) {
    if (serif) {
        font.setFamilies({QStringLiteral("Liberation Serif"), QStringLiteral("DejaVu Serif"), QStringLiteral("Times")});
        font.setStyleHint(QFont::Serif);
    } else {
        font.setFamilies({QStringLiteral("Liberation Sans"), QStringLiteral("DejaVu Sans"), QStringLiteral("Arial")});
        font.setStyleHint(QFont::SansSerif);
    }
}

Picture PictureFrom(const QImage& image) {
    if (image.isNull()) return Picture(kBackgroundWidth, kBackgroundHeight, 0xF0D8C8);
    const QImage rgb = image.convertToFormat(QImage::Format_RGB32);
    Picture picture(rgb.width(), rgb.height());
    for (int y = 0; y < rgb.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(rgb.constScanLine(y));
        for (int x = 0; x < rgb.width(); ++x)
            picture.setPixel(x, y, qRed(line[x]) + 256 * qGreen(line[x]) + 65536 * qBlue(line[x]));
    }
    return picture;
}

struct Line {
    int y;
    const char* text;
};

const Line kIntroduction[] = {
    {70, "Have you ever painted your house, and hated it!"},
    {85, "Well, never again.  Just \"Tint-Rolla\" first."},
    {110, "Take a photo of your home, choose a color scheme and roll on the"},
    {125, "new colors.  You don't need to be an artist as \"Tint-rolla\" will"},
    {140, "do the rest."},
    {165, "You can change the color scheme as often as you like."},
    {180, "\"Tint-Rolla\" follows edges and retains existing lighting and shadows."},
    {205, "Simple tools include wet or dry paint on a wide or narrow roller"},
    {220, "Use a chalk line to markup a picture rail or other tricky detail."},
    {235, "Then you can SAVE-it and PRINT-it."},
};
} // namespace

void TintrollaForm::DrawTitleScreen() {
    // Redraws never overlap: the poll waits while one runs.
    const bool polling = BackgroundTimer->isActive();
    BackgroundTimer->stop();

    if (TitleBackgroundOriginal.width() == 0) {
        TitleBackgroundOriginal = PictureFrom(artwork::TitleBackgroundImage());
        TitleBackgroundPicture = TitleBackgroundOriginal;
    }
    TitleHueTurn = TitleHue::NextTurn(TitleHueTurn);
    const size_t count = static_cast<size_t>(TitleBackgroundOriginal.width()) * TitleBackgroundOriginal.height();
    TitleHue::TurnHues(TitleBackgroundOriginal.data(), TitleBackgroundPicture.data(), count, TitleHueTurn);

    Picture& screen = workspace().Picture1;
    PaintPicture(screen, QRect(0, 0, screen.width(), screen.height()), [this](QPainter& painter) {
        painter.setRenderHint(QPainter::SmoothPixmapTransform);
        painter.drawImage(QRect(0, 0, Workspace::kWidth, Workspace::kHeight), ToQImage(TitleBackgroundPicture));
        painter.drawImage(QPoint(65, 10), artwork::WindowIconImage());
    });

    QFont font = Picture1->font();
    SetFace(font, true);
    font.setBold(true);
    font.setItalic(true);
    font.setPixelSize(PointsToPixels(30));
    font.setWeight(QFont::Thin);  // the lightest weight: italic, not bold
    Picture1->setFont(font);
    PrintAt(110, 3, QStringLiteral("Tint-Rolla"));

    font.setPixelSize(PointsToPixels(20));
    Picture1->setFont(font);
    PrintAt(280, 16, QStringLiteral("v%1.%2%3").arg(kMajor).arg(kMinor).arg(kRevision));

    SetFace(font, false);
    font.setBold(false);
    font.setItalic(false);
    font.setPixelSize(PointsToPixels(9));
    Picture1->setFont(font);
    for (const Line& line : kIntroduction) PrintAt(10, line.y, QString::fromUtf8(line.text));

    font.setPixelSize(PointsToPixels(7));
    font.setItalic(true);
    Picture1->setFont(font);
    PrintAt(10, 288, QStringLiteral(" The actual colors displayed and printed may vary due to hardware and software differences."));

    font.setPixelSize(PointsToPixels(11));
    font.setBold(true);
    Picture1->setFont(font);
    PrintAt(50, 260, QStringLiteral("You're now Ready for the Hardware Store."));

    RefreshPicture();
    if (polling) BackgroundTimer->start();
}

// Text at (x, y): the top of the text line at y, in the work picture's font
// and text colour.
void TintrollaForm::PrintAt(int x, int y, const QString& text) {
    const QFont font = Picture1->font();
    const QFontMetrics metrics(font);
    const QPoint baseline(x, y + metrics.ascent());
    // Only the text's own box is redrawn (with room for italic overhang).
    const QRect box = metrics.boundingRect(text).translated(baseline).adjusted(-4, -2, 4, 2);
    PaintPicture(workspace().Picture1, box, [&](QPainter& painter) {
        painter.setRenderHint(QPainter::TextAntialiasing);
        painter.setFont(font);
        painter.setPen(Picture1->palette().color(QPalette::WindowText));
        painter.drawText(baseline, text);
    });
}

// Back to the title screen: the next poll finds no picture and draws it. The
// work stays as it is and nothing is asked.
void TintrollaForm::AboutMenuItem_Click() {
    Workspace& ws = workspace();
    ws.PictureLoaded = false;
    CurrentPicturePath.clear();
    RequestedPicturePath.clear();
    unsetCursor();
    ws.Cursor = PictureCursor::Default;
    applyPictureCursor();
    for (const char* key : {"Save", "Print", "Delete"}) setToolbarButtonEnabled(QString::fromLatin1(key), false);
    File1->setCurrentRow(-1);
    File1->clearSelection();
}
