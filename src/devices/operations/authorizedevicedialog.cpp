#include "devices/operations/authorizedevicedialog.h"

#include "devices/operations/credentialfields.h"
#include "devices/operations/credentialrules.h"
#include "devices/operations/deviceactions.h"
#include "devices/operations/operations.h"
#include "devices/operations/targetsummary.h"
#include "platform/log/messagelog.h"
#include "widgets/controls/passwordedit.h"

#include <QComboBox>
#include <QLineEdit>

AuthorizeDeviceDialog::AuthorizeDeviceDialog(OperationTargets::List targets, QWidget *parent)
    : OperationDialog(tr("Authorize Device"), parent),
      m_name(CredentialFields::makeName(body())),
      m_password(CredentialFields::makePassword("passEdit", body())),
      m_nameWarning(addField(tr("Username"), m_name, "nameWarningLabel")),
      m_passwordWarning(addField(tr("Password"), m_password, "passWarningLabel")) {
    setObjectName(QStringLiteral("AuthorizeDeviceDialog"));
    finish(std::move(targets), OperationTargets::Need::Connection, tr("Apply"), "applyButton");
    setWarnings(accountWarnings());
    const auto clear = [](QLabel *line) { return [line] { CredentialFields::tell(line, {}); }; };
    connect(m_name, &QComboBox::editTextChanged, this, clear(m_nameWarning));
    connect(m_password, &QLineEdit::textChanged, this, clear(m_passwordWarning));
    m_password->setFocus();
}

QStringList AuthorizeDeviceDialog::deviceIds() const {
    return targets().tickedIds();
}

std::vector<TargetWarning> AuthorizeDeviceDialog::accountWarnings() const {
    return OperationTargets::withStatus(
        targets().targets(),
        {{DeviceStatusCode::AccountBlocked,
          [](int count) {
              return tr("%n device(s) will fail: their account is blocked for a while.", nullptr, count);
          },
          tr("Account blocked")},
         {DeviceStatusCode::InvalidPassword,
          [](int count) {
              return tr("%n device(s) refused the last password; another wrong one may block the account.",
                        nullptr, count);
          },
          tr("Invalid password")}});
}

void AuthorizeDeviceDialog::apply() {
    const QString name = m_name->currentText();
    const QString password = m_password->text();
    const bool nameGood = CredentialFields::tell(m_nameWarning, CredentialRules::nameProblem(name));
    const bool passwordGood =
        CredentialFields::tell(m_passwordWarning, CredentialRules::passwordProblem(password));
    if (!nameGood)
        return m_name->setFocus();
    if (!passwordGood)
        return m_password->setFocus();
    emit authDevices(name, password);
    accept();
}

namespace {

void onAuthDevices(DeviceActions *actions, const QStringList &ids, const QString &name,
                   const QString &password) {
    qDebug("onAuthDevices, username : %s, password: %s", qUtf8Printable(name),
           MessageLog::secret(password).constData());
    actions->authorize(ids, name, password);
}

QDialog *openAuthorize(OperationContext &context, OperationRequest request) {
    auto *dialog = new AuthorizeDeviceDialog(std::move(request.targets), context.dialogParent());
    QObject::connect(dialog, &AuthorizeDeviceDialog::authDevices, context.actions(),
                     [actions = context.actions(), dialog](const QString &name, const QString &password) {
                         onAuthDevices(actions, dialog->deviceIds(), name, password);
                     });
    return dialog;
}

} // namespace

const Operation Operations::authorize{.objectName = "authorizeButton",
                                      .text = QT_TRANSLATE_NOOP("Operation", "Authorize Device"),
                                      .icon = "tool_authorize_line",
                                      .group = Operation::Group::DeviceButtons,
                                      .needs = Operation::Needs::Selection,
                                      .helpPage = "authorizing.html",
                                      .open = openAuthorize};
