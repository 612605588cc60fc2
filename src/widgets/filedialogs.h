#pragma once

#include <QString>

#include <functional>

class QWidget;

/// Asks for files, without an event loop of its own; nothing is called when the user gives it up.
namespace FileDialogs {

/// filter: as QFileDialog takes it. suggestion: folder and name; a missing suffix is added.
void askSavePath(QWidget *parent, const QString &title, const QString &suggestion, const QString &filter,
                 const QString &suffix, const std::function<void(const QString &path)> &chosen);

void askFolder(QWidget *parent, const QString &title, const QString &suggestion,
               const std::function<void(const QString &folder)> &chosen);

} // namespace FileDialogs
