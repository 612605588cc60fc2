#pragma once

class QFile;
class QString;

/// Brings files onto the disk, so that they outlive a power cut. Blocks for the disk: for a runner's thread.
namespace DurableFiles {

/// Writes out what the open file holds. False when the disk did not take it.
bool sync(QFile &file);
/// Writes out the names in a folder, of files that were made or renamed there. False as above.
bool syncFolder(const QString &folder);

} // namespace DurableFiles
