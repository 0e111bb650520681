#pragma once
#include <QComboBox>
#include <QFileSystemWatcher>
#include <QListWidget>
#include <QStringList>
#include <QTimer>

// The picture browser's three lists: mounted volumes, the folder chain with
// its subfolders, and the pictures of the folder that match the pattern.

// Mounted volumes a person would pick, by their root path, read again each
// time the list opens. `drive()` is the chosen root.
class DriveListBox : public QComboBox {
    Q_OBJECT
public:
    explicit DriveListBox(QWidget* parent = nullptr);
    void reread();
    // The volume holding `folder` (the program's own) is listed whatever it is.
    void setAlwaysListed(const QString& folder);
    QString drive() const;
    // Shows the volume that holds `path` (adding it when the list lacks it).
    void setDriveOf(const QString& path);

    void showPopup() override;

signals:
    void driveChosen();  // the user picked a drive

private:
    bool quiet_ = false;
    QString alwaysListed_;
};

// The folder chain from the root down to the open folder, then its
// subfolders. Activating an entry (double click, Enter) opens it.
class FolderListBox : public QListWidget {
    Q_OBJECT
public:
    explicit FolderListBox(QWidget* parent = nullptr);
    QString path() const { return path_; }
    // Opens `path`; false (nothing changed) when it is no readable folder.
    // Emits pathChanged when the path changed.
    bool setPath(const QString& path);
    // The folder of the highlighted entry; empty when none is highlighted.
    QString highlightedPath() const;

signals:
    void pathChanged();

private:
    static QString pathOf(const QListWidgetItem* item);
    QString path_;
};

// Files of one folder that match a pattern such as "*.jpg;*.gif;*.bmp",
// letter case ignored, sorted by name. The list follows the folder: files
// added or removed by other programs appear and go, the selection staying.
class FileListBox : public QListWidget {
    Q_OBJECT
public:
    explicit FileListBox(QWidget* parent = nullptr);
    QString path() const { return path_; }
    void setPath(const QString& path);
    void setPattern(const QString& pattern);
    void reread();
    QStringList entries() const;
    // The selected file name; empty when no entry is selected.
    QString selectedName() const;
    // Selects the first entry equal to `name` ignoring case; false when none.
    bool selectName(const QString& name);

signals:
    void fileClicked();  // a click, or the keyboard moving the selection

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    static bool matches(const QString& name, const QString& pattern);
    QStringList listed() const;  // the matching names in the folder now
    void watch();                // the watcher holds the shown folder alone
    void follow();               // takes in what changed, keeping the selection
    QString path_;
    QString pattern_;
    QFileSystemWatcher* watcher_;
    QTimer* settle_;             // one reread for a burst of changes
};
