#include "devices/operations/certificates/cafilefield.h"

#include "devices/operations/certificates/certificatepaths.h"
#include "devices/operations/certificates/certificatereader.h"
#include "devices/operations/certificates/certificatevalidity.h"

#include <QDateTime>

namespace {

/// What speaks against the certificate; empty for nothing.
QString doubtAbout(const CertificateFile &file) {
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    switch (CertificateValidities::of(file.validFrom, file.validUntil, now)) {
    case CertificateValidity::Expired:
        return CaFileField::tr("This certificate has expired.");
    case CertificateValidity::NotYetValid:
        return CaFileField::tr("This certificate is not yet valid.");
    case CertificateValidity::ExpiresSoon:
        return CaFileField::tr("This certificate expires soon.");
    default:
        return file.isAuthority ? QString() : CaFileField::tr("This is no certificate of an authority.");
    }
}

} // namespace

CaFileField::CaFileField(const QString &caption, QWidget *parent)
    : PathField(caption, tr("Choose a file"), parent), m_reader(new CertificateReader(this)) {
    say({}, Tone::Quiet);
    connect(m_reader, &CertificateReader::progressed, this, &CaFileField::changed);
}

void CaFileField::browse() {
    CertificatePaths::ask(this, tr("Choose a CA certificate"), CertificatePaths::Count::One,
                          [this](const QStringList &paths) { take(paths.first()); });
}

void CaFileField::take(const QString &path) {
    m_reader->read({path}, {}, [this](const auto &files) { onRead(files.front()); });
}

bool CaFileField::isReading() const {
    return m_reader->isReading();
}

void CaFileField::onRead(const CertificateFilePtr &file) {
    showPath(file->path);
    const bool usable = file->error.isEmpty() && file->hasCertificate();
    m_file = usable ? file : nullptr;
    if (!usable)
        return say(file->error.isEmpty() ? tr("There is no certificate in the file.") : file->error,
                   Tone::Warning);
    const QString doubt = doubtAbout(*file);
    const QString details = tr("%1, valid from %2 to %3")
                                .arg(file->subject, CertificateValidities::dateText(file->validFrom),
                                     CertificateValidities::dateText(file->validUntil));
    if (doubt.isEmpty())
        say(details, Tone::Quiet);
    else
        say(tr("%1 %2").arg(doubt, details), Tone::Warning);
}
