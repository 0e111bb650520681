#include "store/qt/BrowserLists.h"

#include <QDir>
#include <QFileInfo>
#include <QKeyEvent>
#include <QRegularExpression>
#include <QStorageInfo>

// --- Drives ------------------------------------------------------------------

DriveListBox::DriveListBox(QWidget* parent) : QComboBox(parent) {
    reread();
    connect(this, &QComboBox::activated, this, [this](int) {
        if (!quiet_) emit driveChosen();
    });
}

void DriveListBox::reread() {
    quiet_ = true;
    const QString current = drive();
    clear();
    for (const QStorageInfo& volume : QStorageInfo::mountedVolumes()) {
        if (!volume.isValid() || !volume.isReady()) continue;
        const QString root = volume.rootPath();
        if (findData(root) >= 0) continue;
        addItem(root, root);
    }
    if (const int i = findData(current); i >= 0) setCurrentIndex(i);
    quiet_ = false;
}

QString DriveListBox::drive() const { return currentData().toString(); }

void DriveListBox::setDriveOf(const QString& path) {
    const QString root = QStorageInfo(path).rootPath();
    if (root.isEmpty()) return;
    quiet_ = true;
    int i = findData(root);
    if (i < 0) {
        addItem(root, root);
        i = count() - 1;
    }
    setCurrentIndex(i);
    quiet_ = false;
}

// --- Folders -----------------------------------------------------------------

FolderListBox::FolderListBox(QWidget* parent) : QListWidget(parent) {
    connect(this, &QListWidget::itemActivated, this, [this](QListWidgetItem* item) { setPath(pathOf(item)); });
}

QString FolderListBox::pathOf(const QListWidgetItem* item) {
    return item ? item->data(Qt::UserRole).toString() : QString();
}

QString FolderListBox::highlightedPath() const {
    return currentRow() < 0 ? QString() : pathOf(currentItem());
}

bool FolderListBox::setPath(const QString& wanted) {
    if (wanted.isEmpty()) return false;
    const QFileInfo info(wanted);
    if (!info.exists() || !info.isDir() || !info.isReadable()) return false;
    const QString path = QDir::cleanPath(info.absoluteFilePath());
    const bool changed = path != path_;
    path_ = path;

    clear();
    // The chain from the root down, each entry indented one step further.
    QStringList chain;
    for (QDir d(path);; ) {
        chain.prepend(d.absolutePath());
        if (d.isRoot() || !d.cdUp()) break;
    }
    int depth = 0;
    for (const QString& folder : chain) {
        const QString name = QDir(folder).isRoot() ? folder : QDir(folder).dirName();
        auto* item = new QListWidgetItem(QString(depth * 2, ' ') + name, this);
        item->setData(Qt::UserRole, folder);
        ++depth;
    }
    const QStringList subfolders =
        QDir(path).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name | QDir::IgnoreCase);
    for (const QString& name : subfolders) {
        auto* item = new QListWidgetItem(QString(depth * 2, ' ') + name, this);
        item->setData(Qt::UserRole, QDir(path).filePath(name));
    }
    setCurrentRow(-1);
    if (changed) emit pathChanged();
    return true;
}

// --- Files -------------------------------------------------------------------

FileListBox::FileListBox(QWidget* parent) : QListWidget(parent) {
    setSelectionMode(QAbstractItemView::SingleSelection);
    connect(this, &QListWidget::itemClicked, this, [this](QListWidgetItem*) { emit fileClicked(); });
}

void FileListBox::setPath(const QString& path) {
    path_ = path;
    reread();
}

void FileListBox::setPattern(const QString& pattern) {
    if (pattern == pattern_) return;
    pattern_ = pattern;
    reread();
}

bool FileListBox::matches(const QString& name, const QString& pattern) {
    for (const QString& part : pattern.split(';', Qt::SkipEmptyParts)) {
        const QRegularExpression re(QRegularExpression::wildcardToRegularExpression(part.trimmed()),
                                    QRegularExpression::CaseInsensitiveOption);
        if (re.match(name).hasMatch()) return true;
    }
    return false;
}

void FileListBox::reread() {
    clear();
    if (path_.isEmpty()) return;
    const QStringList names = QDir(path_).entryList(QDir::Files, QDir::Name | QDir::IgnoreCase);
    for (const QString& name : names)
        if (matches(name, pattern_)) addItem(name);
    setCurrentRow(-1);
}

QStringList FileListBox::entries() const {
    QStringList out;
    for (int i = 0; i < count(); ++i) out << item(i)->text();
    return out;
}

QString FileListBox::selectedName() const {
    const QListWidgetItem* it = currentItem();
    return (currentRow() >= 0 && it && it->isSelected()) ? it->text() : QString();
}

bool FileListBox::selectName(const QString& name) {
    for (int i = 0; i < count(); ++i) {
        if (item(i)->text().compare(name, Qt::CaseInsensitive) == 0) {
            setCurrentRow(i);
            return true;
        }
    }
    return false;
}

void FileListBox::keyPressEvent(QKeyEvent* event) {
    const int before = currentRow();
    QListWidget::keyPressEvent(event);
    if (currentRow() != before && currentRow() >= 0) emit fileClicked();
}
