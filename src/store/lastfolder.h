#pragma once

#include <QString>

/// Where file dialogs begin: in the folder that was used last, whatever for. Any thread; nothing here waits
/// for a disk.
namespace LastFolder {

/// Reads what earlier runs have left, off this thread. What is chosen meanwhile counts.
void load();

/// The folder that was used last; before there was one, that of the user's documents, or else of the user.
QString path();
/// A file of that name there.
QString file(const QString &name);

/// Keeps the folder for the next dialog and for the next run. An empty one forgets the last.
void rememberFolder(const QString &folder);
/// The same with the folder of a file.
void rememberFile(const QString &path);

} // namespace LastFolder
