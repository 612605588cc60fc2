#pragma once

#include <QStringList>

#include <functional>

class QWidget;

/// Asks for files, without an event loop of its own; nothing is called when the user gives it up.
namespace FileDialogs {

/// An existing file. folder: where to begin; filter: as QFileDialog takes it.
void askOpenPath(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                 const std::function<void(const QString &path)> &chosen);

/// The same for any number of files.
void askOpenPaths(QWidget *parent, const QString &title, const QString &folder, const QString &filter,
                  const std::function<void(const QStringList &paths)> &chosen);

/// filter: as QFileDialog takes it. suggestion: folder and name; a missing suffix is added.
void askSavePath(QWidget *parent, const QString &title, const QString &suggestion, const QString &filter,
                 const QString &suffix, const std::function<void(const QString &path)> &chosen);

/// Asks for a folder that exists, beginning in the given one.
void askFolder(QWidget *parent, const QString &title, const QString &folder,
               const std::function<void(const QString &path)> &chosen);

} // namespace FileDialogs
