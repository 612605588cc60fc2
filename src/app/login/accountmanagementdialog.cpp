#include "app/login/accountmanagementdialog.h"

#include "api/client/apilocalclient.h"
#include "api/session/netjob.h"
#include "app/login/passwordrule.h"
#include "app/login/serverkeydialog.h"
#include "platform/log/messagelog.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "ui_accountmanagementdialog.h"

#include <QDebug>

struct AccountManagementDialog::Change {
    QString email;
    QString oldPassword;
    QString newPassword;
    bool remember = false;
};

AccountManagementDialog::AccountManagementDialog(QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::AccountManagementDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel),
      m_runner(new NetTask) {
    setObjectName(QStringLiteral("AccountManagementDialog"));
    setWindowTitle(tr("Account management"));
    connect(m_ui->applyButton, &QPushButton::clicked, this, &AccountManagementDialog::onApply);
    connect(m_ui->cancelButton, &QPushButton::clicked, this, &QDialog::reject);
    offerKnownAccount();
}

AccountManagementDialog::~AccountManagementDialog() = default;

void AccountManagementDialog::offerKnownAccount() {
    const CClientStore &store = CClientStore::instance();
    const AccountInfo account = store.thisComputerAccount();
    qDebug("this computer acc: %s, pass: %s", qUtf8Printable(account.email),
           MessageLog::secret(account.password).constData());
    const bool remember = store.isLoginRememberMe();
    m_ui->emailEdit->setText(account.email);
    m_ui->oldPassEdit->setText(remember ? account.password : QString());
    m_ui->rememberCheckBox->setChecked(remember);
    for (QLineEdit *edit : {m_ui->emailEdit, static_cast<QLineEdit *>(m_ui->oldPassEdit),
                            static_cast<QLineEdit *>(m_ui->newPassEdit)}) {
        if (edit->text().isEmpty())
            return edit->setFocus();
    }
}

void AccountManagementDialog::onApply() {
    const Change change{m_ui->emailEdit->text().trimmed(), m_ui->oldPassEdit->text(),
                        m_ui->newPassEdit->text(), m_ui->rememberCheckBox->isChecked()};
    const QString confirmation = m_ui->confirmEdit->text();
    if (change.email.isEmpty() || change.oldPassword.isEmpty() || change.newPassword.isEmpty() ||
        confirmation.isEmpty())
        m_warning.setText(tr("The field can't be empty."));
    else if (change.newPassword != confirmation)
        m_warning.setText(tr("Passwords do not match."));
    else if (!PasswordRule::accepts(change.newPassword))
        m_warning.setText(tr("Password does not meet the requirements."));
    else
        startChange(change);
}

void AccountManagementDialog::startChange(const Change &change) {
    const bool started = NetJob::post(
        m_runner.get(), this, [change] { return apply(change); },
        [this](unsigned result) {
            if (result == ApiOk)
                accept();
            else if (result == ApiKeyChanged)
                m_warning.setText(ServerKeyDialog::localKeyChangedText());
            else
                m_warning.setText(tr("Change password failed."));
        },
        [this](JobOutcome end) {
            setBusy(false);
            if (end == JobOutcome::Delivered)
                return;
            qDebug("account management change password failed!");
            m_warning.setText(tr("Change password failed."));
        });
    if (!started)
        return;
    m_warning.setText({});
    setBusy(true);
}

/// Everything that belongs to a change is done here, so that it is whole even when the dialog was closed.
unsigned AccountManagementDialog::apply(const Change &change) {
    const quint32 port = CConfigStore().serverPort();
    qDebug("get local server port: %d", static_cast<int>(port));
    const unsigned result = CApiLocalClient(port).reviseMemberPassword(
        change.email.toUtf8().constData(), change.oldPassword.toUtf8().constData(),
        change.newPassword.toUtf8().constData());
    if (result != ApiOk) {
        qDebug("account management change password failed!");
        return result;
    }
    qDebug("account management change password successfully!");
    CClientStore &store = CClientStore::instance();
    store.setLoginRememberMe(change.remember);
    store.setThisComputerAccount({{}, change.email, change.remember ? change.newPassword : QString()});
    return result;
}

void AccountManagementDialog::setBusy(bool busy) {
    m_ui->applyButton->setEnabled(!busy);
    m_ui->applyButton->setText(busy ? tr("Changing password...") : tr("Apply"));
}
