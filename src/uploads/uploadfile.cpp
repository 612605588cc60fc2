#include "uploadfile.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QLocale>

#include <filesystem>

namespace {

namespace fs = std::filesystem;

constexpr qint64 headLength = 8192;

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(UploadFile)
};

/// Before anything is opened: opening a pipe would wait for its other end.
QString kindProblem(const QString &path) {
    std::error_code error;
    const fs::file_status status = fs::status(QFile(path).filesystemFileName(), error);
    if (status.type() == fs::file_type::not_found)
        return Texts::tr("There is no such file.");
    if (fs::is_directory(status))
        return Texts::tr("This is a folder, not a file.");
    if (status.type() == fs::file_type::none || status.type() == fs::file_type::unknown)
        return Texts::tr("The file cannot be read.");
    return fs::is_regular_file(status) ? QString() : Texts::tr("This is no plain file.");
}

QString sizeProblem(qint64 size) {
    if (size == 0)
        return Texts::tr("The file is empty.");
    if (size > UploadFile::mostBytes)
        return Texts::tr("The file has %1; the server takes %2 at most.")
            .arg(QLocale().formattedDataSize(size, 1), QLocale().formattedDataSize(UploadFile::mostBytes, 0));
    return {};
}

} // namespace

bool UploadFile::isSame(const UploadFile &other) const {
    return path == other.path && size == other.size && changedAt == other.changedAt;
}

UploadFile UploadFile::inspect(const QString &path) {
    UploadFile found;
    const QFileInfo info(path);
    found.path = path;
    found.name = info.fileName();
    found.problem = kindProblem(path);
    if (!found.problem.isEmpty())
        return found;
    found.size = info.size();
    found.changedAt = info.lastModified().toMSecsSinceEpoch();
    found.problem = sizeProblem(found.size);
    QFile file(path);
    if (found.problem.isEmpty() && !file.open(QIODevice::ReadOnly))
        found.problem = Texts::tr("The file cannot be read.");
    if (found.problem.isEmpty() && found.name.trimmed().isEmpty())
        found.problem = Texts::tr("The name of the file is blank; give it another one.");
    if (found.problem.isEmpty())
        found.head = file.read(headLength);
    return found;
}
