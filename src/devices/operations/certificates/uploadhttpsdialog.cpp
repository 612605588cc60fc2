#include "devices/operations/certificates/uploadhttpsdialog.h"

#include "devices/operations/captioned.h"
#include "devices/operations/certificates/selfsignedfields.h"
#include "devices/operations/operations.h"
#include "tasks/queue/uploadtaskmgr.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QSpinBox>
#include <QVBoxLayout>

#include <nlohmann/json.hpp>

#include <iterator>

namespace {

constexpr int maxPort = 65535;
constexpr int defaultPort = 443;
constexpr int methodWidth = 300;
constexpr int modeWidth = 180;
constexpr int portWidth = 110;

constexpr const char *serviceTypes[] = {"deviceGenSelfSignedCert", "deviceHttpsCertInstall",
                                        "deviceHttpsCertsAndPKeys"};

/// How a device is reached once it has the certificate; the values of "mode".
const QString bothProtocols = QStringLiteral("http_https");
const QString httpsOnly = QStringLiteral("https");

CertificateNeeds needsOf(UploadHttpsDialog::Method method) {
    switch (method) {
    case UploadHttpsDialog::Method::Install:
        return CertificateNeeds::Certificate;
    case UploadHttpsDialog::Method::Pair:
        return CertificateNeeds::Pair;
    default:
        return CertificateNeeds::Nothing;
    }
}

} // namespace

UploadHttpsDialog::UploadHttpsDialog(OperationTargets::List targets, DeviceSnapshotPtr managed,
                                     QWidget *parent)
    : CertificateUploadDialog(tr("Upload Certificate – HTTPS"), std::move(targets), std::move(managed),
                              parent),
      m_method(new QComboBox(body())),
      m_mode(new QComboBox(body())),
      m_port(new QSpinBox(body())),
      m_selfSigned(new SelfSignedFields(body())) {
    setObjectName(QStringLiteral("UploadHttpsDialog"));
    m_method->setObjectName(QStringLiteral("methodComboBox"));
    m_method->addItems({tr("Generate self-signed certificates"), tr("Install certificates"),
                        tr("Upload certificates and private keys")});
    m_mode->setObjectName(QStringLiteral("modeComboBox"));
    m_mode->addItem(tr("HTTP and HTTPS"), bothProtocols);
    m_mode->addItem(tr("HTTPS only"), httpsOnly);
    m_port->setObjectName(QStringLiteral("portSpinBox"));
    m_port->setRange(1, maxPort);
    m_port->setValue(defaultPort);
    m_port->setMinimumWidth(portWidth);
    m_mode->setMinimumWidth(modeWidth);
    finish(m_method, buildFields());
    connect(m_method, &QComboBox::currentIndexChanged, this, &UploadHttpsDialog::onMethodChanged);
    connect(m_mode, &QComboBox::currentIndexChanged, this, &UploadHttpsDialog::showDeviceWarnings);
    connect(m_port, &QSpinBox::valueChanged, this, &UploadHttpsDialog::showDeviceWarnings);
    showDeviceWarnings();
    onMethodChanged();
}

QWidget *UploadHttpsDialog::buildFields() {
    auto *fields = new QWidget(body());
    auto *line = new QHBoxLayout;
    line->setSpacing(12);
    m_method->setMinimumWidth(methodWidth);
    line->addWidget(captioned(tr("Method"), m_method, fields));
    line->addWidget(captioned(tr("Mode"), m_mode, fields));
    line->addWidget(captioned(tr("HTTPS Port"), m_port, fields));
    line->addStretch();
    auto *layout = new QVBoxLayout(fields);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(8);
    layout->addLayout(line);
    layout->addWidget(m_selfSigned);
    return fields;
}

UploadHttpsDialog::Method UploadHttpsDialog::methodOf(const QString &serviceType) {
    for (std::size_t i = 0; i < std::size(serviceTypes); ++i) {
        if (serviceType == QLatin1String(serviceTypes[i]))
            return static_cast<Method>(i);
    }
    return Method::Generate;
}

UploadHttpsDialog::Method UploadHttpsDialog::method() const {
    return static_cast<Method>(m_method->currentIndex());
}

void UploadHttpsDialog::setMethod(Method method) {
    m_method->setCurrentIndex(static_cast<int>(method));
}

void UploadHttpsDialog::onMethodChanged() {
    clearComplaint();
    m_selfSigned->setVisible(method() == Method::Generate);
    box()->setNeeds(needsOf(method()));
}

/// A device cannot speak both protocols on one port.
void UploadHttpsDialog::showDeviceWarnings() {
    std::vector<TargetWarning> warnings =
        OperationTargets::warnings(box()->targets(), OperationTargets::Need::Authorization);
    TargetWarning clash{
        [](int count) { return tr("%n device(s) with HTTP on this port already.", nullptr, count); },
        tr("HTTP port"),
        {}};
    const auto port = static_cast<quint64>(m_port->value());
    const bool http = m_mode->currentData() == bothProtocols;
    for (std::size_t i = 0; http && i < box()->targets().size(); ++i) {
        if (box()->targets()[i].device->sortKey(DeviceColumn::HttpPort) == port)
            clash.targets.push_back(static_cast<int>(i));
    }
    if (!clash.targets.empty())
        warnings.push_back(std::move(clash));
    box()->setDeviceWarnings(std::move(warnings));
}

bool UploadHttpsDialog::areFieldsGood() {
    QWidget *wrong = nullptr;
    const QString problem = method() == Method::Generate ? m_selfSigned->problem(&wrong) : QString();
    return problem.isEmpty() || complain(wrong, problem);
}

std::function<bool(UploadTaskMgr &)> UploadHttpsDialog::insertion() {
    SelfSignedCert cert;
    cert.mode = m_mode->currentData().toString();
    cert.httpsPort = m_port->value();
    m_selfSigned->fill(cert);
    return [method = method(), cert, order = box()->order()](UploadTaskMgr &queue) {
        if (method == Method::Install)
            return queue.insertNewHttpsCertInstallTask(cert.mode, cert.httpsPort, order.certificates(),
                                                       order.deviceIds());
        if (method == Method::Pair)
            return queue.insertNewHttpsCertPKeysTask(cert.mode, cert.httpsPort, order.certificates(),
                                                     order.privateKeys(), order.deviceIds());
        return queue.insertNewHttpsSelfSignedCertTask(cert, order.deviceIds());
    };
}

namespace {

QDialog *openUploadHttps(OperationContext &context, OperationRequest request) {
    auto *dialog =
        new UploadHttpsDialog(std::move(request.targets), context.devices(), context.dialogParent());
    dialog->setMethod(UploadHttpsDialog::methodOf(request.taskType));
    QObject::connect(dialog, &UploadHttpsDialog::deviceChosen, context.dialogParent(),
                     [&context](const QString &id) { context.selectDevice(id, {}); });
    return dialog;
}

} // namespace

const Operation Operations::uploadHttps{
    .objectName = "uploadHttpsAction",
    .text = QT_TRANSLATE_NOOP("Operation", "HTTPS"),
    .group = Operation::Group::CertificateMenu,
    .needs = Operation::Needs::Selection,
    .taskTypes = {"deviceGenSelfSignedCert", "deviceHttpsCertInstall", "deviceHttpsCertsAndPKeys"},
    .helpPage = "certificates.html",
    .open = openUploadHttps};
