#include "app/login/logindialog.h"

#include "api/client/apiclient.h"
#include "api/session/netjob.h"
#include "app/login/remoteconnectiondialog.h"
#include "app/login/serverkeydialog.h"
#include "platform/crypto/ciphers.h"
#include "platform/files/apppaths.h"
#include "platform/log/messagelog.h"
#include "store/clientstore.h"
#include "store/configstore.h"
#include "store/localstore.h"
#include "store/serverkeys.h"
#include "ui_logindialog.h"

#include <QDebug>
#include <QLineEdit>

#include <nlohmann/json.hpp>

/// What the fields say; everything after reading them happens on the runner.
struct LoginDialog::Credentials {
    bool thisComputer = false;
    QString serverText;
    ServerAddress server;
    QString account;
    QString password;

    /// Under which the server's key is remembered.
    QString keyName() const { return thisComputer ? ServerKeys::thisComputer : server.keyName(); }
};

struct LoginDialog::Outcome {
    unsigned result = ApiException;
    QString address;
    quint32 port = 0;
    QString account;
    QByteArray token;      ///< in cipher form
    std::string serverKey; ///< fingerprint that the server has shown
    bool isKeyNew = false; ///< it was not remembered before
    bool thisComputer = false;
    bool remembered = true;
};

namespace {

QString offeredPassword(const JSON &server) {
    return stringMember(server, "remember") == QLatin1String("YES") ? stringMember(server, "pass")
                                                                    : QString();
}

} // namespace

QString LoginDialog::unusableKeyText() {
    return tr("The key file %1 cannot be used. Correct or remove it, then try again.")
        .arg(AppPaths::keyFile());
}

LoginDialog::LoginDialog(const QString &tip, QWidget *parent)
    : FramelessDialog(parent),
      m_ui(formIn<Ui::LoginDialog>(content())),
      m_tip(m_ui->msgWarningIcon, m_ui->tipLabel),
      m_runner(new NetTask(NetTask::Turn::Beside)),
      m_servers(std::make_unique<JSON>(JSON::array())) {
    setObjectName(QStringLiteral("LoginDialog"));
    setWindowTitle(tr("Login"));
    m_ui->remoteComboBox->lineEdit()->setPlaceholderText(tr("IP:Port/Domain Name"));
    // The style's own check for a completion would replace what the user types.
    m_ui->remoteComboBox->setCompleter(nullptr);
    connect(m_ui->loginButton, &QPushButton::clicked, this, &LoginDialog::on_loginButton_clicked);
    connect(m_ui->remoteComboBox, &QComboBox::currentIndexChanged, this,
            &LoginDialog::on_remoteComboBox_currentIndexChanged);
    // An entry that is the current one already changes no index when it is chosen.
    connect(m_ui->remoteComboBox, &QComboBox::activated, this, &LoginDialog::fillFrom);
    connect(m_ui->localRadio, &QRadioButton::toggled, this, &LoginDialog::showChosenFields);
    connect(m_ui->manageServersButton, &QToolButton::clicked, this, &LoginDialog::manageServers);
    connect(this, &LoginDialog::loginFail, this, [this](const QString &reason) { m_tip.setText(reason); });
    onUpdateSvr();
    offerKnownAccounts();
    m_tip.setText(Ciphers::genericToken() ? tip : unusableKeyText());
}

LoginDialog::~LoginDialog() {
    m_requests.cut();
}

void LoginDialog::offerKnownAccounts() {
    const CClientStore &store = CClientStore::instance();
    const AccountInfo local = store.thisComputerAccount();
    m_ui->localEmailEdit->setText(local.email);
    m_ui->localPassEdit->setText(local.password);
    const AccountInfo remote = store.remoteComputerAccount();
    if (!remote.server.isEmpty()) {
        showServer(remote.server);
        m_ui->remoteEmailEdit->setText(remote.email);
        m_ui->remotePassEdit->setText(remote.password);
    }
    const bool installed = CLocalStore::instance().isLocalServiceInstalled();
    const bool remoteBefore = !store.isThisComputer() && !remote.server.isEmpty();
    m_ui->localRadio->setEnabled(installed);
    (installed && !remoteBefore ? m_ui->localRadio : m_ui->remoteRadio)->setChecked(true);
    showChosenFields();
}

void LoginDialog::showChosenFields() {
    const bool local = m_ui->localRadio->isChecked();
    m_ui->localFields->setVisible(local);
    m_ui->remoteFields->setVisible(!local);
    QLineEdit *email = local ? m_ui->localEmailEdit : m_ui->remoteEmailEdit;
    QLineEdit *password = local ? m_ui->localPassEdit : m_ui->remotePassEdit;
    if (!local && m_ui->remoteComboBox->currentText().isEmpty())
        m_ui->remoteComboBox->setFocus();
    else
        (email->text().isEmpty() ? email : password)->setFocus();
}

