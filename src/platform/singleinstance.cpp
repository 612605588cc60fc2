#include "singleinstance.h"

#include <QDebug>
#include <QDir>

SingleInstance::SingleInstance(const QString &key) {
    m_segment.setKey(key);
}

bool SingleInstance::create() {
    if (m_segment.create(1, QSharedMemory::ReadWrite))
        return true;
    // A crash leaves the segment with nobody attached: the last one to detach removes it.
    if (m_segment.attach(QSharedMemory::ReadWrite))
        m_segment.detach();
    return m_segment.create(1, QSharedMemory::ReadWrite);
}

bool SingleInstance::acquire() {
    if (create())
        return true;
    if (m_segment.error() == QSharedMemory::PermissionDenied) {
        // Another user's segment carries the name; this user's copies agree on one of their own.
        m_segment.setKey(m_segment.key() + QLatin1Char('-') + QDir::home().dirName());
        return create();
    }
    return false;
}
