#include "app/remote/servicemanagementstatusdialog.h"

#include "api/client/orbservicestatus.h"
#include "api/session/servicerequest.h"
#include "app/remote/orbtexts.h"
#include "ui_servicemanagementstatusdialog.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"

struct ServiceManagementStatusDialog::Answer {
    unsigned result = ApiException;
    OrbServiceStatus status;
    bool wanted = false; ///< the remote access that was asked for
};

ServiceManagementStatusDialog::ServiceManagementStatusDialog(AccountPermission permission, QWidget *parent)
    : ServiceDialog(parent),
      m_ui(formIn<Ui::ServiceManagementStatusDialog>(content())),
      m_error(m_ui->errorMessageIcon, m_ui->errorMessage),
      m_mayChange(mayManageService(permission)) {
    setObjectName(QStringLiteral("ServiceManagementStatusDialog"));
    setWindowTitle(tr("Norvell Service Management"));
    connect(m_ui->remoteAccessSwitch, &QCheckBox::clicked, this,
            &ServiceManagementStatusDialog::enableRemoteAccess);
    connect(m_ui->disconnectButton, &QPushButton::clicked, this,
            &ServiceManagementStatusDialog::displayServiceDisconnectDialog);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    readStatus();
}

ServiceManagementStatusDialog::~ServiceManagementStatusDialog() = default;

/// Every request of the dialog goes this way: one at a time, and an end in any case.
void ServiceManagementStatusDialog::run(const char *purpose, Request request,
                                        void (ServiceManagementStatusDialog::*handle)(const Answer &)) {
    setBusy(true);
    m_error.setText({});
    const auto finish = [this, handle](const Answer &answer) {
        endChange();
        setBusy(false);
        (this->*handle)(answer);
    };
    const bool started = ServiceRequest::post(
        NetJob::createRunner(purpose), this, std::move(request),
        [finish](const Answer &answer) { finish(answer); },
        [finish](JobOutcome end) {
            // With its session the dialog goes as well, and nobody is to be told.
            if (end != JobOutcome::Delivered && end != JobOutcome::SessionGone)
                finish({});
        });
    if (!started)
        finish({});
}

void ServiceManagementStatusDialog::readStatus() {
    m_ui->linkStateLabel->setText(tr("Reading the status..."));
    run(
        "getOrbServiceCachedStatus in ServiceManagementStatusDialog",
        [](ServiceSession &session) {
            Answer answer;
            answer.result = loggedResult("getOrbServiceCachedStatus", session.call([&](CApiClient &client) {
                return client.getOrbServiceCachedStatus(answer.status);
            }));
            return answer;
        },
        &ServiceManagementStatusDialog::showStatus);
}

void ServiceManagementStatusDialog::showStatus(const Answer &answer) {
    m_known = answer.result == ApiOk;
    if (!m_known) {
        m_ui->linkStateLabel->setText(tr("The status is not known."));
        m_error.setText(OrbTexts::failure(answer.result));
        return setBusy(false);
    }
    const bool connected = answer.status.connected;
    m_ui->linkPicture->setState(connected ? ConnectionDiagram::State::Connected
                                          : ConnectionDiagram::State::Interrupted);
    m_ui->linkStateLabel->setText(connected ? tr("Connected") : tr("Not connected at the moment"));
    m_allowed = answer.status.remoteAccess;
    if (!m_mayChange)
        m_error.setText(tr("Only an administrator can change this."));
    setBusy(false);
}

void ServiceManagementStatusDialog::enableRemoteAccess(bool on) {
    if (m_busy)
        return;
    beginChange(tr("Set Remote Access..."));
    run(
        "toggleRemoteAcess in ServiceManagementStatusDialog",
        [on](ServiceSession &session) {
            Answer answer;
            answer.wanted = on;
            answer.result = loggedResult("toggleRemoteAccess", session.call([&](CApiClient &client) {
                return client.toggleRemoteAccess(on, answer.status.remoteAccess);
            }));
            return answer;
        },
        &ServiceManagementStatusDialog::onToggled);
}

void ServiceManagementStatusDialog::onToggled(const Answer &answer) {
    switch (answer.result) {
    case ApiOk:
        m_allowed = answer.status.remoteAccess;
        if (m_allowed == answer.wanted)
            tell(tr("Set remote access successfully!"), TransientMessage::Kind::Success);
        else
            showNotSet();
        break;
    case ApiServerError:
    case ApiCode108:
        showNotSet();
        break;
    default:
        fail(OrbTexts::failure(answer.result));
    }
    // The switch shows what holds, also after an attempt that did not succeed.
    m_ui->remoteAccessSwitch->setChecked(m_allowed);
    m_ui->remoteAccessSwitch->setFocus();
}

void ServiceManagementStatusDialog::showNotSet() {
    tell(tr("Failed to set remote access."), TransientMessage::Kind::Error);
}

void ServiceManagementStatusDialog::fail(const QString &text) {
    isClosed() ? tell(text, TransientMessage::Kind::Error) : m_error.setText(text);
}

void ServiceManagementStatusDialog::displayServiceDisconnectDialog(bool) {
    if (m_busy)
        return;
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::UnlinkService, this);
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, &ServiceManagementStatusDialog::disconnectService);
    confirm->open();
}

void ServiceManagementStatusDialog::disconnectService() {
    if (m_busy)
        return;
    beginChange(tr("Disconnecting..."));
    run(
        "disconnectService in ServiceManagementStatusDialog",
        [](ServiceSession &session) {
            Answer answer;
            answer.result =
                loggedResult("disconnectOrbService",
                             session.call([](CApiClient &client) { return client.disconnectOrbService(); }));
            return answer;
        },
        &ServiceManagementStatusDialog::onDisconnected);
}

void ServiceManagementStatusDialog::onDisconnected(const Answer &answer) {
    if (answer.result != ApiOk)
        return fail(OrbTexts::failure(answer.result));
    TransientMessage::show(parentWidget() ? parentWidget() : this, tr("Disconnected successfully!"),
                           TransientMessage::Kind::Success);
    emit statusChanged(false);
    if (!isClosed())
        accept();
}

void ServiceManagementStatusDialog::setBusy(bool busy) {
    m_busy = busy;
    m_ui->remoteAccessSwitch->setEnabled(!busy && m_known && m_mayChange);
    m_ui->disconnectButton->setEnabled(!busy && m_mayChange);
    if (!busy)
        m_ui->remoteAccessSwitch->setChecked(m_allowed);
}
