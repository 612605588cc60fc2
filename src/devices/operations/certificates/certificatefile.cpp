#include "devices/operations/certificates/certificatefile.h"

#include "devices/operations/certificates/certificateparser.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>

namespace CertificateFiles {

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CertificateFiles)
};

/// Why the file is not even opened; empty for none.
QString obstacle(const QFileInfo &info) {
    if (!info.exists())
        return Texts::tr("The file does not exist.");
    if (info.isDir())
        return Texts::tr("It is a folder, not a file.");
    // Opening a pipe would wait for whoever writes to it.
    if (!info.isFile())
        return Texts::tr("It is not a plain file.");
    if (info.size() == 0)
        return Texts::tr("The file is empty.");
    if (info.size() > sizeLimit)
        return Texts::tr("The file is larger than 1 MiB, which no certificate is.");
    return {};
}

QString contents(const QString &path, QByteArray &bytes) {
    if (const QString reason = obstacle(QFileInfo(path)); !reason.isEmpty())
        return reason;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return Texts::tr("The file cannot be read: %1.").arg(file.errorString());
    bytes = file.read(sizeLimit);
    return bytes.isEmpty() ? Texts::tr("The file cannot be read.") : QString();
}

} // namespace

CertificateFile read(const QString &path, const QString &passPhrase) {
    CertificateFile file;
    file.path = path;
    file.name = QFileInfo(path).fileName();
    QByteArray bytes;
    file.error = contents(path, bytes);
    if (file.error.isEmpty())
        CertificateParser::parse(bytes, passPhrase.toUtf8(), file);
    bytes.fill('\0');
    return file;
}

bool belongTogether(const CertificateFile &certificate, const CertificateFile &key) {
    return !certificate.certificateMark.isEmpty() && certificate.certificateMark == key.keyMark;
}

} // namespace CertificateFiles
