#include "devices/operations/certificates/certificateuploaddialog.h"

#include "devices/operations/certificates/certificatesdialog.h"
#include "devices/operations/files/pathfield.h"
#include "devices/operations/queueing.h"
#include "tasks/queue/uploadtaskmgr.h"

#include <QComboBox>
#include <QDragEnterEvent>
#include <QFrame>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QMimeData>
#include <QPushButton>
#include <QToolButton>
#include <QVBoxLayout>

namespace {

constexpr int dialogWidth = 1120;
/// The smallest window has 720 pixels, of which the title area takes its part.
constexpr int maxHeight = 660;

QLabel *namedLabel(const char *name, QWidget *parent) {
    auto *label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    return label;
}

} // namespace

CertificateUploadDialog::CertificateUploadDialog(const QString &title, OperationTargets::List targets,
                                                 DeviceSnapshotPtr managed, QWidget *parent)
    : FramelessDialog(parent),
      m_given(std::move(targets)),
      m_managed(std::move(managed)),
      m_body(new QWidget(content())),
      m_complaintIcon(namedLabel("msgWarningIcon", m_body)),
      m_complaintText(namedLabel("msgWarningLabel", m_body)),
      m_complaint(m_complaintIcon, m_complaintText) {
    setWindowTitle(title);
    setAttribute(Qt::WA_DeleteOnClose);
    setAcceptDrops(true);
    content()->setFixedWidth(dialogWidth);
    content()->setMaximumHeight(maxHeight);
}

CertificateUploadDialog::~CertificateUploadDialog() = default;

void CertificateUploadDialog::finish(QComboBox *method, QWidget *fields) {
    // Made after the fields, so that the keyboard's way leads from top to bottom.
    m_box = new CertificateBox(std::move(m_given), m_body);
    auto *parts = new QVBoxLayout(m_body);
    parts->setContentsMargins(20, 14, 20, 8);
    parts->setSpacing(8);
    parts->addWidget(fields);
    parts->addWidget(m_box, 1);
    parts->addWidget(buildComplaint());
    auto *layout = new QVBoxLayout(content());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(m_body, 1);
    layout->addWidget(buildFooter());
    connect(m_box, &CertificateBox::changed, this, &CertificateUploadDialog::updateAccept);
    // A file dropped on a field is meant for the dialog.
    for (QLineEdit *field : findChildren<QLineEdit *>())
        field->setAcceptDrops(false);
    updateAccept();
    method->setFocus();
}

QWidget *CertificateUploadDialog::buildComplaint() {
    auto *line = new QWidget(m_body);
    auto *layout = new QHBoxLayout(line);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(6);
    layout->addWidget(m_complaintIcon);
    layout->addWidget(m_complaintText, 1);
    return line;
}

QWidget *CertificateUploadDialog::buildFooter() {
    auto *footer = new QFrame(content());
    footer->setObjectName(QStringLiteral("dialogFooter"));
    m_total = namedLabel("totalLabel", footer);
    m_total->setProperty("role", "caption");
    auto *inUse = new QToolButton(footer);
    inUse->setObjectName(QStringLiteral("certificatesInUseButton"));
    inUse->setText(tr("Certificates in use"));
    inUse->setFocusPolicy(Qt::StrongFocus);
    inUse->setProperty("role", "link");
    auto *cancel = new QPushButton(tr("Cancel"), footer);
    cancel->setObjectName(QStringLiteral("cancelButton"));
    cancel->setAutoDefault(false);
    m_apply = new QPushButton(tr("Apply"), footer);
    m_apply->setObjectName(QStringLiteral("applyButton"));
    m_apply->setDefault(true);
    auto *layout = new QHBoxLayout(footer);
    layout->setContentsMargins(20, 14, 20, 14);
    layout->setSpacing(12);
    layout->addWidget(m_total);
    layout->addWidget(inUse);
    layout->addStretch();
    layout->addWidget(cancel);
    layout->addWidget(m_apply);
    connect(inUse, &QToolButton::clicked, this, &CertificateUploadDialog::openCertificates);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(m_apply, &QPushButton::clicked, this, &CertificateUploadDialog::onApply);
    return footer;
}

bool CertificateUploadDialog::complain(QWidget *field, const QString &problem) {
    m_complaint.setText(problem);
    field->setFocus();
    return false;
}

void CertificateUploadDialog::updateAccept() {
    const QLocale locale;
    m_total->setText(tr("%1 of %2 devices will be served")
                         .arg(locale.toString(m_box->readyCount()),
                              locale.toString(static_cast<int>(m_box->targets().size()))));
    m_apply->setEnabled(m_box->readyCount() > 0 && !isReading());
}

void CertificateUploadDialog::openCertificates() {
    auto *dialog = new CertificatesDialog(m_managed, this);
    connect(dialog, &CertificatesDialog::deviceChosen, this, &CertificateUploadDialog::deviceChosen);
    dialog->open();
}

void CertificateUploadDialog::onApply() {
    clearComplaint();
    if (!m_apply->isEnabled() || !areFieldsGood())
        return;
    Queueing::post<UploadTaskMgr>(this, insertion(),
                                  [this] { m_complaint.setText(tr("The upload could not be started.")); });
}

void CertificateUploadDialog::dragEnterEvent(QDragEnterEvent *event) {
    if (takesFiles() && !PathField::localPaths(*event->mimeData()).isEmpty())
        event->acceptProposedAction();
}

void CertificateUploadDialog::dropEvent(QDropEvent *event) {
    event->acceptProposedAction();
    takeDropped(PathField::localPaths(*event->mimeData()), event->position().toPoint());
}

void CertificateUploadDialog::takeDropped(const QStringList &paths, const QPoint &) {
    m_box->takeFiles(paths);
}
