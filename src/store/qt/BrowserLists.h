#pragma once
#include <QComboBox>
#include <QListWidget>

// The picture browser's three lists: mounted volumes, the folder chain with
// its subfolders, and the pictures of the folder that match the pattern.
class DriveListBox : public QComboBox {
    Q_OBJECT
public:
    using QComboBox::QComboBox;
};

class FolderListBox : public QListWidget {
    Q_OBJECT
public:
    using QListWidget::QListWidget;
    QString path() const { return path_; }
    void setPath(const QString& path) { path_ = path; }

private:
    QString path_;
};

class FileListBox : public QListWidget {
    Q_OBJECT
public:
    using QListWidget::QListWidget;
    QString path() const { return path_; }
    void setPath(const QString& path) { path_ = path; }
    QString pattern() const { return pattern_; }
    void setPattern(const QString& pattern) { pattern_ = pattern; }

private:
    QString path_;
    QString pattern_;
};
