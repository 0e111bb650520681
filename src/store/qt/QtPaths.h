#pragma once
#include <QString>

#include "store/Paths.h"

// The path helpers for the window's QString paths.
namespace store {

inline QString StripExtension(const QString& p) { return QString::fromStdString(StripExtension(p.toStdString())); }
inline QString StripTrailingBackslash(const QString& p) {
    return QString::fromStdString(StripTrailingBackslash(p.toStdString()));
}
inline QString FolderOf(const QString& p) { return QString::fromStdString(FolderOf(p.toStdString())); }
inline QString FileNameOf(const QString& p) { return QString::fromStdString(FileNameOf(p.toStdString())); }

} // namespace store

#include <QFile>

namespace store {
// A path as the file system takes it.
inline std::string LocalPath(const QString& p) { return QFile::encodeName(p).toStdString(); }
} // namespace store
