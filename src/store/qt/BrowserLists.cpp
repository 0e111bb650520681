#include "store/qt/BrowserLists.h"

#include <QDir>
#include <QFileInfo>
#include <QKeyEvent>
#include <QRegularExpression>
#include <QScrollBar>
#include <QStorageInfo>

#include "store/Volumes.h"

// --- Drives ------------------------------------------------------------------

DriveListBox::DriveListBox(QWidget* parent) : QComboBox(parent) {
    reread();
    connect(this, &QComboBox::activated, this, [this](int) {
        if (!quiet_) emit driveChosen();
    });
}

namespace {

// Mount points worth offering. The kernel's mount table is read as text so
// that no pseudo file system is ever asked for its size.
QStringList OfferedMounts() {
    const std::string home = QFile::encodeName(QDir::homePath()).toStdString();
    std::vector<std::string> points;
    QFile table(QStringLiteral("/proc/self/mounts"));
    if (table.open(QIODevice::ReadOnly)) {
        points = store::UserVolumes(table.readAll().toStdString(), home);
    } else {
        for (const QStorageInfo& volume : QStorageInfo::mountedVolumes()) {
            const store::MountEntry entry{volume.device().toStdString(), QFile::encodeName(volume.rootPath()).toStdString(),
                                          volume.fileSystemType().toStdString()};
            if (store::IsUserVolume(entry, home)) points.push_back(entry.mountPoint);
        }
    }
    QStringList out;
    for (const std::string& p : points) out << QFile::decodeName(QByteArray::fromStdString(p));
    return out;
}

} // namespace

void DriveListBox::reread() {
    quiet_ = true;
    const QString current = drive();
    clear();
    for (const QString& point : OfferedMounts()) {
        const QStorageInfo volume(point);
        // Only what is mounted and answers: an empty card reader or a share
        // that went away is left out.
        if (!volume.isValid() || !volume.isReady() || volume.rootPath() != point) continue;
        if (findData(point) < 0) addItem(point, point);
    }
    if (!alwaysListed_.isEmpty()) {
        const QString root = QStorageInfo(alwaysListed_).rootPath();
        if (!root.isEmpty() && findData(root) < 0) addItem(root, root);
    }
    if (const int i = findData(current); i >= 0) setCurrentIndex(i);
    quiet_ = false;
}

void DriveListBox::setAlwaysListed(const QString& folder) {
    alwaysListed_ = folder;
    reread();
}

void DriveListBox::showPopup() {
    reread();  // a stick plugged in since the list last opened shows up
    QComboBox::showPopup();
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

FileListBox::FileListBox(QWidget* parent)
    : QListWidget(parent), watcher_(new QFileSystemWatcher(this)), settle_(new QTimer(this)) {
    setSelectionMode(QAbstractItemView::SingleSelection);
    connect(this, &QListWidget::itemClicked, this, [this](QListWidgetItem*) { emit fileClicked(); });
    // A copy or a save touches the folder several times in a row.
    settle_->setSingleShot(true);
    settle_->setInterval(150);
    connect(settle_, &QTimer::timeout, this, &FileListBox::follow);
    connect(watcher_, &QFileSystemWatcher::directoryChanged, settle_, qOverload<>(&QTimer::start));
}

void FileListBox::setPath(const QString& path) {
    path_ = path;
    watch();
    reread();
}

void FileListBox::watch() {
    const QStringList watched = watcher_->directories();
    if (watched.size() == 1 && watched.constFirst() == path_) return;
    if (!watched.isEmpty()) watcher_->removePaths(watched);
    if (!path_.isEmpty() && QFileInfo(path_).isDir()) watcher_->addPath(path_);
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

QStringList FileListBox::listed() const {
    QStringList out;
    if (path_.isEmpty()) return out;
    const QStringList names = QDir(path_).entryList(QDir::Files, QDir::Name | QDir::IgnoreCase);
    for (const QString& name : names)
        if (matches(name, pattern_)) out << name;
    return out;
}

void FileListBox::reread() {
    settle_->stop();
    clear();
    addItems(listed());
    setCurrentRow(-1);
}

void FileListBox::follow() {
    watch();  // a folder removed and made again is watched anew
    const QStringList names = listed();
    if (names == entries()) return;
    const QString selected = selectedName();
    const int scroll = verticalScrollBar()->value();
    clear();
    addItems(names);
    setCurrentRow(-1);
    // The chosen picture stays chosen while it is there; nothing is opened.
    if (const int row = static_cast<int>(names.indexOf(selected)); !selected.isEmpty() && row >= 0) setCurrentRow(row);
    verticalScrollBar()->setValue(scroll);
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
