#pragma once
#include <QDate>
#include <QHash>
#include <QMainWindow>
#include <QString>
#include <array>
#include <functional>
#include <memory>

#include "paint/PaintEngine.h"
#include "paint/Workspace.h"
#include "platform/Platform.h"
#include "print/PaintChoiceSheet.h"

class QAction;
class QCheckBox;
class QGroupBox;
class QLabel;
class QLineEdit;
class QMenu;
class QTimer;
class QToolBar;
class ColorBoxLabel;
class DriveListBox;
class FileListBox;
class FolderListBox;
class PictureView;

// The one window of the program. It owns the workspace and every control;
// its handlers are thin and spread over files by subsystem:
//   shell/TintrollaForm*.cpp        layout, start-up, poll, closing, toolbar, menus, cursors
//   shell/TitleScreen.cpp           the colour-cycling title screen
//   paint/qt/TintrollaForm_Picture.cpp   the work picture's mouse handlers
//   scheme/qt/TintrollaForm_Colors.cpp   colour boxes, renaming, scheme files
//   store/qt/TintrollaForm_*.cpp         browser, opening, saving, exporting, deleting
//   shell/TintrollaForm_Print.cpp   the paint-choice printout
class TintrollaForm : public QMainWindow, public PaintHost {
    Q_OBJECT
public:
    static constexpr int kClientWidth = 671;   // 10065 x 5625 twips
    static constexpr int kClientHeight = 375;
    static inline const QString kCaption = QStringLiteral(" Tint-Rolla  v1.03");

    // `programFolder` is where PICS lies: the executable's folder in the
    // program, a temporary folder in tests.
    TintrollaForm(platform::Platform& platform, const QString& programFolder, QWidget* parent = nullptr);
    ~TintrollaForm() override;

    Workspace& workspace() { return *ws_; }
    PaintEngine& engine() { return *engine_; }
    platform::Platform& platformLayer() { return platform_; }

    // --- PaintHost ---
    void RefreshPicture() override;
    void ToolStateChanged() override;
    void Warning(const std::string& title, const std::string& text) override;
    void PumpEvents() override;
    void SelectColorBox(int index) override;

    // --- Main window and start-up (shell/TintrollaForm_Startup.cpp) ---
    void Form_Load();
    void StartupTimer_Timer();
    void BackgroundTimer_Timer();
    void Form_Click();
    bool Form_QueryUnload();   // true = cancel the close
    void ExitMenuItem_Click();
    // Ends the pickup and set-reference tools and shows the current tool.
    void endPickupAndSetReference();
    // Shows a message through the platform layer.
    platform::Answer Ask(const QString& title, const QString& text, platform::Buttons buttons,
                         platform::Icon icon = platform::Icon::None);

    QString ProgramFolder;
    QString PicsPath;
    QString CurrentPicturePath;
    QString RequestedPicturePath;
    QString ExportFolder;
    QString SchemeFileName;
    bool startupDone() const { return startupDone_; }

    // --- Toolbar, menus and cursors (shell/TintrollaForm_Toolbar.cpp, _Menus.cpp, _Cursors.cpp) ---
    void buildToolbar();
    void buildMenus();
    void Toolbar1_ButtonClick(const QString& key);
    void setToolbarButtonEnabled(const QString& key, bool enabled);
    bool toolbarButtonEnabled(const QString& key) const;
    void syncToolbar();          // pressed and enabled states from the workspace
    void applyPictureCursor();   // the work picture's cursor from the workspace
    void updateMenus();          // enabling and check marks, as a top-level menu opens
    void UpdatePictureCursor();  // the tool-state call, then the window follows
    QHash<QString, QAction*> toolbarButtons;
    QHash<QString, QAction*> menuItems;   // by control name, e.g. "SaveMenuItem"; sub-menus too
    QHash<QString, QMenu*> menus;         // by control name, e.g. "FileMenu", "ExportMenu"
    // The maker's home page, opened by "&Visit Moonfield".
    static inline const QString kHomePage = QStringLiteral("https://www.moonfield.com.au/");
    void RefreshMenuItem_Click();
    void VisitMoonfieldMenuItem_Click();
    void HelpTopicMenuItem_Click(int topic);   // 0-based, in menu order
    void RollerWideMenuItem_Click();
    void RollerNarrowMenuItem_Click();
    void ChalkLineMenuItem_Click();

    // --- Title screen (shell/TitleScreen.cpp) ---
    void DrawTitleScreen();
    void PrintAt(int x, int y, const QString& text);
    void AboutMenuItem_Click();
    // The background as drawn and as last shown, and how far its hues are
    // turned (each redraw turns them two steps further from the original).
    Picture TitleBackgroundOriginal;
    Picture TitleBackgroundPicture;
    int TitleHueTurn = 0;

