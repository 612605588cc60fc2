#include "filecheck.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QStorageInfo>

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(FileCheck)
};

bool canBeRead(const QString &path) {
    QFile file(path);
    char byte = 0;
    return file.open(QIODevice::ReadOnly | QIODevice::Unbuffered) && file.read(&byte, 1) == 1;
}

QString fileProblem(const QFileInfo &file) {
    if (!file.exists())
        return Texts::tr("There is no such file.");
    if (file.isDir())
        return Texts::tr("This is a folder.");
    // Before it is opened: opening a pipe would wait for its other end.
    if (!file.isFile())
        return Texts::tr("This is no plain file.");
    if (file.fileName().trimmed().isEmpty())
        return Texts::tr("The file has a blank name.");
    if (file.size() == 0)
        return Texts::tr("The file is empty.");
    if (file.size() > FileCheck::largest)
        return Texts::tr("The file is larger than 4 GiB.");
    return canBeRead(file.filePath()) ? QString() : Texts::tr("The file cannot be read.");
}

QString folderProblem(const QFileInfo &folder) {
    if (!folder.exists())
        return Texts::tr("There is no such folder.");
    if (!folder.isDir())
        return Texts::tr("This is no folder.");
    return folder.isWritable() ? QString() : Texts::tr("Nothing can be written to this folder.");
}

} // namespace

FileCheck FileCheck::ofFile(const QString &path) {
    const QFileInfo file(path);
    return {file.size(), fileProblem(file)};
}

FileCheck FileCheck::ofFolder(const QString &path) {
    return {QStorageInfo(path).bytesAvailable(), folderProblem(QFileInfo(path))};
}
