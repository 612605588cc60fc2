#pragma once

#include "api/session/requestgroup.h"

#include <QObject>

/// Finds out what the user has to see first when nobody is logged in: asks the local service, where there is
/// one, whether it answers and whether it has an account yet.
class StartCheck : public QObject {
    Q_OBJECT

public:
    explicit StartCheck(QObject *parent = nullptr);

    /// Starts the check; one that is under way is not doubled. accountSetupNeeded or loginNeeded tells its
    /// end. It waits for no other request.
    void start();
    bool isRunning() const { return m_running; }
    /// Ends the check under way, if there is one, without an outcome.
    void abandon();

signals:
    void runningChanged(bool running);
    /// The local service has only the account it came with.
    void accountSetupNeeded();
    /// Somebody has to log in; the tip says why this computer's service is not to be had. It is empty where
    /// the service answers, and where the check could not be carried out.
    void loginNeeded(const QString &tip);
    /// The local service shows another key than the remembered one; nothing was sent to it.
    void keyChanged(const QString &fingerprint);

private:
    void setRunning(bool running);
    void askService();
    void emitUnchecked();

    bool m_running = false;
    RequestGroup m_requests; ///< of the latest check; cut when that one was abandoned
};
