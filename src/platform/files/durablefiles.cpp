#include "platform/files/durablefiles.h"

#include <QFile>

#ifdef Q_OS_WIN
#include <io.h>
#else
#include <fcntl.h>
#include <unistd.h>
#endif

namespace DurableFiles {

bool sync(QFile &file) {
#ifdef Q_OS_WIN
    return file.flush() && _commit(file.handle()) == 0;
#else
    return file.flush() && ::fsync(file.handle()) == 0;
#endif
}

bool syncFolder([[maybe_unused]] const QString &folder) {
#ifdef Q_OS_WIN
    // The file system keeps names in its journal, and offers no way to wait for them.
    return true;
#else
    const int handle = ::open(QFile::encodeName(folder).constData(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (handle < 0)
        return false;
    const bool isWritten = ::fsync(handle) == 0;
    ::close(handle);
    return isWritten;
#endif
}

} // namespace DurableFiles
