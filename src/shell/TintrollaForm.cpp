#include "shell/TintrollaForm.h"

#include <QCheckBox>
#include <QCloseEvent>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMouseEvent>
#include <QScreen>
#include <QTimer>
#include <QToolBar>
#include <cmath>

#include "paint/Tools.h"
#include "paint/qt/PictureView.h"
#include "scheme/qt/ColorBoxLabel.h"
#include "shell/WrappingCheckBox.h"
#include "store/qt/BrowserLists.h"

TintrollaForm::TintrollaForm(platform::Platform& platform, const QString& programFolder, QWidget* parent)
    : QMainWindow(parent),
      ProgramFolder(programFolder),
      platform_(platform),
      ws_(std::make_unique<Workspace>()),
      engine_(std::make_unique<PaintEngine>(*ws_, *this)) {
    setObjectName(QStringLiteral("TintrollaForm"));
    buildLayout();
    buildMenus();
    Form_Load();
}

TintrollaForm::~TintrollaForm() = default;

QRect TintrollaForm::twips(int left, int top, int width, int height) const {
    auto px = [](int t) { return static_cast<int>(std::lrint(t / 15.0)); };
    return QRect(px(left), px(top), px(width), px(height));
}

void TintrollaForm::buildLayout() {
    client = new QWidget(this);
    client->setObjectName(QStringLiteral("client"));
    client->setFixedSize(kClientWidth, kClientHeight);
    // The controls are laid out for a small dialog font, as on the desktop it came from.
    QFont small(QStringLiteral("Liberation Sans"));
    small.setPointSizeF(8.0);
    client->setFont(small);
    setCentralWidget(client);

    Toolbar1 = new QToolBar(client);
    Toolbar1->setObjectName(QStringLiteral("Toolbar1"));
    Toolbar1->setGeometry(0, 0, kClientWidth, 26);
    Toolbar1->setIconSize(QSize(16, 16));
    Toolbar1->setMovable(false);
    buildToolbar();

    Picture1 = new PictureView(client);
    Picture1->setObjectName(QStringLiteral("Picture1"));
    Picture1->setGeometry(twips(2160, 600, 6060, 4560));
    Picture1->setPicture(&ws_->Picture1);
    connect(Picture1, &PictureView::mousePressed, this, &TintrollaForm::Picture1_MouseDown);
    connect(Picture1, &PictureView::mouseMoved, this, &TintrollaForm::Picture1_MouseMove);
    connect(Picture1, &PictureView::mouseReleased, this, &TintrollaForm::Picture1_MouseUp);

    Picture2 = new QLabel(client);
    Picture2->setObjectName(QStringLiteral("Picture2"));
    Picture2->setGeometry(twips(1080, 5760, 6060, 4560));
    Picture2->hide();

    TitleBackground = new QLabel(client);
    TitleBackground->setObjectName(QStringLiteral("TitleBackground"));
    TitleBackground->setGeometry(twips(2640, 5520, 84 * 15, 64 * 15));
    TitleBackground->hide();

    ColorSchemeFrame = new QGroupBox(QStringLiteral("Color Scheme"), client);
    ColorSchemeFrame->setObjectName(QStringLiteral("ColorSchemeFrame"));
    ColorSchemeFrame->setGeometry(twips(8400, 480, 1575, 4695));
    ColorSchemeFrame->setToolTip(QStringLiteral("Edit Color Name with right mouse button"));
    buildColorBoxes();

    Label1 = new QLabel(QStringLiteral("Select Picture"), client);
    Label1->setObjectName(QStringLiteral("Label1"));
    Label1->setGeometry(twips(120, 405, 1935, 195));
    Drive1 = new DriveListBox(client);
    Drive1->setObjectName(QStringLiteral("Drive1"));
    Drive1->setGeometry(twips(120, 600, 1935, 315));
    Dir1 = new FolderListBox(client);
    Dir1->setObjectName(QStringLiteral("Dir1"));
    Dir1->setGeometry(twips(120, 1020, 1935, 1665));
    File1 = new FileListBox(client);
    File1->setObjectName(QStringLiteral("File1"));
    File1->setGeometry(twips(120, 2760, 1935, 2430));
    buildBrowser();

    auto makeCheck = [this](const char* name, const QString& text, QRect geometry, bool checked) {
        auto* box = new WrappingCheckBox(text, client);
        box->setObjectName(QString::fromLatin1(name));
        box->setGeometry(geometry);
        box->setChecked(checked);
        return box;
    };
    AutoCropCheckbox = makeCheck("AutoCropCheckbox", QStringLiteral("Auto Crop Picture"), twips(480, 5280, 2040, 255), false);
    BlendEdgesCheckbox = makeCheck("BlendEdgesCheckbox", QStringLiteral("Blend Edges"), twips(2640, 5280, 1575, 255), true);
    ExpandEdgesCheckbox = makeCheck("ExpandEdgesCheckbox", QStringLiteral("Expand Edges"), twips(4320, 5280, 1695, 255), true);
    ProtectPaintCheckbox = makeCheck("ProtectPaintCheckbox", QStringLiteral("Protect Painted Areas"), twips(6120, 5280, 2160, 255), true);
    LoadwithPictureCheckbox = makeCheck("LoadwithPictureCheckbox", QStringLiteral("Load Color Scheme with Picture"), twips(8280, 5160, 1785, 435), true);

    // The check boxes are the store of the options; the engine reads its mirror.
    auto mirror = [this](QCheckBox* box, bool Workspace::*field) {
        connect(box, &QCheckBox::toggled, this, [this, field](bool on) { ws_.get()->*field = on; });
    };
    mirror(AutoCropCheckbox, &Workspace::AutoCrop);
    mirror(BlendEdgesCheckbox, &Workspace::BlendEdges);
    mirror(ExpandEdgesCheckbox, &Workspace::ExpandEdges);
    mirror(ProtectPaintCheckbox, &Workspace::ProtectPaint);
    mirror(LoadwithPictureCheckbox, &Workspace::LoadWithPicture);
    connect(AutoCropCheckbox, &QCheckBox::clicked, this, &TintrollaForm::AutoCropCheckbox_Click);
    connect(BlendEdgesCheckbox, &QCheckBox::clicked, this, &TintrollaForm::BlendEdgesCheckbox_Click);
    connect(ExpandEdgesCheckbox, &QCheckBox::clicked, this, &TintrollaForm::ExpandEdgesCheckbox_Click);
    connect(ProtectPaintCheckbox, &QCheckBox::clicked, this, &TintrollaForm::ProtectPaintCheckbox_Click);

    StartupTimer = new QTimer(this);
    StartupTimer->setObjectName(QStringLiteral("StartupTimer"));
    StartupTimer->setInterval(500);
    StartupTimer->setSingleShot(true);
    connect(StartupTimer, &QTimer::timeout, this, &TintrollaForm::StartupTimer_Timer);
    BackgroundTimer = new QTimer(this);
    BackgroundTimer->setObjectName(QStringLiteral("BackgroundTimer"));
    BackgroundTimer->setInterval(100);
    connect(BackgroundTimer, &QTimer::timeout, this, &TintrollaForm::BackgroundTimer_Timer);

    adjustSize();
    setFixedSize(sizeHint());
    if (const QScreen* screen = this->screen()) {
        const QRect area = screen->availableGeometry();
        move(area.center() - rect().center());
    }
}

