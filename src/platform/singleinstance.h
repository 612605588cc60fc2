#pragma once

#include <QSharedMemory>
#include <QString>

/// The lock that lets one copy of the program run: a named shared-memory segment of one byte, held from
/// acquire() to the end of the object.
class SingleInstance {
public:
    explicit SingleInstance(const QString &key);

    /// True when this process holds the lock. A segment left behind by a crash is taken over; one that
    /// belongs to another user of the machine does not count.
    bool acquire();

private:
    bool create();

    QSharedMemory m_segment;
};
