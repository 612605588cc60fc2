#pragma once

#include <QByteArray>
#include <QString>

/// What a look at a file or a folder of this computer has found. The looks block for as long as the disk
/// does: for a runner's thread.
struct FileCheck {
    /// The largest file that the service takes.
    static constexpr qint64 largest = qint64{4} << 30;

    QString path;
    QString name;
    qint64 size = 0;      ///< bytes: of a file, or what is free in a folder
    qint64 changedAt = 0; ///< Unix ms
    QByteArray head;      ///< the first bytes of a file
    QString problem;      ///< why it is of no use, as a sentence; empty where it is good

    bool isGood() const { return !path.isEmpty() && problem.isEmpty(); }
    /// True while the other look found the same file, unchanged.
    bool isSame(const FileCheck &other) const;

    /// Whether the file can be sent. Reads no more of it than the head.
    static FileCheck ofFile(const QString &path);
    /// Whether files can be put into the folder.
    static FileCheck ofFolder(const QString &path);
};
