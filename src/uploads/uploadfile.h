#pragma once

#include <QByteArray>
#include <QString>

/// A file that is to be sent, as a look at it has found it.
struct UploadFile {
    static constexpr qint64 mostBytes = qint64{4} << 30; ///< more than that the service does not take

    QString path;
    QString name;
    qint64 size = 0;
    qint64 changedAt = 0; ///< Unix ms
    QByteArray head;      ///< its first bytes
    QString problem;      ///< why it cannot be sent, as a sentence; empty where it can

    bool isGood() const { return !path.isEmpty() && problem.isEmpty(); }
    /// True while the other look found the same file, unchanged.
    bool isSame(const UploadFile &other) const;

    /// Looks at a file; reads no more of it than the head. Blocks for as long as the disk does: for a
    /// runner's thread.
    static UploadFile inspect(const QString &path);
};
