#include "cafilefield.h"

#include "certificatepaths.h"
#include "certificatereader.h"
#include "certificatevalidity.h"
#include "plaintext.h"

#include <QDateTime>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStyle>
#include <QVBoxLayout>

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

CaFileField::CaFileField(QWidget *parent)
    : QWidget(parent),
      m_reader(new CertificateReader(this)),
      m_name(new QLineEdit(this)),
      m_details(new QLabel(this)) {
    m_name->setObjectName(QStringLiteral("caFileEdit"));
    m_name->setAccessibleName(tr("CA certificate"));
    m_name->setPlaceholderText(tr("Choose a file"));
    m_name->setReadOnly(true);
    auto *browse = new QPushButton(tr("Browse…"), this);
    browse->setObjectName(QStringLiteral("caBrowseButton"));
    browse->setAutoDefault(false);
    m_details->setObjectName(QStringLiteral("caDetailsLabel"));
    m_details->setTextFormat(Qt::PlainText);
    m_details->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    tell({}, "quiet");
    auto *line = new QHBoxLayout;
    line->setSpacing(8);
    line->addWidget(m_name, 1);
    line->addWidget(browse);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addLayout(line);
    layout->addWidget(m_details);
    setFocusProxy(browse);
    connect(browse, &QPushButton::clicked, this, [this] {
        CertificatePaths::ask(this, tr("Choose a CA certificate"), CertificatePaths::Count::One,
                              [this](const QStringList &paths) { take(paths.first()); });
    });
    connect(m_reader, &CertificateReader::progressed, this, &CaFileField::changed);
}

void CaFileField::take(const QString &path) {
    m_reader->read({path}, {}, [this](const auto &files) { onRead(files.front()); });
}

bool CaFileField::isReading() const {
    return m_reader->isReading();
}

void CaFileField::onRead(const CertificateFilePtr &file) {
    m_name->setText(file->name);
    m_name->setToolTip(PlainText::toolTip(file->path));
    const bool usable = file->error.isEmpty() && file->hasCertificate();
    m_file = usable ? file : nullptr;
    if (!usable)
        return tell(file->error.isEmpty() ? tr("There is no certificate in the file.") : file->error,
                    "warning");
    const QString doubt = doubtAbout(*file);
    const QString details = tr("%1, valid from %2 to %3")
                                .arg(file->subject, CertificateValidities::dateText(file->validFrom),
                                     CertificateValidities::dateText(file->validUntil));
    tell(doubt.isEmpty() ? details : tr("%1 %2").arg(doubt, details), doubt.isEmpty() ? "quiet" : "warning");
}

void CaFileField::tell(const QString &text, const char *role) {
    m_details->setProperty("role", role);
    m_details->style()->unpolish(m_details);
    m_details->style()->polish(m_details);
    // The line keeps its place while there is nothing to tell.
    m_details->setText(text.isEmpty() ? QStringLiteral(" ") : text);
    m_details->setToolTip(PlainText::toolTip(text));
}
