#pragma once

#include <QLockFile>
#include <QSharedMemory>
#include <QString>

#include <optional>

/// The lock that lets one copy of the program run, held from acquire() to the end of the object.
///
/// It is a named shared-memory segment of one byte, and a lock file beside it: the name is open to every user
/// of the machine, and the system forgets it when the folder of temporary files is cleaned up.
class SingleInstance {
public:
    /// folder: where this user's lock file stands; made when it is missing.
    SingleInstance(const QString &key, const QString &folder);

    /// True when this process holds the lock. What a crash left behind is taken over; a segment of another
    /// user of the machine does not count.
    bool acquire();

private:
    enum class Outcome { Created, Held, Foreign };

    Outcome create(const QString &key);

    QString m_key;
    QString m_folder;
    std::optional<QLockFile> m_file;
    std::optional<QSharedMemory> m_segment;
};
