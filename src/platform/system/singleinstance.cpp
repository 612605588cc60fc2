#include "platform/system/singleinstance.h"

#include "platform/files/privatefiles.h"

#include <QDir>
#include <QFile>
#include <QSysInfo>

#ifdef __unix__
#include <cerrno>
#include <sys/ipc.h>
#include <sys/shm.h>
#include <unistd.h>
#endif

namespace {

/// The name of the segment in the system. Its semaphore is left alone, which another user could hold for
/// ever.
QString nativeName(const QString &key) {
    QSharedMemory segment;
    segment.setKey(key);
    return segment.nativeKey();
}

#ifdef __unix__

/// Whether another user has made the segment. Its creator counts: an owner can give it away.
bool isForeign(const QString &name) {
    constexpr int project = 'Q'; // the one that Qt makes its keys with
    const int id = ::shmget(::ftok(QFile::encodeName(name).constData(), project), 0, 0);
    shmid_ds segment{};
    if (id < 0 || ::shmctl(id, IPC_STAT, &segment) != 0)
        return errno == EACCES;
    return segment.shm_perm.cuid != ::geteuid();
}

#else

bool isForeign(const QString &) {
    return false;
}

#endif

} // namespace

SingleInstance::SingleInstance(const QString &key, const QString &folder) : m_key(key), m_folder(folder) {}

SingleInstance::Outcome SingleInstance::create(const QString &key) {
    const QString name = nativeName(key);
    const auto make = [&] {
        // An object that has failed once fails at everything after that.
        m_segment.emplace();
        m_segment->setNativeKey(name);
        return m_segment->create(1, QSharedMemory::ReadWrite);
    };
    if (make())
        return Outcome::Created;
    if (m_segment->error() != QSharedMemory::AlreadyExists || isForeign(name))
        return Outcome::Foreign;
    // A crash leaves the segment with nobody attached: the last one to detach removes it.
    QSharedMemory left;
    left.setNativeKey(name);
    if (left.attach(QSharedMemory::ReadWrite))
        left.detach();
    return make() ? Outcome::Created : Outcome::Held;
}

bool SingleInstance::acquire() {
    PrivateFiles::ensureFolder(m_folder);
    // With the machine's name: a home folder may be shared between machines.
    m_file.emplace(m_folder + QStringLiteral("/client-%1.lock").arg(QSysInfo::machineHostName()));
    // However long the program runs; a lock whose process is gone is not kept.
    m_file->setStaleLockTime(0);
    if (!m_file->tryLock() && m_file->error() == QLockFile::LockFailedError)
        return false;
    Outcome outcome = create(m_key);
    // This user's copies agree on a segment of their own where another user has taken the name.
    if (outcome == Outcome::Foreign)
        outcome = create(m_key + QLatin1Char('-') + QDir::home().dirName());
    return outcome != Outcome::Held;
}
