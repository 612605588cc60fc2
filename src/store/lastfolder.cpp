#include "store/lastfolder.h"

#include "store/localstore.h"
#include "store/storewriter.h"

#include <QDir>
#include <QFileInfo>
#include <QStandardPaths>

#include <mutex>

namespace LastFolder {

namespace {

struct Memory {
    std::mutex mutex;
    QString used;
    QString usual;   ///< in place of the used one while there is none
    int choices = 0; ///< folders that were remembered
};

Memory &memory() {
    // Never destroyed: the writer may still read the store when the program ends.
    static auto *const memory = new Memory;
    return *memory;
}

int choices() {
    const std::lock_guard lock(memory().mutex);
    return memory().choices;
}

} // namespace

void load() {
    StoreWriter::post([before = choices()] {
        const QString stored = CLocalStore::instance().defaultFilePath();
        const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
        const bool isThere = QFileInfo(documents).isDir();
        const std::lock_guard lock(memory().mutex);
        memory().usual = isThere ? documents : QString();
        if (memory().choices == before)
            memory().used = stored;
    });
}

QString path() {
    const std::lock_guard lock(memory().mutex);
    if (!memory().used.isEmpty())
        return memory().used;
    return memory().usual.isEmpty() ? QDir::homePath() : memory().usual;
}

QString file(const QString &name) {
    return QDir(path()).filePath(name);
}

void rememberFolder(const QString &folder) {
    {
        const std::lock_guard lock(memory().mutex);
        memory().used = folder;
        ++memory().choices;
    }
    StoreWriter::post([folder] { CLocalStore::instance().setDefaultFilePath(folder); });
}

void rememberFile(const QString &path) {
    rememberFolder(QFileInfo(path).absolutePath());
}

} // namespace LastFolder
