#include "app/login/accountsetupdialog.h"

#include "api/client/apilocalclient.h"
#include "api/session/netjob.h"
#include "app/login/passwordrule.h"
#include "app/login/serverkeydialog.h"
#include "platform/log/messagelog.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "ui_accountsetupdialog.h"

#include <QDebug>

namespace {

unsigned newAccount(const QString &email, const QString &password, bool remember) {
    const quint32 port = CConfigStore().serverPort();
    qDebug("get local server port: %d", static_cast<int>(port));
    qDebug("create account: email: %s, pass: %s", qUtf8Printable(email),
           MessageLog::secret(password).constData());
    const unsigned result = CApiLocalClient(port).newMember(
        email.toUtf8().constData(), password.toUtf8().constData(), nullptr, "admin", nullptr);
    if (result != ApiOk) {
        qDebug("HTTP API(newMember) failed! res: %d", static_cast<int>(result));
        return result;
    }
    CClientStore &store = CClientStore::instance();
    store.setThisComputer(true);
    store.setLoginRememberMe(remember);
    store.setThisComputerAccount({{}, email, remember ? password : QString()});
    return result;
}

} // namespace

AccountSetupDialog::AccountSetupDialog(QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::AccountSetupDialog>(content())),
      m_warning(m_ui->msgWarningIcon, m_ui->msgWarningLabel),
      m_runner(new NetTask(NetTask::Turn::Beside)) {
    setObjectName(QStringLiteral("AccountSetupDialog"));
    setWindowTitle(tr("Account setup"));
    connect(m_ui->nextButton, &QPushButton::clicked, this, &AccountSetupDialog::onNext);
    m_ui->emailEdit->setFocus();
}

AccountSetupDialog::~AccountSetupDialog() = default;

void AccountSetupDialog::onNext() {
    const QString email = m_ui->emailEdit->text().trimmed();
    const QString password = m_ui->passEdit->text();
    const QString confirmation = m_ui->confirmEdit->text();
    if (email.isEmpty() || password.isEmpty() || confirmation.isEmpty())
        m_warning.setText(tr("The field can't be empty."));
    else if (password != confirmation)
        m_warning.setText(tr("Passwords do not match."));
    else if (!PasswordRule::accepts(password))
        m_warning.setText(tr("Password does not meet the requirements."));
    else
        createAccount(email, password, m_ui->rememberCheckBox->isChecked());
}

void AccountSetupDialog::createAccount(const QString &email, const QString &password, bool remember) {
    const bool started = NetJob::post(
        m_runner.get(), this, [email, password, remember] { return newAccount(email, password, remember); },
        [this](unsigned result) {
            if (result == ApiOk)
                emit accountCreated();
            else if (result == ApiEmailTaken)
                m_warning.setText(tr("This email is already taken."));
            else if (result == ApiKeyChanged)
                m_warning.setText(ServerKeyDialog::localKeyChangedText());
            else
                m_warning.setText(tr("Create account failed."));
        },
        [this](JobOutcome end) {
            setBusy(false);
            if (end != JobOutcome::Delivered)
                m_warning.setText(tr("Create account failed."));
        });
    if (!started)
        return;
    m_warning.setText({});
    setBusy(true);
}

void AccountSetupDialog::setBusy(bool busy) {
    m_ui->nextButton->setEnabled(!busy);
    m_ui->nextButton->setText(busy ? tr("Creating account...") : tr("Next"));
}
