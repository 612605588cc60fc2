#include "app/remote/servicemanagement.h"

#include "api/session/servicerequest.h"
#include "app/remote/orbtexts.h"
#include "app/remote/servicemanagementaddservicedialog.h"
#include "app/remote/servicemanagementstatusdialog.h"
#include "widgets/dialogs/transientmessage.h"

struct ServiceManagement::Answer {
    unsigned result = ApiException;
    bool added = false;
    AccountPermission permission = AccountPermission::Unknown;
};

namespace {

unsigned askWhetherAdded(ServiceSession &session, bool &added) {
    return loggedResult("isOrbServiceAdded",
                        session.call([&](CApiClient &client) { return client.isOrbServiceAdded(added); }));
}

} // namespace

ServiceManagement::ServiceManagement(QWidget *frame) : QObject(frame) {}

QWidget *ServiceManagement::frame() const {
    return qobject_cast<QWidget *>(parent());
}

void ServiceManagement::validateOrbServiceAdded() {
    if (m_asking)
        return;
    if (m_dialog && (m_dialog->isVisible() || m_dialog->isChanging())) {
        if (!m_dialog->isVisible())
            m_dialog->comeBack();
        m_dialog->raise();
        return m_dialog->activateWindow();
    }
    m_asking = true;
    emit connectToOrbMessage(tr("connecting to ORB..."), QStringLiteral("loading"), 0, 0);
    const auto work = [](ServiceSession &session) {
        Answer answer;
        answer.result = askWhetherAdded(session, answer.added);
        const RequestGroup::Scope scope(session.requests());
        if (answer.result == ApiOk && session.login().thisComputer)
            answer.permission = permissionOnThisComputer(session.login().account);
        return answer;
    };
    const bool started = ServiceRequest::post(
        NetJob::createRunner("validateOrbServiceAdded in FramelessWindow", NetTask::Turn::Reading), this,
        work,
        [this](const Answer &answer) {
            finishAsking();
            onAnswer(answer);
        },
        [this](JobOutcome end) {
            // A session that is over has taken its state along; another one may have begun to ask.
            if (end == JobOutcome::Delivered || end == JobOutcome::SessionGone)
                return;
            finishAsking();
            showError(OrbTexts::unknownError());
        });
    if (!started)
        finishAsking();
}

void ServiceManagement::reset() {
    m_permission = AccountPermission::Unknown;
    if (m_dialog) {
        // It may be out of sight, waiting for a request that was cut.
        m_dialog->deleteLater();
        m_dialog = nullptr;
    }
    if (m_asking)
        finishAsking();
    emit serviceAdded(false);
}

void ServiceManagement::finishAsking() {
    m_asking = false;
    emit connectToOrbFinished();
}

void ServiceManagement::onAnswer(const Answer &answer) {
    if (answer.result != ApiOk)
        return showError(OrbTexts::failure(answer.result));
    emit serviceAdded(answer.added);
    m_permission = answer.permission;
    if (answer.added)
        openStatusDialog();
    else if (mayManageService(m_permission))
        openAddDialog();
    else
        showError(tr("Only an administrator can connect the service."));
}

void ServiceManagement::lookUp() {
    ServiceRequest::post(
        NetJob::createRunner("lookUp in ServiceManagement", NetTask::Turn::Beside), this,
        [](ServiceSession &session) {
            Answer answer;
            answer.result = askWhetherAdded(session, answer.added);
            return answer;
        },
        [this](const Answer &answer) {
            if (answer.result == ApiOk)
                emit serviceAdded(answer.added);
        });
}

void ServiceManagement::openAddDialog() {
    auto *dialog = new ServiceManagementAddServiceDialog(frame());
    connect(dialog, &QDialog::accepted, this, &ServiceManagement::openStatusDialog);
    open(dialog);
}

void ServiceManagement::openStatusDialog() {
    auto *dialog = new ServiceManagementStatusDialog(m_permission, frame());
    connect(dialog, &QDialog::accepted, this, &ServiceManagement::openAddDialog);
    open(dialog);
}

void ServiceManagement::open(ServiceDialog *dialog) {
    connect(dialog, &ServiceDialog::statusChanged, this, &ServiceManagement::serviceAdded);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    m_dialog = dialog;
    dialog->open();
}

void ServiceManagement::showError(const QString &text) {
    TransientMessage::show(frame(), text, TransientMessage::Kind::Error);
}
