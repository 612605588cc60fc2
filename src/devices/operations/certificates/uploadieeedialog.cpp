#include "devices/operations/certificates/uploadieeedialog.h"

#include "devices/operations/captioned.h"
#include "devices/operations/certificates/cafilefield.h"
#include "devices/operations/operations.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "widgets/controls/passwordedit.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QTimer>
#include <QVBoxLayout>

#include <nlohmann/json.hpp>

namespace {

constexpr int maxIdentityLength = 253; ///< as the protocol limits it
constexpr int maxPasswordLength = 256;
constexpr int typingPauseMs = 400;
constexpr int methodWidth = 200;

/// The values of "mode".
const QString modes[] = {QStringLiteral("eap_peap"), QStringLiteral("eap_tls")};

PasswordEdit *makePassword(const char *name, QWidget *parent) {
    auto *password = new PasswordEdit(parent);
    password->setObjectName(QLatin1String(name));
    password->setMaxLength(maxPasswordLength);
    return password;
}

} // namespace

UploadIeeeDialog::UploadIeeeDialog(OperationTargets::List targets, DeviceSnapshotPtr managed, QWidget *parent)
    : CertificateUploadDialog(tr("Upload Certificate – IEEE 802.1x"), std::move(targets), std::move(managed),
                              parent),
      m_method(new QComboBox(body())),
      m_identity(new QLineEdit(body())),
      m_password(makePassword("passEdit", body())),
      m_keyPassword(makePassword("keyPassEdit", body())),
      m_ca(new CaFileField(tr("CA Certificate"), body())),
      m_typed(new QTimer(this)) {
    setObjectName(QStringLiteral("UploadIeeeDialog"));
    m_method->setObjectName(QStringLiteral("methodComboBox"));
    m_method->addItems({QStringLiteral("EAP-PEAP"), QStringLiteral("EAP-TLS")});
    m_identity->setObjectName(QStringLiteral("identityEdit"));
    m_identity->setMaxLength(maxIdentityLength);
    m_keyPassword->setPlaceholderText(tr("For encrypted private keys"));
    m_typed->setSingleShot(true);
    m_typed->setInterval(typingPauseMs);
    finish(m_method, buildFields());
    box()->setDeviceWarnings(
        OperationTargets::warnings(box()->targets(), OperationTargets::Need::Authorization));
    connect(m_method, &QComboBox::currentIndexChanged, this, &UploadIeeeDialog::onMethodChanged);
    connect(m_ca, &PathField::changed, this, [this] {
        clearComplaint();
        updateAccept();
    });
    connect(m_keyPassword, &QLineEdit::textChanged, this, [this] {
        m_typed->start();
        updateAccept();
    });
    connect(m_typed, &QTimer::timeout, this, [this] {
        box()->setPassPhrase(m_keyPassword->text());
        updateAccept();
    });
    onMethodChanged();
}

UploadIeeeDialog::~UploadIeeeDialog() = default;

QWidget *UploadIeeeDialog::buildFields() {
    auto *fields = new QWidget(body());
    m_method->setMinimumWidth(methodWidth);
    m_passwordPart = captioned(tr("Password"), m_password, fields);
    m_keyPasswordPart = captioned(tr("Private Key Password"), m_keyPassword, fields);
    auto *line = new QHBoxLayout;
    line->setSpacing(12);
    line->addWidget(captioned(tr("Method"), m_method, fields));
    line->addWidget(captioned(tr("Identity"), m_identity, fields), 1);
    line->addWidget(m_passwordPart, 1);
    line->addWidget(m_keyPasswordPart, 1);
    auto *layout = new QVBoxLayout(fields);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addLayout(line);
    layout->addWidget(m_ca);
    return fields;
}

UploadIeeeDialog::Method UploadIeeeDialog::methodOf(const QString &serviceType) {
    return serviceType == QLatin1String("deviceIEEE_EAP_TLS") ? Method::Tls : Method::Peap;
}

UploadIeeeDialog::Method UploadIeeeDialog::method() const {
    return static_cast<Method>(m_method->currentIndex());
}

void UploadIeeeDialog::setMethod(Method method) {
    m_method->setCurrentIndex(static_cast<int>(method));
}

void UploadIeeeDialog::onMethodChanged() {
    clearComplaint();
    const bool tls = method() == Method::Tls;
    m_passwordPart->setVisible(!tls);
    m_keyPasswordPart->setVisible(tls);
    box()->setNeeds(tls ? CertificateNeeds::PairWithPassphrase : CertificateNeeds::Nothing);
}

bool UploadIeeeDialog::isReading() const {
    return CertificateUploadDialog::isReading() || m_ca->isReading() || m_typed->isActive();
}

/// The authority's certificate is one file and bears no device's address.
void UploadIeeeDialog::takeDropped(const QStringList &paths, const QPoint &place) {
    const bool onField = m_ca->rect().contains(m_ca->mapFrom(this, place));
    if (method() == Method::Peap || onField)
        m_ca->take(paths.first());
    else
        CertificateUploadDialog::takeDropped(paths, place);
}

bool UploadIeeeDialog::areFieldsGood() {
    if (m_identity->text().trimmed().isEmpty())
        return complain(m_identity, tr("Type the identity that the devices log in with."));
    if (method() == Method::Peap && m_password->text().isEmpty())
        return complain(m_password, tr("Type the password that the devices log in with."));
    if (!m_ca->file())
        return complain(m_ca, tr("Choose the certificate of the authority."));
    return true;
}

std::function<bool(UploadTaskMgr &)> UploadIeeeDialog::insertion() {
    const bool isPeap = method() == Method::Peap;
    return [isPeap, mode = modes[static_cast<int>(method())], ca = m_ca->file(),
            identity = m_identity->text().trimmed(),
            password = isPeap ? m_password->text() : m_keyPassword->text(),
            order = box()->order()](UploadTaskMgr &queue) {
        return isPeap
                   ? queue.insertNewPeapTask(mode, ca->name, ca->path, identity, password, order.deviceIds())
                   : queue.insertNewTlsTask(mode, ca->name, ca->path, identity, password,
                                            order.certificates(), order.privateKeys(), order.deviceIds());
    };
}

void UploadIeeeDialog::accept() {
    box()->forgetPassPhrase();
    m_password->clear();
    m_keyPassword->clear();
    CertificateUploadDialog::accept();
}

namespace {

QDialog *openUploadIeee(OperationContext &context, OperationRequest request) {
    auto *dialog =
        new UploadIeeeDialog(std::move(request.targets), context.devices(), context.dialogParent());
    dialog->setMethod(UploadIeeeDialog::methodOf(request.taskType));
    QObject::connect(dialog, &UploadIeeeDialog::deviceChosen, context.dialogParent(),
                     [&context](const QString &id) { context.selectDevice(id, {}); });
    return dialog;
}

} // namespace

const Operation Operations::uploadIeee{.objectName = "uploadIeeeAction",
                                       .text = QT_TRANSLATE_NOOP("Operation", "IEEE 802.1x"),
                                       .group = Operation::Group::CertificateMenu,
                                       .needs = Operation::Needs::Selection,
                                       .taskTypes = {"deviceIEEE_EAP_PEAP", "deviceIEEE_EAP_TLS"},
                                       .helpPage = "certificates.html",
                                       .open = openUploadIeee};
