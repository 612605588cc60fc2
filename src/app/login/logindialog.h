#pragma once

#include "api/session/nettask.h"
#include "api/session/requestgroup.h"
#include "app/login/serveraddress.h"
#include "platform/json.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

namespace Ui {
class LoginDialog;
}

/// Logs in to the service on this computer or on a remote server.
class LoginDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// tip: what to tell first, or empty.
    explicit LoginDialog(const QString &tip, QWidget *parent = nullptr);
    ~LoginDialog() override;

    /// Chooses a server of the saved list.
    void chooseServer(const QString &serverId);

signals:
    /// The session is in the local store.
    void loginSuccess();
    void loginFail(const QString &reason);
    /// After the first login to a server, as ServerKeys names it: its key is remembered from now on.
    void serverKeyKept(const QString &server);
    /// The session began, but what was entered could not be kept for the next login.
    void notRemembered();

public slots:
    void on_loginButton_clicked();
    void on_remoteComboBox_currentIndexChanged(int index);
    /// The saved list has changed.
    void onUpdateSvr();

private:
    struct Credentials;
    struct Outcome;

    void offerKnownAccounts();
    void showServer(const QString &text);
    void fillFrom(int index);
    JSON shownServer() const;
    void refill(const JSON &before, const JSON &server);
    void showChosenFields();
    void startLogin(const Credentials &credentials);
    void onOutcome(const Credentials &credentials, const Outcome &outcome);
    void askAboutKey(const Credentials &credentials, const Outcome &outcome);
    void setBusy(bool busy);
    void manageServers();

    static QString unusableKeyText();
    static Outcome logIn(const Credentials &credentials, const QString &address,
                         const RequestGroup &requests);
    static bool remember(const Credentials &credentials);

    std::unique_ptr<Ui::LoginDialog> m_ui;
    WarningLine m_tip;
    NetTask::Owner m_runner;
    std::unique_ptr<JSON> m_servers;
    RequestGroup m_requests; ///< cut when the dialog goes: nobody waits for its login any more
};
