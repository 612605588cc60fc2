#include "devices/operations/files/filecheck.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QLocale>
#include <QStorageInfo>

#include <filesystem>

namespace {

namespace fs = std::filesystem;

constexpr qint64 headLength = 8192;

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(FileCheck)
};

/// Before anything is opened: opening a pipe would wait for its other end.
QString kindProblem(const QString &path) {
    std::error_code error;
    const fs::file_status status = fs::status(QFile(path).filesystemFileName(), error);
    // What the file system's own encoding could not be read of stands as this character, and leads nowhere.
    if (status.type() == fs::file_type::not_found && path.contains(QChar::ReplacementCharacter))
        return Texts::tr("The name of the file is damaged; give it another one.");
    if (status.type() == fs::file_type::not_found)
        return Texts::tr("There is no such file.");
    if (fs::is_directory(status))
        return Texts::tr("This is a folder.");
    if (status.type() == fs::file_type::none || status.type() == fs::file_type::unknown)
        return Texts::tr("The file cannot be read.");
    return fs::is_regular_file(status) ? QString() : Texts::tr("This is no plain file.");
}

QString contentProblem(const FileCheck &file) {
    const QLocale locale;
    if (file.name.trimmed().isEmpty())
        return Texts::tr("The name of the file is blank; give it another one.");
    if (file.size == 0)
        return Texts::tr("The file is empty.");
    if (file.size > FileCheck::largest)
        return Texts::tr("The file has %1; the server takes %2 at most.")
            .arg(locale.formattedDataSize(file.size, 1), locale.formattedDataSize(FileCheck::largest, 0));
    return file.head.isEmpty() ? Texts::tr("The file cannot be read.") : QString();
}

QByteArray readHead(const QString &path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly | QIODevice::Unbuffered) ? file.read(headLength) : QByteArray();
}

QString folderProblem(const QFileInfo &folder) {
    if (!folder.exists())
        return Texts::tr("There is no such folder.");
    if (!folder.isDir())
        return Texts::tr("This is no folder.");
    return folder.isWritable() ? QString() : Texts::tr("Nothing can be written to this folder.");
}

} // namespace

bool FileCheck::isSame(const FileCheck &other) const {
    return path == other.path && size == other.size && changedAt == other.changedAt;
}

FileCheck FileCheck::ofFile(const QString &path) {
    FileCheck found;
    const QFileInfo info(path);
    found.path = path;
    found.name = info.fileName();
    found.problem = kindProblem(path);
    if (!found.problem.isEmpty())
        return found;
    found.size = info.size();
    found.changedAt = info.lastModified().toMSecsSinceEpoch();
    found.head = readHead(path);
    found.problem = contentProblem(found);
    return found;
}

FileCheck FileCheck::ofFolder(const QString &path) {
    const QFileInfo folder(path);
    FileCheck found;
    found.path = path;
    found.name = folder.fileName();
    found.size = QStorageInfo(path).bytesAvailable();
    found.problem = folderProblem(folder);
    return found;
}
