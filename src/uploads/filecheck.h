#pragma once

#include <QString>

/// What a look at a file or a folder of this computer has found. The looks block for as long as the disk
/// does: for a runner's thread.
struct FileCheck {
    /// The largest file that is sent.
    static constexpr qint64 largest = qint64{4} << 30;

    qint64 size = 0; ///< bytes: of a file, or what is free in a folder
    QString problem; ///< a sentence; empty where there is none

    /// Whether the file can be sent.
    static FileCheck ofFile(const QString &path);
    /// Whether files can be put into the folder.
    static FileCheck ofFolder(const QString &path);
};