// --- PaintHost ---------------------------------------------------------------

void TintrollaForm::RefreshPicture() { Picture1->refresh(); }

void TintrollaForm::ToolStateChanged() {
    syncToolbar();
    syncColorBoxes();
    applyPictureCursor();
}

void TintrollaForm::Warning(const std::string& title, const std::string& text) {
    Ask(QString::fromStdString(title), QString::fromStdString(text), platform::Buttons::Ok,
        platform::Icon::Exclamation);
}

void TintrollaForm::PumpEvents() { platform_.processEvents(1); }

void TintrollaForm::SelectColorBox(int index) { PictureColor_MouseDown(index, kLeftButton); }

platform::Answer TintrollaForm::Ask(const QString& title, const QString& text, platform::Buttons buttons,
                                    platform::Icon icon) {
    return platform_.message(this, platform::Message{title, text, buttons, icon});
}

void TintrollaForm::UpdatePictureCursor() {
    ::UpdatePictureCursor(*ws_);
    applyPictureCursor();
}

// --- Closing and the bare window ---------------------------------------------

void TintrollaForm::closeEvent(QCloseEvent* event) {
    if (Form_QueryUnload()) {
        event->ignore();
        return;
    }
    BackgroundTimer->stop();
    StartupTimer->stop();
    event->accept();
}

void TintrollaForm::mousePressEvent(QMouseEvent* event) {
    Form_Click();
    QMainWindow::mousePressEvent(event);
}