void LoginDialog::chooseServer(const QString &serverId) {
    m_ui->remoteRadio->setChecked(true);
    // The server may be shown already, with the account of the last login.
    showServer({});
    for (std::size_t i = 0; i < m_servers->size(); ++i) {
        if (stringMember((*m_servers)[i], "id") == serverId)
            m_ui->remoteComboBox->setCurrentIndex(static_cast<int>(i));
    }
    showChosenFields();
}

void LoginDialog::on_loginButton_clicked() {
    Credentials credentials;
    credentials.thisComputer = m_ui->localRadio->isChecked();
    credentials.account =
        (credentials.thisComputer ? m_ui->localEmailEdit : m_ui->remoteEmailEdit)->text().trimmed();
    credentials.password = (credentials.thisComputer ? m_ui->localPassEdit : m_ui->remotePassEdit)->text();
    if (credentials.account.isEmpty() || credentials.password.isEmpty()) {
        m_tip.setText(tr("The field can't be empty."));
        return;
    }
    if (!credentials.thisComputer) {
        credentials.serverText = m_ui->remoteComboBox->currentText().trimmed();
        const std::optional<ServerAddress> server = ServerAddress::parse(credentials.serverText);
        if (!server) {
            m_tip.setText(
                credentials.serverText.isEmpty()
                    ? tr("The field can't be empty.")
                    : tr("Enter the server as an address or a name, with a port from 1 to 65535 behind a "
                         "colon where it is not %1.")
                          .arg(ServerAddress::defaultPort));
            return;
        }
        credentials.server = *server;
        qDebug("parse ip: %s, port: %d", qUtf8Printable(server->host), server->port);
    }
    startLogin(credentials);
}

void LoginDialog::startLogin(const Credentials &credentials) {
    auto address = std::make_shared<QString>(QStringLiteral("127.0.0.1"));
    NetTask::Preparation lookUp;
    if (!credentials.thisComputer)
        lookUp = [address, server = credentials.server] { *address = server.resolved(); };
    const bool started = NetJob::post(
        m_runner.get(), this,
        [credentials, address, requests = m_requests] { return logIn(credentials, *address, requests); },
        [this, credentials](const Outcome &outcome) { onOutcome(credentials, outcome); },
        [this](JobOutcome end) {
            setBusy(false);
            if (end != JobOutcome::Delivered)
                emit loginFail(tr("The login could not be carried out. Try again."));
        },
        lookUp);
    if (!started)
        return;
    m_tip.setText({});
    setBusy(true);
}

LoginDialog::Outcome LoginDialog::logIn(const Credentials &credentials, const QString &address,
                                        const RequestGroup &requests) {
    Outcome outcome;
    outcome.address = address;
    outcome.port = credentials.server.port;
    outcome.account = credentials.account;
    outcome.thisComputer = credentials.thisComputer;
    if (credentials.thisComputer) {
        outcome.port = CConfigStore().serverPort();
        qDebug("get local server port: %d", static_cast<int>(outcome.port));
        qDebug("login local server! acc: %s, pass: %s", qUtf8Printable(credentials.account),
               MessageLog::secret(credentials.password).constData());
    } else {
        qDebug("login remote server: %s:%d! acc: %s, pass: %s", qUtf8Printable(address),
               static_cast<int>(outcome.port), qUtf8Printable(credentials.account),
               MessageLog::secret(credentials.password).constData());
    }
    CApiClient client(address.toUtf8().constData(), outcome.port);
    client.expectServerKey(ServerKeys::instance().fingerprint(credentials.keyName()));
    {
        const RequestGroup::Scope scope(requests);
        outcome.result = client.loginServer(credentials.account.toUtf8().constData(),
                                            credentials.password.toUtf8().constData());
    }
    outcome.serverKey = client.serverKey();
    if (outcome.result != ApiOk || client.accessToken().empty())
        return outcome;
    client.expectServerKey(outcome.serverKey);
    if (requests.isCut()) {
        // Nobody waits for this session any more, and the service counts it.
        client.logoutServer(client.accessToken().c_str());
        return outcome;
    }
    outcome.token = CLocalStore::instance().access();
    outcome.isKeyNew = ServerKeys::instance().keep(credentials.keyName(), outcome.serverKey);
    outcome.remembered = remember(credentials);
    return outcome;
}

/// Keeps for the next login what this one has shown to be right. False when not all of it could be written.
bool LoginDialog::remember(const Credentials &credentials) {
    CClientStore &store = CClientStore::instance();
    const bool kept = store.setThisComputer(credentials.thisComputer);
    const AccountInfo account{credentials.serverText, credentials.account,
                              store.isLoginRememberMe() ? credentials.password : QString()};
    return (credentials.thisComputer ? store.setThisComputerAccount(account)
                                     : store.setRemoteComputerAccount(account)) &&
           kept;
}

