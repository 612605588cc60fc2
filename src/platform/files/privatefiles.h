#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

/// Folders and files that belong to the user alone (0700 and 0600 where the system knows modes, an access
/// list elsewhere).
namespace PrivateFiles {

/// Creates the folder with its missing parents. False when it cannot be had.
bool ensureFolder(const QString &folder);

/// Creates an empty file unless there is one, and its folder. False when it cannot be had.
bool ensureFile(const QString &path);

/// The content of a plain file of this user. Nothing for a longer one, for a file of somebody else, and for
/// what is no plain file; a pipe is not waited for.
std::optional<QByteArray> readOwn(const QString &path, qint64 limit);

} // namespace PrivateFiles