    // --- Colour boxes and scheme files (scheme/qt/TintrollaForm_Colors.cpp, _Scheme.cpp) ---
    void buildColorBoxes();
    void syncColorBoxes();
    void PictureColor_MouseDown(int index, int button);
    void PictureColor_MouseUp(int index, int button);
    void PictureColor_DblClick(int index);
    void NewColourMenuItem_Click();
    void ClearAllColorsMenuItem_Click();
    void commitRename();
    void cancelRename();
    void ColorNameBox_Change();   // keeps the name to 15 characters, caret kept
    void LoadSchemeMenuItem_Click();
    void SaveSchemeMenuItem_Click();
    // Reads the scheme file that belongs to `path` (its last extension becomes
    // ".csc") into the twelve boxes and shows them. The whole file is read and
    // checked first: a missing, short or damaged file changes no box. Then
    // returns false, shows "Error - Load Colour Scheme" unless `showMessage`
    // is false, and puts the reason into `problem` when given. A missing file
    // is never created.
    bool ReadColorScheme(const QString& path, bool showMessage = true, QString* problem = nullptr);
    // Writes the twelve boxes to the scheme file that belongs to `path`,
    // replacing an old file only once the new one is complete, and sets
    // SchemeFileName to it. On failure: false, "Error - Save Colour Scheme"
    // unless `showMessage` is false, the reason in `problem` when given.
    bool WriteColorScheme(const QString& path, bool showMessage = true, QString* problem = nullptr);

    // --- Picture store (store/qt/TintrollaForm_Browser.cpp, _Open.cpp, _Save.cpp) ---
    void buildBrowser();
    void ShowPicsFolder();
    void ShowDesktopFolder();
    void SetFileListPattern();
    void Dir1_Change();
    void Drive1_Change();
    void File1_Click();
    void OpenFromFileMenuItem_Click();
    void OpenFromClipboardMenuItem_Click();
    void OpenPicture();
    void SaveWork();
    void DeletePicture();
    // Export (store/qt/TintrollaForm_Export.cpp): the blended view to a JPEG or bitmap file, or to the clipboard.
    void ExportToFileMenuItem_Click();
    void ToClipboardMenuItem_Click();
    // The literal request for the clipboard's picture.
    static inline const QString kClipboardRequest = QStringLiteral(".GET-FROM-CLIPBOARD.");
    bool showFolder(const QString& folder);
    void rereadFileList();
    // Yields, then true (and LoadingPicture False) when a newer picture was asked for.
    bool loadAbandoned();
    void failLoad(const QString& error);
    bool isPreviousWork(const QString& path) const;
    // Writes the work's four files as one: all are staged before any replaces its old copy.
    bool writeWorkFiles(const QString& base, QString& error);

    // --- Paint-choice printout (shell/TintrollaForm_Print.cpp) ---
    void PrintMenuItem_Click();
    // What the sheet prints now: the picture's name, today's date in the
    // long date format and the colour boxes.
    print::SheetContent paintChoiceContent() const;
    // Today's date as the printout shows it; tests fix the day.
    std::function<QDate()> Today = [] { return QDate::currentDate(); };

    // --- The work picture (paint/qt/TintrollaForm_Picture.cpp) ---
    void Picture1_MouseDown(int button, float x, float y);
    void Picture1_MouseMove(int buttons, float x, float y);
    void Picture1_MouseUp(int button, float x, float y);

    // --- Option check boxes (shell/TintrollaForm_Options.cpp) ---
    void AutoCropCheckbox_Click();
    void BlendEdgesCheckbox_Click();
    void ExpandEdgesCheckbox_Click();
    void ProtectPaintCheckbox_Click();

    // --- Controls ---
    QWidget* client = nullptr;
    QToolBar* Toolbar1 = nullptr;
    PictureView* Picture1 = nullptr;
    QLabel* Picture2 = nullptr;          // hidden; the photo itself lives in the workspace
    QLabel* TitleBackground = nullptr;   // hidden; holds the 80 x 60 title background
    QGroupBox* ColorSchemeFrame = nullptr;
    std::array<ColorBoxLabel*, kColorBoxCount + 1> PictureColor{};
    QLineEdit* ColorNameBox = nullptr;
    QString ColorNameBoxTag;             // index of the box being renamed; empty = none
    QLabel* PickupColorLabel = nullptr;
    QLabel* Label1 = nullptr;
    DriveListBox* Drive1 = nullptr;
    FolderListBox* Dir1 = nullptr;
    FileListBox* File1 = nullptr;
    QCheckBox* AutoCropCheckbox = nullptr;
    QCheckBox* BlendEdgesCheckbox = nullptr;
    QCheckBox* ExpandEdgesCheckbox = nullptr;
    QCheckBox* ProtectPaintCheckbox = nullptr;
    QCheckBox* LoadwithPictureCheckbox = nullptr;
    QTimer* StartupTimer = nullptr;
    QTimer* BackgroundTimer = nullptr;

protected:
    void closeEvent(QCloseEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;

private:
    void buildLayout();
    QRect twips(int left, int top, int width, int height) const;

    platform::Platform& platform_;
    std::unique_ptr<Workspace> ws_;
    std::unique_ptr<PaintEngine> engine_;
    bool startupDone_ = false;
};