void LoginDialog::onOutcome(const Credentials &credentials, const Outcome &outcome) {
    if (outcome.result == ApiKeyChanged)
        askAboutKey(credentials, outcome);
    if (outcome.result == ApiOk && outcome.token.isEmpty()) {
        emit loginFail(tr("The server did not open a session. Try again."));
        return;
    }
    if (outcome.result != ApiOk) {
        qDebug("login failed! res: %d", static_cast<int>(outcome.result));
        emit loginFail(outcome.result == ApiCode108         ? tr("Server full.")
                       : outcome.result == ApiCipherFailure ? unusableKeyText()
                       : outcome.result == ApiKeyChanged
                           ? tr("The server shows another key than before. Nothing was sent to it.")
                           : tr("Incorrect email or password. Try again."));
        return;
    }
    CLocalStore::instance().setLoginInfo(outcome.address, outcome.port, outcome.account, outcome.token,
                                         outcome.thisComputer);
    qDebug("login successfully! ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(outcome.address),
           static_cast<int>(outcome.port), qUtf8Printable(outcome.account),
           MessageLog::secret(outcome.token).constData());
    CLocalStore::instance().setServerKey(credentials.keyName(), outcome.serverKey);
    emit loginSuccess();
    if (outcome.isKeyNew)
        emit serverKeyKept(credentials.keyName());
    if (!outcome.remembered)
        emit notRemembered();
}

void LoginDialog::askAboutKey(const Credentials &credentials, const Outcome &outcome) {
    const QString server = credentials.keyName();
    const ServerKey remembered = ServerKeys::instance().find(server).value_or(ServerKey());
    auto *dialog = new ServerKeyDialog(server, remembered, QString::fromStdString(outcome.serverKey), this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &QDialog::accepted, this, [this, credentials, server, key = outcome.serverKey] {
        ServerKeys::instance().trust(server, key);
        startLogin(credentials);
    });
    dialog->open();
}

void LoginDialog::setBusy(bool busy) {
    m_ui->loginButton->setEnabled(!busy);
    m_ui->loginButton->setText(busy ? tr("Logging in...") : tr("Log in"));
}

void LoginDialog::onUpdateSvr() {
    const QString typed = m_ui->remoteComboBox->currentText();
    const JSON before = shownServer();
    CClientStore::instance().loadServerList(*m_servers);
    const QSignalBlocker blocker(m_ui->remoteComboBox);
    m_ui->remoteComboBox->clear();
    for (const JSON &server : *m_servers)
        m_ui->remoteComboBox->addItem(stringMember(server, "info"));
    showServer(typed);
    for (const JSON &server : *m_servers) {
        if (before.is_object() && stringMember(server, "id") == stringMember(before, "id"))
            refill(before, server);
    }
}

/// The saved server whose text the combo box shows, or null.
JSON LoginDialog::shownServer() const {
    const int index = m_ui->remoteComboBox->currentIndex();
    if (index < 0 || static_cast<std::size_t>(index) >= m_servers->size())
        return {};
    const JSON &server = (*m_servers)[static_cast<std::size_t>(index)];
    return stringMember(server, "info") == m_ui->remoteComboBox->currentText() ? server : JSON();
}

/// The server that is shown was edited: what the user has typed stays, the rest follows.
void LoginDialog::refill(const JSON &before, const JSON &server) {
    const auto changed = [&](const char *member) {
        return stringMember(before, member) != stringMember(server, member);
    };
    if (changed("info"))
        showServer(stringMember(server, "info"));
    if (!changed("acc") && !changed("pass") && !changed("remember"))
        return;
    if (!m_ui->remoteEmailEdit->isModified())
        m_ui->remoteEmailEdit->setText(stringMember(server, "acc"));
    if (!m_ui->remotePassEdit->isModified())
        m_ui->remotePassEdit->setText(offeredPassword(server));
}

/// Leaves the other fields as they are. An entry of that very text becomes the current one: the combo box
/// would choose it by itself as soon as the field is left, and the fields would be filled from it.
void LoginDialog::showServer(const QString &text) {
    const QSignalBlocker blocker(m_ui->remoteComboBox);
    m_ui->remoteComboBox->setCurrentIndex(
        m_ui->remoteComboBox->findText(text, Qt::MatchExactly | Qt::MatchCaseSensitive));
    m_ui->remoteComboBox->setEditText(text);
}

void LoginDialog::on_remoteComboBox_currentIndexChanged(int index) {
    qDebug("LoginDialog::on_remoteComboBox_currentIndexChanged");
    fillFrom(index);
}

void LoginDialog::fillFrom(int index) {
    if (index < 0 || static_cast<std::size_t>(index) >= m_servers->size())
        return;
    const JSON &server = (*m_servers)[static_cast<std::size_t>(index)];
    m_ui->remoteEmailEdit->setText(stringMember(server, "acc"));
    m_ui->remotePassEdit->setText(offeredPassword(server));
}

void LoginDialog::manageServers() {
    auto *dialog = new RemoteConnectionDialog(this);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(dialog, &RemoteConnectionDialog::updateSvr, this, &LoginDialog::onUpdateSvr);
    dialog->open();
}
